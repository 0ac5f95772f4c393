#include "protocol/Peer.h"

#include <sys/socket.h>
#include <unistd.h>

namespace cimomd {

Peer Peer::of(int connectedSocket) {
    ucred credentials{};
    socklen_t length = sizeof credentials;
    if (!tellsUser(connectedSocket) ||
        ::getsockopt(connectedSocket, SOL_SOCKET, SO_PEERCRED, &credentials, &length) != 0)
        return {};
    if (credentials.uid == 0 || credentials.uid == ::geteuid())
        return {true, std::nullopt};
    return {false, credentials.uid};
}

bool tellsUser(int socket) {
    sockaddr_storage address{};
    socklen_t length = sizeof address;
    return ::getsockname(socket, reinterpret_cast<sockaddr*>(&address), &length) == 0 &&
           address.ss_family == AF_UNIX;
}

}  // namespace cimomd
