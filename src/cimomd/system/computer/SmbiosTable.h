#pragma once

// What the firmware says about the machine it belongs to: the SMBIOS tables (DSP0134) as the kernel
// hands them on, to root only.

#include <string_view>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/computer/SmbiosStructure.h"

namespace cimomd {

struct SmbiosVersion {
    unsigned majorNumber = 0;
    unsigned minorNumber = 0;

    bool atLeast(unsigned otherMajor, unsigned otherMinor) const {
        return majorNumber != otherMajor ? majorNumber > otherMajor : minorNumber >= otherMinor;
    }
};

/// The types of structures that say what the machine is made of.
namespace smbios {
inline constexpr std::uint8_t kFirmware = 0;
inline constexpr std::uint8_t kSystem = 1;
inline constexpr std::uint8_t kBoard = 2;
inline constexpr std::uint8_t kChassis = 3;
inline constexpr std::uint8_t kProcessor = 4;
inline constexpr std::uint8_t kSlot = 9;
inline constexpr std::uint8_t kMemoryArray = 16;
inline constexpr std::uint8_t kMemoryDevice = 17;
inline constexpr std::uint8_t kHardwareSecurity = 24;
}  // namespace smbios

struct SmbiosTable {
    SmbiosVersion version;
    /// In the order of the table, the one that ends it left out.
    std::vector<SmbiosStructure> structures;

    /// Those of one type, in the order of the table; they live as long as this.
    std::vector<const SmbiosStructure*> ofType(std::uint8_t type) const;
};

/// The version that an entry point tells, 32-bit ("_SM_") or 64-bit ("_SM3_"); Unreadable when it
/// is neither.
Fact<SmbiosVersion> parseSmbiosEntryPoint(std::string_view bytes);

/// The structures up to the end mark, or to the first that is not there as a whole: nothing after
/// it could be trusted.
std::vector<SmbiosStructure> parseSmbiosStructures(std::string_view bytes);

/// Missing for the reason that its files cannot be read, or Unreadable without a known entry point.
Fact<SmbiosTable> readSmbiosTable(const SystemPaths& paths);

}  // namespace cimomd
