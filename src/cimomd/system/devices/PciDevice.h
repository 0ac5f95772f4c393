#pragma once

// /sys/bus/pci/devices: what is plugged into, or soldered onto, the PCI buses.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct PciAddress {
    std::uint32_t domain = 0;
    std::uint8_t bus = 0;
    /// Below 32.
    std::uint8_t device = 0;
    /// Below 8.
    std::uint8_t function = 0;

    // NOLINTNEXTLINE(modernize-use-nullptr): the check takes the comparison's 0 for a pointer.
    auto operator<=>(const PciAddress&) const = default;
};

/// `text` like 0000:00:1f.3, the domain of four digits or more.
std::optional<PciAddress> parsePciAddress(std::string_view text);

struct PciDevice {
    /// The address as the kernel writes it.
    std::string name;
    PciAddress address;
    Fact<std::uint16_t> vendor;
    Fact<std::uint16_t> device;
    /// Bridges have no subsystem.
    Fact<std::uint16_t> subsystemVendor;
    Fact<std::uint16_t> subsystemDevice;
    Fact<std::uint8_t> baseClass;
    Fact<std::uint8_t> subclass;
    Fact<std::uint8_t> revision;
    /// The kernel driver at work.
    Fact<std::string> driver;
    /// Only some graphics drivers tell it.
    Fact<std::uint64_t> videoMemoryBytes;
    // The names that pci.ids has, after namePciDevices.
    Fact<std::string> vendorName;
    Fact<std::string> deviceName;
    Fact<std::string> subsystemName;
    /// Of the subclass, or where that has none of the class.
    Fact<std::string> className;
};

/// In the order of the addresses; missing when the directory cannot be read.
Fact<std::vector<PciDevice>> readPciDevices(const std::filesystem::path& directory);

/// Adds the names from `list`, the text of pci.ids, in one pass over it.
void namePciDevices(std::vector<PciDevice>& devices, const Fact<std::string>& list);

}  // namespace cimomd
