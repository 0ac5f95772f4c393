#include "protocol/UserShares.h"

#include <sys/socket.h>
#include <unistd.h>

namespace cimomd {

std::optional<uid_t> UserShares::limitedUser(int connectedSocket) {
    sockaddr_storage address{};
    socklen_t length = sizeof address;
    if (::getsockname(connectedSocket, reinterpret_cast<sockaddr*>(&address), &length) != 0 ||
        address.ss_family != AF_UNIX)
        return std::nullopt;
    ucred peer{};
    length = sizeof peer;
    if (::getsockopt(connectedSocket, SOL_SOCKET, SO_PEERCRED, &peer, &length) != 0 ||
        peer.uid == 0 || peer.uid == ::geteuid())
        return std::nullopt;
    return peer.uid;
}

bool UserShares::take(std::optional<uid_t> user) {
    if (!user)
        return true;
    const std::lock_guard lock(guard);
    std::size_t& count = connections[*user];
    if (count >= share)
        return false;
    ++count;
    return true;
}

void UserShares::giveBack(std::optional<uid_t> user) {
    if (!user)
        return;
    const std::lock_guard lock(guard);
    const auto place = connections.find(*user);
    if (place != connections.end() && --place->second == 0)
        connections.erase(place);
}

}  // namespace cimomd
