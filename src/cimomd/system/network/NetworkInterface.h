#pragma once

// /sys/class/net: the network interfaces as the kernel shows them.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"

namespace cimomd {

struct NetworkInterface {
    std::string name;
    /// Hardware address as the kernel writes it, with colons.
    Fact<std::string> address;
    /// Whether the address is the one burnt in.
    Fact<bool> addressIsPermanent;
    /// ARPHRD number; 1 is Ethernet.
    Fact<std::uint64_t> linkType;
    Fact<std::uint64_t> mtuBytes;
    Fact<std::string> operationalState;
    /// IFF bits; bit 0 is up.
    Fact<std::uint64_t> flags;
    /// Whether there is a link to the other side; Absent while the interface is down.
    Fact<bool> hasCarrier;
    /// Absent when the interface is down or the driver does not know.
    Fact<std::uint64_t> speedMbps;
    Fact<bool> fullDuplex;
    /// What the kernel calls this kind of interface: "wlan", "bond", "bridge", "vlan" and so on.
    /// Absent for plain Ethernet.
    Fact<std::string> kind;
    /// Of the device behind the interface: the driver, and the place on the PCI bus.
    Fact<std::string> driver;
    Fact<std::string> busAddress;
    /// Whether hardware (real, or a hypervisor's) stands behind it.
    bool hasDevice = false;
    bool isWireless = false;

    bool isEthernetPort() const;
    bool isWifiPort() const;
};

/// In natural order of the names; missing for the reason that the directory cannot be read.
Fact<std::vector<NetworkInterface>> readNetworkInterfaces(const std::filesystem::path& directory,
                                                          const SystemCalls& calls);

}  // namespace cimomd
