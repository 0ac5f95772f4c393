// A server program that lives as long as the connection to it.

#pragma once

#include <sys/types.h>

#include <string>

#include "client/Deadline.h"
#include "client/FileDescriptor.h"

namespace Pegasus {

class ChildProcess {
  public:
    /// Runs `program --fd 3`. The child has `connection` as its descriptor 3, /dev/null as 0 to 2
    /// and nothing else of this process: no other descriptor, no environment beside a PATH, no
    /// blocked or ignored signal. Throws CannotConnectException when the program cannot be run and
    /// ConnectionTimeoutException when that is not known at the deadline.
    ChildProcess(const std::string& program, FileDescriptor connection, const Deadline& deadline);

    /// Waits a moment for the child to end, which it does when its connection is closed; then ends
    /// it by SIGTERM, at last by SIGKILL. It is never left as a zombie.
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    pid_t id() const { return id_; }

  private:
    bool endsWithin(int milliseconds) const;

    pid_t id_ = -1;
};

}  // namespace Pegasus
