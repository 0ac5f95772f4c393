// What a client may send to cimomd over HTTP: request line, headers, coded body, several requests
// on a connection. Whatever comes is answered with HTTP or the connection is closed, and soon.

#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <string>

#include "LeafService.h"
#include "Require.h"
#include "protocol/HttpServer.h"

namespace {

constexpr std::size_t kMaxRequestBytes = 16384;
constexpr int kHangMilliseconds = 10000;

struct Server {
    Server() {
        server.start([] {});
    }

    LeafService leaves;
    cimomd::HttpServer server{leaves.service, cimomd::HttpLimits{}};
};

/// Everything up to the end of the connection.
std::string received(int connection) {
    std::string all;
    std::array<char, 4096> buffer{};
    while (true) {
        pollfd waiting{connection, POLLIN, 0};
        int ready = 0;
        do {
            ready = poll(&waiting, 1, kHangMilliseconds);
            // libFuzzer's timer interrupts the wait now and then.
        } while (ready < 0 && errno == EINTR);
        require(ready == 1);
        const ssize_t count = read(connection, buffer.data(), buffer.size());
        if (count <= 0) {
            return all;
        }
        all.append(buffer.data(), static_cast<std::size_t>(count));
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static Server server;
    std::array<int, 2> ends{};
    if (size > kMaxRequestBytes ||
        socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0) {
        return 0;
    }
    require(server.server.serve(ends[1]));
    // The server may close before it has read all of it.
    static_cast<void>(send(ends[0], data, size, MSG_NOSIGNAL));
    static_cast<void>(shutdown(ends[0], SHUT_WR));
    const std::string answer = received(ends[0]);
    close(ends[0]);
    require(answer.empty() || answer.starts_with("HTTP/1."));
    return 0;
}
