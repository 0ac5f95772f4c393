#pragma once

// A program that runs while the test looks at what it has written so far, and that can be killed.

#include <sys/types.h>

#include <chrono>
#include <map>
#include <string>

class BackgroundProgram {
  public:
    /// Starts the program with one argument and exactly this environment; its output goes to a
    /// pipe. Throws std::runtime_error when it cannot be started.
    BackgroundProgram(const std::string& program, const std::string& argument,
                      const std::map<std::string, std::string>& environment);
    /// Kills the program if it still runs.
    ~BackgroundProgram();
    BackgroundProgram(const BackgroundProgram&) = delete;
    BackgroundProgram& operator=(const BackgroundProgram&) = delete;

    /// Reads until the output so far equals the text, the program ends or the time is over; gives
    /// the output so far.
    std::string readUntil(const std::string& text, std::chrono::milliseconds limit);

    /// Ends the program with SIGKILL and waits for its end.
    void kill();

  private:
    pid_t process = -1;
    int output = -1;
    std::string seen;
};
