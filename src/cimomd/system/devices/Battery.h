#pragma once

// /sys/class/power_supply: the batteries that feed this computer.

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"

namespace cimomd {

struct Battery {
    std::string name;
    Fact<std::string> manufacturer;
    Fact<std::string> model;
    Fact<std::string> serialNumber;
    /// The kernel's word, such as Li-ion.
    Fact<std::string> technology;
    /// The kernel's word: Charging, Discharging, Not charging, Full or Unknown.
    Fact<std::string> status;
    /// The kernel's word: Critical, Low, Normal, High, Full or Unknown.
    Fact<std::string> level;
    Fact<std::uint32_t> designMilliwattHours;
    Fact<std::uint32_t> fullMilliwattHours;
    Fact<std::uint64_t> designMillivolts;
    /// 0 to 100.
    Fact<std::uint16_t> remainingPercent;
    Fact<std::uint32_t> chargeCycles;
};

/// In the order of their names, without those of mice and other devices and without empty bays;
/// missing when the directory cannot be read.
Fact<std::vector<Battery>> readBatteries(const std::filesystem::path& directory,
                                         const SystemCalls& calls);

}  // namespace cimomd
