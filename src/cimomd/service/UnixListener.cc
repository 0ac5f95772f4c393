#include "service/UnixListener.h"

#include <fmt/format.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <stdexcept>
#include <utility>

namespace cimomd {
namespace {

[[noreturn]] void fail(const std::string& path, std::string_view reason) {
    throw std::runtime_error(fmt::format("{}: {}", path, reason));
}

sockaddr_un addressOf(const std::string& path) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.empty() || path.size() >= sizeof address.sun_path)
        fail(path, fmt::format("a socket's path has 1 to {} bytes", sizeof address.sun_path - 1));
    std::memcpy(address.sun_path, path.data(), path.size());
    return address;
}

int makeSocket(const std::string& path) {
    const int descriptor = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (descriptor < 0)
        fail(path, std::strerror(errno));
    return descriptor;
}

/// Whether connecting is refused, which is what happens when the server behind a socket is gone.
bool isStale(const std::string& path, const sockaddr_un& address) {
    const int probe = makeSocket(path);
    const int result =
        ::connect(probe, reinterpret_cast<const sockaddr*>(&address), sizeof address);
    const int error = errno;
    ::close(probe);
    return result != 0 && error == ECONNREFUSED;
}

void clearPath(const std::string& path, const sockaddr_un& address) {
    struct stat status {};
    if (::lstat(path.c_str(), &status) != 0)
        return;
    if (!S_ISSOCK(status.st_mode))
        fail(path, "there is something that is no socket");
    if (!isStale(path, address))
        fail(path, "another server listens there");
    ::unlink(path.c_str());
}

/// Nobody else may connect, not even in the moment before a chmod.
int bindPrivately(int descriptor, const sockaddr_un& address) {
    const mode_t previous = ::umask(S_IRWXG | S_IRWXO | S_IXUSR);
    const int result =
        ::bind(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address);
    const int error = errno;
    ::umask(previous);
    errno = error;
    return result;
}

bool grant(const std::string& path, const SocketAccess& access) {
    if (access.group && ::lchown(path.c_str(), static_cast<uid_t>(-1), *access.group) != 0)
        return false;
    return ::chmod(path.c_str(), access.mode) == 0;
}

}  // namespace

UnixListener::UnixListener(std::string socketPath, const SocketAccess& access)
    : path(std::move(socketPath)) {
    const sockaddr_un address = addressOf(path);
    clearPath(path, address);
    descriptor = makeSocket(path);
    struct stat status {};
    if (bindPrivately(descriptor, address) != 0 || !grant(path, access) ||
        ::listen(descriptor, SOMAXCONN) != 0 || ::lstat(path.c_str(), &status) != 0) {
        const int error = errno;
        ::close(descriptor);
        fail(path, std::strerror(error));
    }
    device = status.st_dev;
    inode = status.st_ino;
}

UnixListener::~UnixListener() {
    struct stat status {};
    if (::lstat(path.c_str(), &status) == 0 && status.st_dev == device && status.st_ino == inode)
        ::unlink(path.c_str());
    if (descriptor >= 0)
        ::close(descriptor);
}

}  // namespace cimomd
