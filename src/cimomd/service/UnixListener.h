#pragma once

// A listening Unix domain socket under a path.

#include <sys/types.h>

#include <optional>
#include <string>

struct sockaddr_un;

namespace cimomd {

/// Who may connect to a Unix socket: those who may write to its file.
struct SocketAccess {
    mode_t mode = 0600;
    /// Nothing leaves the group of the process.
    std::optional<gid_t> group;
};

/// Owns the name in the file system: removes it at its end, unless something else has it by then.
class UnixListener {
  public:
    /// Listens under `socketPath`. A socket that nobody answers at any more is replaced. Raises
    /// std::runtime_error when the path is too long, is taken by something that is no socket or by
    /// a server that answers, cannot be made or given to the group, or when something else takes
    /// its place meanwhile: that is left as it is.
    explicit UnixListener(std::string socketPath, const SocketAccess& access = SocketAccess());
    ~UnixListener();
    UnixListener(const UnixListener&) = delete;
    UnixListener& operator=(const UnixListener&) = delete;

    int socket() const { return descriptor; }

  private:
    void listen(const sockaddr_un& address, const SocketAccess& access);

    std::string path;
    int descriptor = -1;
    dev_t device = 0;
    ino_t inode = 0;
};

}  // namespace cimomd
