#pragma once

// Runs a program to its end and captures what it wrote.

#include <chrono>
#include <map>
#include <string>
#include <vector>

namespace support {

struct ProgramResult {
    int exitStatus = -1;    // -1 when it was ended by a signal
    int signal = 0;         // the signal that ended it, or 0
    bool timedOut = false;  // it was killed at the time limit
    std::string out;
    std::string err;
};

// The program sees exactly the given environment and an empty standard input. A program without a
// slash is not looked up in PATH. Killed with SIGKILL at the time limit. Throws std::runtime_error
// when it cannot be started.
ProgramResult runProgram(const std::string& program, const std::vector<std::string>& arguments,
                         const std::map<std::string, std::string>& environment,
                         std::chrono::milliseconds timeLimit = std::chrono::seconds(60));

}  // namespace support
