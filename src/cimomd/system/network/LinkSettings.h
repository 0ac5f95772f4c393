#pragma once

// What the driver of a network port tells about it beyond sysfs: ethtool's questions.

#include <cstdint>
#include <map>
#include <string>
#include <string_view>

#include "system/Fact.h"

namespace cimomd {

/// The connector in use.
enum class PortConnector : std::uint8_t { TwistedPair, Aui, Mii, Fibre, Bnc, DirectAttach };

struct LinkSettings {
    /// The hardware address burnt in, with colons; stays when another one is in use.
    Fact<std::string> permanentAddress;
    Fact<PortConnector> connector;
};

/// From the PORT_ numbers of linux/ethtool.h; nothing for "none", "other" and unknown ones.
std::optional<PortConnector> connectorOf(unsigned port);

/// Bytes as hexadecimal digits with colons; nothing when all are 0, as drivers without a permanent
/// address answer.
std::optional<std::string> hardwareAddressText(std::string_view bytes);

/// Reads lines `interface permanent-address port-number`, with "-" for an unknown one. Other lines
/// are dropped.
std::map<std::string, LinkSettings> parseRecordedLinks(std::string_view text);

}  // namespace cimomd
