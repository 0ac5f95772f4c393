#pragma once

// The places for cards, as the firmware describes them.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

struct Slot {
    /// Its place among those that the firmware lists.
    std::size_t index = 0;
    Fact<std::string> designation;
    /// Numbers of DSP0134.
    Fact<std::uint8_t> type;
    Fact<std::uint8_t> dataBusWidth;
    Fact<std::uint16_t> number;
    /// Whether a card is in it.
    Fact<bool> inUse;
    Fact<bool> supportsHotPlug;
    /// Where the card is found, as the kernel writes it: domain:bus:device.function.
    Fact<std::string> pciAddress;
};

std::vector<Slot> slotsOf(const SmbiosTable& table);

}  // namespace cimomd
