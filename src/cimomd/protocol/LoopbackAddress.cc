#include "protocol/LoopbackAddress.h"

#include <arpa/inet.h>

#include <charconv>
#include <cstdint>
#include <cstring>

#include "text/Utf8.h"

namespace cimomd {
namespace {

constexpr std::uint32_t kLoopbackNet = 127;

std::optional<std::uint16_t> parsePort(std::string_view text) {
    std::uint16_t port = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, port);
    if (text.empty() || error != std::errc() || stop != end)
        return std::nullopt;
    return port;
}

std::optional<in_addr> parseLoopback4(std::string_view host) {
    in_addr address{};
    const std::string text(equalsIgnoringCase(host, "localhost") ? "127.0.0.1" : host);
    if (::inet_pton(AF_INET, text.c_str(), &address) != 1 ||
        ntohl(address.s_addr) >> 24 != kLoopbackNet)
        return std::nullopt;
    return address;
}

struct HostAndPort {
    std::string_view host;
    std::optional<std::string_view> port;
};

/// The brackets of an IPv6 address stay with it.
HostAndPort split(std::string_view text) {
    const std::size_t bracket = text.find(']');
    const std::size_t colon = text.find(':', bracket == std::string_view::npos ? 0 : bracket);
    if (colon == std::string_view::npos)
        return {text, std::nullopt};
    return {text.substr(0, colon), text.substr(colon + 1)};
}

}  // namespace

std::optional<LoopbackAddress> LoopbackAddress::parse(std::string_view text) {
    const HostAndPort parts = split(text);
    const auto port = parsePort(parts.port.value_or(""));
    if (!port)
        return std::nullopt;
    LoopbackAddress out;
    if (parts.host == "[::1]") {
        sockaddr_in6 address{};
        address.sin6_family = AF_INET6;
        address.sin6_addr = in6addr_loopback;
        address.sin6_port = htons(*port);
        std::memcpy(&out.address, &address, sizeof address);
        out.length = sizeof address;
        return out;
    }
    const auto host = parseLoopback4(parts.host);
    if (!host)
        return std::nullopt;
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr = *host;
    address.sin_port = htons(*port);
    std::memcpy(&out.address, &address, sizeof address);
    out.length = sizeof address;
    return out;
}

bool LoopbackAddress::holds(const sockaddr_storage& address) {
    if (address.ss_family == AF_INET) {
        sockaddr_in ipv4{};
        std::memcpy(&ipv4, &address, sizeof ipv4);
        return ntohl(ipv4.sin_addr.s_addr) >> 24 == kLoopbackNet;
    }
    if (address.ss_family != AF_INET6)
        return false;
    sockaddr_in6 ipv6{};
    std::memcpy(&ipv6, &address, sizeof ipv6);
    return IN6_IS_ADDR_LOOPBACK(&ipv6.sin6_addr);
}

bool isLoopbackHost(std::string_view host) {
    const HostAndPort parts = split(trimmed(host));
    if (parts.port && !parsePort(*parts.port))
        return false;
    return parts.host == "[::1]" || parseLoopback4(parts.host);
}

}  // namespace cimomd
