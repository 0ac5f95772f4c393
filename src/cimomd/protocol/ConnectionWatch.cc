#include "protocol/ConnectionWatch.h"

#include <sys/socket.h>

#include <algorithm>
#include <limits>

namespace cimomd {
namespace {

using Clock = std::chrono::steady_clock;

constexpr std::int64_t kNever = std::numeric_limits<std::int64_t>::max();

std::int64_t nanoseconds(Clock::time_point time) {
    return std::chrono::nanoseconds(time.time_since_epoch()).count();
}

}  // namespace

void WatchedConnection::expectProgress(std::chrono::seconds within) {
    deadlineNs = within.count() == 0 ? kNever : nanoseconds(Clock::now() + within);
}

void WatchedConnection::waitForServer() {
    deadlineNs = kNever;
}

WatchedConnection* ConnectionWatch::add(int connectedSocket) {
    auto connection = std::make_unique<WatchedConnection>(connectedSocket);
    connection->waitForServer();
    const std::lock_guard lock(guard);
    return connections.insert(std::move(connection)).first->get();
}

void ConnectionWatch::remove(WatchedConnection* connection) {
    const std::lock_guard lock(guard);
    const auto isIt = [connection](const auto& candidate) { return candidate.get() == connection; };
    const auto place = std::find_if(connections.begin(), connections.end(), isIt);
    if (place != connections.end())
        connections.erase(place);
}

void ConnectionWatch::shutDownOverdue() {
    const std::int64_t now = nanoseconds(Clock::now());
    const std::lock_guard lock(guard);
    for (const auto& connection : connections) {
        if (connection->deadlineNs < now)
            ::shutdown(connection->socket, SHUT_RDWR);
    }
}

}  // namespace cimomd
