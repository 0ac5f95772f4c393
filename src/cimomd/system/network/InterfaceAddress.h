#pragma once

// Internet addresses as they are set on network interfaces.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/network/IpAddress.h"

namespace cimomd {

struct InterfaceAddress {
    std::string interfaceName;
    IpAddress local;
    /// The other end of a point-to-point link.
    std::optional<IpAddress> peer;
    /// Belongs to the peer's address when there is one.
    std::uint8_t prefixLength = 0;
    /// IFA_F bits of rtnetlink(7).
    std::uint32_t flags = 0;
    /// How long the address stays valid; nothing for ever.
    std::optional<std::uint32_t> validSeconds;
    /// Who set it, an IFAPROT number of <linux/if_addr.h>; 0 when nobody says.
    std::uint8_t origin = 0;

    bool operator==(const InterfaceAddress&) const = default;
};

/// Reads lines `interface local peer prefix-length flags seconds [origin]`, with "-" for no peer,
/// hexadecimal flags after 0x and "forever" for no end. Other lines are dropped.
std::vector<InterfaceAddress> parseRecordedAddresses(std::string_view text);

}  // namespace cimomd
