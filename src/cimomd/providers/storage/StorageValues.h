#pragma once

// Numbers that the CIM schema gives a meaning, as far as several storage providers need them.

#include <cstdint>

namespace cimomd {

// CIM_MediaAccessDevice.Capabilities
inline constexpr std::uint16_t kRandomAccess = 3;
inline constexpr std::uint16_t kSupportsWriting = 4;
inline constexpr std::uint16_t kRemovableMedia = 7;

// CIM_StorageExtent.ExtentStatus
inline constexpr std::uint16_t kExtentStatusNone = 2;

// CIM_StorageExtent.NameFormat
inline constexpr std::uint16_t kNameFormatOsDevice = 12;

}  // namespace cimomd
