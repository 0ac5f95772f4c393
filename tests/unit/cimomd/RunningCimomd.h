#pragma once

// The real program as a child, on a socket or on a descriptor, and what a test says to it.

#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

/// A connected stream socket; closed at the end.
class Connection {
  public:
    explicit Connection(int connectedDescriptor) : descriptor(connectedDescriptor) {}
    /// Connects to a Unix socket; isOpen() tells whether that worked.
    explicit Connection(const std::string& socketPath);
    ~Connection() { close(); }
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    bool isOpen() const { return descriptor >= 0; }
    void send(std::string_view bytes) const;
    /// Everything until the peer closes, at most for ten seconds.
    std::string readToEnd() const;
    /// One HTTP answer: up to the end of its chunks, or of its Content-Length.
    std::string readAnswer() const;
    /// What comes next, at most for ten seconds.
    std::string readSome() const { return readMore(); }
    /// Whether reading finds the end at once: tells a closed connection from a silent one.
    bool peerHasClosed() const;
    void close();

  private:
    std::string readMore() const;

    int descriptor;
};

/// Started with `arguments`; killed at the end if it still runs.
class RunningCimomd {
  public:
    /// What becomes of a descriptor that the child inherits: it keeps its number, or it is handed
    /// over as a service manager does it.
    enum class Handover { SameNumber, Activation };

    /// `inherited` stays open in the child; -1 for none.
    explicit RunningCimomd(const std::vector<std::string>& arguments, int inherited = -1,
                           Handover handover = Handover::SameNumber);
    ~RunningCimomd();
    RunningCimomd(const RunningCimomd&) = delete;
    RunningCimomd& operator=(const RunningCimomd&) = delete;

    void signal(int number) const;
    /// The exit status, 128 + signal when killed; waits at most ten seconds, then -1.
    int wait();
    /// Waits until the socket takes connections; false after ten seconds or when the child ends.
    bool serves(const std::string& socketPath);

  private:
    bool hasEnded();

    int child = -1;
    int status = 0;
    bool ended = false;
};

/// A POST of `body` with the headers every CIM client sends and `moreHeaders` (each with CR LF).
std::string postOf(std::string_view body, std::string_view moreHeaders = "");

}  // namespace cimomd
