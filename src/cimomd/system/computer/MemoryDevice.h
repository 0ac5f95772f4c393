#pragma once

// The memory modules that are plugged in, as the firmware describes them.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

struct MemoryDevice {
    /// Its number among the sockets, empty ones counted: it stays when others are filled.
    std::size_t socketNumber = 0;
    /// Whether the firmware describes it, and not the kernel the memory that it found.
    bool describedByFirmware = true;
    Fact<std::uint64_t> capacityBytes;
    /// Numbers of DSP0134.
    Fact<std::uint8_t> formFactor;
    Fact<std::uint8_t> type;
    Fact<std::uint16_t> totalWidthBits;
    Fact<std::uint16_t> dataWidthBits;
    /// DSP0134 counts transfers; makers sell modules by this number as MHz.
    Fact<std::uint32_t> maxSpeedMHz;
    Fact<std::uint32_t> configuredSpeedMHz;
    Fact<std::string> locator;
    Fact<std::string> bankLabel;
    Fact<std::string> manufacturer;
    Fact<std::string> serialNumber;
    Fact<std::string> assetTag;
    Fact<std::string> partNumber;
    /// Whether it belongs to the main memory, and not to a graphics adapter or the firmware.
    bool isMainMemory = true;
};

/// Sockets without a module are left out.
std::vector<MemoryDevice> memoryDevicesOf(const SmbiosTable& table);

/// What stands for the modules that the firmware does not describe: the memory that the kernel
/// uses.
MemoryDevice memoryOfKernel(std::uint64_t totalKB);

/// The capacities of main memory in all; missing when there are none or one does not tell its own.
Fact<std::uint64_t> totalCapacityBytes(const std::vector<MemoryDevice>& devices);

}  // namespace cimomd
