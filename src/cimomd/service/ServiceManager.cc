#include "service/ServiceManager.h"

#include <fcntl.h>
#include <fmt/format.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <charconv>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <optional>
#include <stdexcept>
#include <string>

#include "protocol/LoopbackAddress.h"

namespace cimomd {
namespace {

constexpr int kFirstDescriptor = 3;
constexpr int kMaxSockets = 64;

std::optional<int> numberIn(const char* variable) {
    const char* text = std::getenv(variable);
    if (text == nullptr)
        return std::nullopt;
    int number = 0;
    const char* end = text + std::strlen(text);
    const auto [stop, error] = std::from_chars(text, end, number);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return number;
}

int option(int socket, int name) {
    int value = 0;
    socklen_t length = sizeof value;
    return ::getsockopt(socket, SOL_SOCKET, name, &value, &length) == 0 ? value : -1;
}

void requireUsable(int socket) {
    if (option(socket, SO_TYPE) != SOCK_STREAM || option(socket, SO_ACCEPTCONN) != 1)
        throw std::runtime_error(
            fmt::format("the descriptor {} is no listening stream socket", socket));
    sockaddr_storage address{};
    socklen_t length = sizeof address;
    if (::getsockname(socket, reinterpret_cast<sockaddr*>(&address), &length) != 0 ||
        (address.ss_family != AF_UNIX && !LoopbackAddress::holds(address)))
        throw std::runtime_error(
            fmt::format("the socket {} can be reached from other machines", socket));
}

}  // namespace

std::vector<int> ServiceManager::takeListeningSockets() {
    const auto pid = numberIn("LISTEN_PID");
    const auto count = numberIn("LISTEN_FDS");
    ::unsetenv("LISTEN_PID");
    ::unsetenv("LISTEN_FDS");
    ::unsetenv("LISTEN_FDNAMES");
    std::vector<int> sockets;
    if (pid != ::getpid() || !count)
        return sockets;
    for (int i = 0; i < *count && i < kMaxSockets; ++i) {
        const int socket = kFirstDescriptor + i;
        requireUsable(socket);
        ::fcntl(socket, F_SETFD, FD_CLOEXEC);
        ::fcntl(socket, F_SETFL, ::fcntl(socket, F_GETFL) | O_NONBLOCK);
        sockets.push_back(socket);
    }
    return sockets;
}

void ServiceManager::notify(std::string_view state) {
    const char* path = std::getenv("NOTIFY_SOCKET");
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path == nullptr || std::strlen(path) >= sizeof address.sun_path)
        return;
    const std::size_t length = std::strlen(path);
    std::memcpy(address.sun_path, path, length);
    if (address.sun_path[0] == '@')
        address.sun_path[0] = '\0';
    const int socket = ::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0);
    if (socket < 0)
        return;
    ::sendto(socket, state.data(), state.size(), MSG_NOSIGNAL,
             reinterpret_cast<const sockaddr*>(&address),
             static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + length));
    ::close(socket);
}

void ServiceManager::notifyReloading() {
    timespec now{};
    ::clock_gettime(CLOCK_MONOTONIC, &now);
    notify(fmt::format("RELOADING=1\nMONOTONIC_USEC={}",
                       static_cast<long long>(now.tv_sec) * 1'000'000 + now.tv_nsec / 1'000));
}

}  // namespace cimomd
