#include "service/LoopbackListener.h"

#include <arpa/inet.h>
#include <fmt/format.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstring>
#include <stdexcept>

namespace cimomd {
namespace {

bool listens(int socket, const LoopbackAddress& address) {
    const int on = 1;
    return ::setsockopt(socket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on) == 0 &&
           ::bind(socket, reinterpret_cast<const sockaddr*>(&address.address), address.length) ==
               0 &&
           ::listen(socket, SOMAXCONN) == 0;
}

}  // namespace

LoopbackListener::LoopbackListener(const LoopbackAddress& address)
    : socket(::socket(address.address.ss_family, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0)) {
    if (socket >= 0 && listens(socket, address))
        return;
    const int error = errno;
    if (socket >= 0)
        ::close(socket);
    throw std::runtime_error(fmt::format("cannot listen for HTTP: {}", std::strerror(error)));
}

LoopbackListener::~LoopbackListener() {
    ::close(socket);
}

std::string LoopbackListener::url() const {
    sockaddr_storage bound{};
    socklen_t length = sizeof bound;
    ::getsockname(socket, reinterpret_cast<sockaddr*>(&bound), &length);
    std::array<char, INET6_ADDRSTRLEN> host{};
    if (bound.ss_family == AF_INET6) {
        const auto* ipv6 = reinterpret_cast<const sockaddr_in6*>(&bound);
        ::inet_ntop(AF_INET6, &ipv6->sin6_addr, host.data(), host.size());
        return fmt::format("http://[{}]:{}", host.data(), ntohs(ipv6->sin6_port));
    }
    const auto* ipv4 = reinterpret_cast<const sockaddr_in*>(&bound);
    ::inet_ntop(AF_INET, &ipv4->sin_addr, host.data(), host.size());
    return fmt::format("http://{}:{}", host.data(), ntohs(ipv4->sin_port));
}

}  // namespace cimomd
