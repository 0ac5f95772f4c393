#pragma once

// Where HTTP may be served: on addresses that only this machine reaches.

#include <netinet/in.h>
#include <sys/socket.h>

#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

struct LoopbackAddress {
    sockaddr_storage address{};
    socklen_t length = 0;

    /// "127.0.0.1:5988", any other address of 127.0.0.0/8, "[::1]:5988" or "localhost:5988" (which
    /// is 127.0.0.1). Port 0 lets the kernel choose. Nothing for any other text.
    static std::optional<LoopbackAddress> parse(std::string_view text);

    /// Whether an address that a socket has is one of these.
    static bool holds(const sockaddr_storage& address);
};

/// Whether the Host header of a request names the loopback. Requests with another name come from
/// a browser that was led here under a foreign name (DNS rebinding).
bool isLoopbackHost(std::string_view host);

}  // namespace cimomd
