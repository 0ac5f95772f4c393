#pragma once

// /proc/net/route and /proc/net/ipv6_route: where the kernel sends packets.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/network/IpAddress.h"

namespace cimomd {

struct Route {
    IpAddress destination;
    std::uint8_t prefixLength = 0;
    /// Nothing when the destination is on the link itself.
    std::optional<IpAddress> gateway;
    /// Nothing for routes that refuse packets.
    std::optional<std::string> interfaceName;
    std::uint32_t metric = 0;

    bool operator==(const Route&) const = default;
};

/// Routes in use, in the order of the text. The kernel writes addresses as numbers of this
/// machine's byte order. Lines that cannot be understood, and masks with gaps, are dropped.
std::vector<Route> parseIpv4Routes(std::string_view text);

/// The same for IPv6, without what the kernel keeps for itself: its own addresses, multicast,
/// anycast, and the entry that stands for "no route".
std::vector<Route> parseIpv6Routes(std::string_view text);

}  // namespace cimomd
