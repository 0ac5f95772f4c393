#pragma once

// Who this machine is: its host name, and what firmware and device tree say about the maker.

#include <cstdint>
#include <string>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

/// Texts of the firmware that are placeholders, or may only be read by root, are missing.
struct SystemIdentity {
    Fact<std::string> manufacturer;
    Fact<std::string> model;
    Fact<std::string> version;
    Fact<std::string> serialNumber;
    Fact<std::string> uuid;
    Fact<std::string> sku;
    Fact<std::string> family;
    /// What switched the machine on, a number of DSP0134.
    Fact<std::uint8_t> wakeUpType;
    /// The front panel's reset button: 0 disabled, 1 enabled, 2 none, 3 unknown (DSP0134).
    Fact<std::uint8_t> resetButton;
    Fact<std::string> machineId;
};

/// From the SMBIOS tables; without them from the texts that the kernel took out of them; what
/// neither tells from the device tree.
SystemIdentity readSystemIdentity(const SystemPaths& paths);

/// The host name; "localhost" when the kernel tells none, since every key needs one.
std::string readHostName(const SystemPaths& paths);

}  // namespace cimomd
