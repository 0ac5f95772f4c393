#pragma once

// A listening Unix domain socket under a path.

#include <sys/types.h>

#include <string>

namespace cimomd {

/// Owns the name in the file system: removes it at its end, unless something else has it by then.
class UnixListener {
  public:
    /// Listens under `socketPath` with mode 0600. A socket that nobody answers at any more is
    /// replaced. Raises std::runtime_error when the path is too long, is taken by something that
    /// is no socket or by a server that answers, or cannot be made.
    explicit UnixListener(std::string socketPath);
    ~UnixListener();
    UnixListener(const UnixListener&) = delete;
    UnixListener& operator=(const UnixListener&) = delete;

    /// Hands the listening socket over to the caller, who closes it.
    int release();

  private:
    std::string path;
    int descriptor = -1;
    dev_t device = 0;
    ino_t inode = 0;
};

}  // namespace cimomd
