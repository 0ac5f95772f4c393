#include "client/UnixSocket.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>

namespace Pegasus {

namespace {

constexpr int kRetryMilliseconds = 5;

int connectOnce(const FileDescriptor& socket, const sockaddr_un& address) {
    const auto* generic = reinterpret_cast<const sockaddr*>(&address);
    return ::connect(socket.get(), generic, sizeof(address)) == 0 ? 0 : errno;
}

}  // namespace

ConnectResult connectUnixSocket(const std::string& path, FinalLink finalLink,
                                const Deadline& deadline) {
    const int linkFlag = finalLink == FinalLink::Refuse ? O_NOFOLLOW : 0;
    const FileDescriptor file(::open(path.c_str(), O_PATH | O_CLOEXEC | linkFlag));
    if (!file.isOpen()) {
        return {FileDescriptor(), errno};
    }
    struct stat status {};
    if (::fstat(file.get(), &status) != 0 || !S_ISSOCK(status.st_mode)) {
        return {FileDescriptor(), ENOTSOCK};
    }
    // Through the descriptor it is this very socket, whatever the path leads to by now.
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::snprintf(address.sun_path, sizeof(address.sun_path), "/proc/self/fd/%d", file.get());

    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    if (!socket.isOpen()) {
        return {FileDescriptor(), errno};
    }
    int error = connectOnce(socket, address);
    while (error == EAGAIN || error == EINTR) {
        if (deadline.hasPassed()) {
            return {FileDescriptor(), ETIMEDOUT};
        }
        ::poll(nullptr, 0, std::min(kRetryMilliseconds, deadline.millisecondsLeft()));
        error = connectOnce(socket, address);
    }
    if (error != 0) {
        return {FileDescriptor(), error};
    }
    return {std::move(socket), 0};
}

std::optional<uid_t> peerUserOf(const FileDescriptor& socket) {
    ucred peer{};
    socklen_t length = sizeof(peer);
    if (::getsockopt(socket.get(), SOL_SOCKET, SO_PEERCRED, &peer, &length) != 0) {
        return std::nullopt;
    }
    return peer.uid;
}

bool isIdle(const FileDescriptor& socket, std::chrono::microseconds grace) {
    pollfd descriptor{socket.get(), POLLIN, 0};
    const timespec time{0, std::chrono::nanoseconds(grace).count()};
    int ready = 0;
    do {
        ready = ::ppoll(&descriptor, 1, &time, nullptr);
    } while (ready < 0 && errno == EINTR);
    return ready == 0;
}

}  // namespace Pegasus
