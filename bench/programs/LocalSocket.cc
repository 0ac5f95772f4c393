#include "bench/programs/LocalSocket.h"

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <stdexcept>

namespace bench {

namespace {

constexpr int kBacklog = 8;

sockaddr_un addressOf(const std::string& path) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.size() >= sizeof address.sun_path) {
        throw std::runtime_error("the socket's path is too long: " + path);
    }
    path.copy(address.sun_path, path.size());
    return address;
}

const sockaddr* generic(const sockaddr_un& address) {
    return reinterpret_cast<const sockaddr*>(&address);
}

void check(bool succeeded, const std::string& what) {
    if (!succeeded) {
        throw std::runtime_error("cannot " + what);
    }
}

}  // namespace

LocalSocket::LocalSocket(int descriptor) : descriptor(descriptor) {
    check(descriptor >= 0, "open a socket");
}

LocalSocket::LocalSocket(LocalSocket&& other) noexcept : descriptor(other.descriptor) {
    other.descriptor = -1;
}

LocalSocket::~LocalSocket() {
    if (descriptor >= 0) {
        ::close(descriptor);
    }
}

LocalSocket LocalSocket::connectTo(const std::string& path) {
    LocalSocket socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    const sockaddr_un address = addressOf(path);
    check(::connect(socket.descriptor, generic(address), sizeof address) == 0,
          "connect to " + path);
    return socket;
}

LocalSocket LocalSocket::listenAt(const std::string& path) {
    LocalSocket socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    const sockaddr_un address = addressOf(path);
    check(::bind(socket.descriptor, generic(address), sizeof address) == 0 &&
              ::listen(socket.descriptor, kBacklog) == 0,
          "listen at " + path);
    return socket;
}

LocalSocket LocalSocket::accept() const {
    return LocalSocket(::accept4(descriptor, nullptr, nullptr, SOCK_CLOEXEC));
}

bool LocalSocket::send(std::string_view bytes) const {
    while (!bytes.empty()) {
        const ssize_t sent = ::send(descriptor, bytes.data(), bytes.size(), MSG_NOSIGNAL);
        if (sent <= 0) {
            return false;
        }
        bytes.remove_prefix(static_cast<std::size_t>(sent));
    }
    return true;
}

std::size_t LocalSocket::receive(char* buffer, std::size_t capacity) const {
    const ssize_t count = ::recv(descriptor, buffer, capacity, 0);
    return count < 0 ? 0 : static_cast<std::size_t>(count);
}

}  // namespace bench
