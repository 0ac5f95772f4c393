#pragma once

// The firmware that starts the machine, as it describes itself.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

struct CalendarDate {
    int year = 0;
    unsigned month = 0;
    unsigned day = 0;

    friend bool operator==(const CalendarDate&, const CalendarDate&) = default;
};

struct Firmware {
    /// Its place among those that the firmware lists.
    std::size_t index = 0;
    Fact<std::string> vendor;
    Fact<std::string> version;
    Fact<CalendarDate> releaseDate;
    /// "major.minor" of the firmware, and of the controller embedded beside it.
    Fact<std::string> release;
    Fact<std::string> controllerRelease;
    /// In units of 1024 bytes.
    Fact<std::uint32_t> romKB;
};

/// mm/dd/yyyy, or mm/dd/yy of firmware up to 1999 and of some that was late to change; nothing for
/// anything else and for days that no calendar has.
std::optional<CalendarDate> parseFirmwareDate(std::string_view text);

std::vector<Firmware> firmwareOf(const SmbiosTable& table);

/// From the SMBIOS tables, else what the kernel hands on of them; missing when both say nothing.
Fact<std::vector<Firmware>> readFirmware(const SystemPaths& paths);

/// Whether the machine was started by UEFI.
bool startedByUefi(const SystemPaths& paths);

}  // namespace cimomd
