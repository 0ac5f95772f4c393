#pragma once

// What the firmware says about the processor sockets: SMBIOS structures of type 4 (DSP0134).

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

/// What the firmware does not know (0, or the number for "unknown") is Absent.
struct ProcessorSocket {
    /// The place in the table, from 1, empty sockets included.
    std::size_t number = 0;
    Fact<std::string> designation;
    /// SMBIOS number; the 16-bit one where the firmware uses it.
    Fact<std::uint16_t> family;
    Fact<std::string> manufacturer;
    /// The maker's name for the model.
    Fact<std::string> version;
    Fact<std::string> serialNumber;
    Fact<std::string> partNumber;
    Fact<std::uint16_t> externalClockMHz;
    /// The highest clock rate the socket is made for.
    Fact<std::uint16_t> maxMHz;
    /// The clock rate when the system started.
    Fact<std::uint16_t> currentMHz;
    /// SMBIOS number: 2 and 3 are disabled processors.
    std::uint8_t status = 0;
    /// SMBIOS number of the kind of socket.
    Fact<std::uint8_t> upgrade;

    bool isDisabled() const { return status == 2 || status == 3; }
};

/// The sockets that hold a central processor, in the order of the table.
std::vector<ProcessorSocket> processorSockets(const SmbiosTable& table);

}  // namespace cimomd
