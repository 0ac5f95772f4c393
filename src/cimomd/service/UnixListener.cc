#include "service/UnixListener.h"

#include <fcntl.h>
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

constexpr mode_t kPermissions = S_IRWXU | S_IRWXG | S_IRWXO;
constexpr mode_t kPrivate = S_IRUSR | S_IWUSR;

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

/// The file's mode is `mode` from its first moment on.
int bindWithMode(int descriptor, const sockaddr_un& address, mode_t mode) {
    const mode_t previous = ::umask(~mode & kPermissions);
    const int result =
        ::bind(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address);
    const int error = errno;
    ::umask(previous);
    errno = error;
    return result;
}

/// The file that was bound, found by its path only once: whoever owns the directory may put
/// something else under the name at any moment, and its mode and group must not change.
class BoundFile {
  public:
    explicit BoundFile(const std::string& path)
        : descriptor(::open(path.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC)) {
        if (descriptor < 0 || ::fstat(descriptor, &status) != 0)
            fail(path, std::strerror(errno));
        if (!S_ISSOCK(status.st_mode) || status.st_uid != ::geteuid() || status.st_nlink != 1)
            fail(path, "something else has taken the socket's place");
    }
    ~BoundFile() { ::close(descriptor); }
    BoundFile(const BoundFile&) = delete;
    BoundFile& operator=(const BoundFile&) = delete;

    const struct stat& found() const { return status; }

    bool grant(const SocketAccess& access) const {
        constexpr auto kSameOwner = static_cast<uid_t>(-1);
        if (access.group &&
            ::fchownat(descriptor, "", kSameOwner, *access.group, AT_EMPTY_PATH) != 0)
            return false;
        if ((status.st_mode & kPermissions) == access.mode)
            return true;
        // There is no fchmod for a descriptor that only names a file.
        return ::chmod(fmt::format("/proc/self/fd/{}", descriptor).c_str(), access.mode) == 0;
    }

  private:
    int descriptor;
    struct stat status {};
};

}  // namespace

UnixListener::UnixListener(std::string socketPath, const SocketAccess& access)
    : path(std::move(socketPath)) {
    const sockaddr_un address = addressOf(path);
    clearPath(path, address);
    descriptor = makeSocket(path);
    try {
        listen(address, access);
    } catch (...) {
        ::close(descriptor);
        throw;
    }
}

void UnixListener::listen(const sockaddr_un& address, const SocketAccess& access) {
    // Before the group is given, the mode would let a wrong group in.
    if (bindWithMode(descriptor, address, access.group ? kPrivate : access.mode) != 0)
        fail(path, std::strerror(errno));
    const BoundFile file(path);
    if (!file.grant(access) || ::listen(descriptor, SOMAXCONN) != 0)
        fail(path, std::strerror(errno));
    device = file.found().st_dev;
    inode = file.found().st_ino;
}

UnixListener::~UnixListener() {
    struct stat status {};
    if (::lstat(path.c_str(), &status) == 0 && status.st_dev == device && status.st_ino == inode)
        ::unlink(path.c_str());
    if (descriptor >= 0)
        ::close(descriptor);
}

}  // namespace cimomd
