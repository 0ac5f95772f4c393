#pragma once

// /sys/class/net: the network interfaces as the kernel shows them.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace cimomd {

struct NetworkInterface {
    std::string name;
    /// Hardware address as the kernel writes it, with colons.
    std::optional<std::string> address;
    /// Whether the address is the one burnt in; nothing when the kernel does not say.
    std::optional<bool> addressIsPermanent;
    /// ARPHRD number; 1 is Ethernet.
    std::optional<std::uint64_t> linkType;
    std::optional<std::uint64_t> mtuBytes;
    std::optional<std::string> operationalState;
    /// IFF bits; bit 0 is up.
    std::optional<std::uint64_t> flags;
    /// Nothing when the interface is down or the driver does not know.
    std::optional<std::uint64_t> speedMbps;
    std::optional<bool> fullDuplex;
    /// Whether hardware (real, or a hypervisor's) stands behind it.
    bool hasDevice = false;
    bool isWireless = false;

    bool isEthernetPort() const { return hasDevice && !isWireless && linkType == 1U; }
};

/// In byte order of the names; nothing when the directory cannot be read.
std::optional<std::vector<NetworkInterface>> readNetworkInterfaces(
    const std::filesystem::path& directory);

}  // namespace cimomd
