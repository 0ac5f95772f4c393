#include "service/MainLoop.h"

#include <fmt/format.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <cstring>
#include <stdexcept>
#include <string>

#include "service/EndDeadline.h"
#include "service/Log.h"

namespace cimomd {
namespace {

using Clock = std::chrono::steady_clock;

constexpr int kWatchEveryMs = 500;
// For answers under way, whose clients are cut off already.
constexpr unsigned kEndSeconds = 5;
// Without descriptors or memory there is no use in trying again at once.
constexpr auto kPauseAfterFailure = std::chrono::milliseconds(200);
// Who connects again and again must not keep the loop from its other work.
constexpr int kConnectionsInARow = 64;

std::string describePeer(int connection, const sockaddr_storage& address) {
    ucred peer{};
    socklen_t length = sizeof peer;
    if (address.ss_family != AF_UNIX)
        return "connection over HTTP from the loopback";
    if (::getsockopt(connection, SOL_SOCKET, SO_PEERCRED, &peer, &length) != 0)
        return "connection from a process that is not told";
    return fmt::format("connection from pid {} uid {} gid {}", peer.pid, peer.uid, peer.gid);
}

}  // namespace

MainLoop::MainLoop(HttpServer& httpServer, Signals& daemonSignals)
    : server(httpServer), signals(daemonSignals), ended(::eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK)) {
    if (ended < 0)
        throw std::runtime_error("no descriptor to wait for connections with");
    server.start([descriptor = ended] {
        const std::uint64_t one = 1;
        static_cast<void>(::write(descriptor, &one, sizeof one) == sizeof one);
    });
}

MainLoop::~MainLoop() {
    const EndDeadline deadline(kEndSeconds);
    server.stop();
    ::close(ended);
}

void MainLoop::serveOnly(int connectedSocket) {
    onlyOne = true;
    if (!server.serve(connectedSocket))
        throw std::runtime_error("the connection cannot be served");
}

void MainLoop::run(const std::function<void()>& reload) {
    while (!obeySignals(reload)) {
        wait();
        if (onlyOne && server.connections() == 0)
            return;
        server.closeOverdue();
        connectionLog.tellLeftOut(Clock::now());
        if (Clock::now() < acceptAgain)
            continue;
        for (const int listener : listeners)
            acceptFrom(listener);
    }
}

void MainLoop::wait() {
    std::vector<pollfd> descriptors{{signals.descriptor(), POLLIN, 0}, {ended, POLLIN, 0}};
    if (Clock::now() >= acceptAgain) {
        for (const int listener : listeners) {
            if (server.hasRoomAt(listener))
                descriptors.push_back({listener, POLLIN, 0});
        }
    }
    ::poll(descriptors.data(), descriptors.size(), onlyOne ? -1 : kWatchEveryMs);
    std::uint64_t count = 0;
    static_cast<void>(::read(ended, &count, sizeof count) == sizeof count);
}

void MainLoop::acceptFrom(int listeningSocket) {
    for (int i = 0; i < kConnectionsInARow && server.hasRoomAt(listeningSocket); ++i) {
        sockaddr_storage address{};
        socklen_t length = sizeof address;
        const int connection = ::accept4(listeningSocket, reinterpret_cast<sockaddr*>(&address),
                                         &length, SOCK_CLOEXEC | SOCK_NONBLOCK);
        if (connection < 0) {
            if (errno != EAGAIN && errno != ECONNABORTED && errno != EINTR) {
                logText(LogLevel::Warning, fmt::format("no connection: {}", std::strerror(errno)));
                acceptAgain = Clock::now() + kPauseAfterFailure;
            }
            return;
        }
        // The connection may have ended when it is known to be served.
        const std::string peer = describePeer(connection, address);
        if (server.serve(connection))
            connectionLog.add(peer, Clock::now());
    }
}

bool MainLoop::obeySignals(const std::function<void()>& reload) {
    for (auto event = signals.next(); event != Signals::Event::None; event = signals.next()) {
        if (event == Signals::Event::Stop)
            return true;
        reload();
    }
    return false;
}

}  // namespace cimomd
