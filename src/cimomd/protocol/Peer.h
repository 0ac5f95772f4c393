#pragma once

// Who is at the other end of a connection.

#include <sys/types.h>

#include <optional>

namespace cimomd {

struct Peer {
    /// Root or the server's own user, at a Unix socket.
    bool isTrusted = false;
    /// Any other user at a Unix socket. The network does not tell its users.
    std::optional<uid_t> user;

    static Peer of(int connectedSocket);
};

/// Whether connections of this socket, connected or listening, tell the user at their other end.
bool tellsUser(int socket);

}  // namespace cimomd
