#pragma once

// The cases that the machine is built into, as its firmware describes them.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

struct Chassis {
    /// Its place among those that the firmware lists.
    std::size_t index = 0;
    Fact<std::string> manufacturer;
    /// A number of DSP0134, without the bit for the lock.
    Fact<std::uint8_t> type;
    Fact<bool> lockPresent;
    Fact<std::string> version;
    Fact<std::string> serialNumber;
    Fact<std::string> assetTag;
    Fact<std::string> sku;
    /// In rack units.
    Fact<std::uint8_t> heightUnits;
    Fact<std::uint8_t> powerCords;
};

std::vector<Chassis> chassisOf(const SmbiosTable& table);

/// From the SMBIOS tables, else what the kernel hands on of them; missing when both say nothing.
Fact<std::vector<Chassis>> readChassis(const SystemPaths& paths);

}  // namespace cimomd
