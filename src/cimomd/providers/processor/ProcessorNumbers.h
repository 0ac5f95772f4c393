#pragma once

// Numbers of SMBIOS (DSP0134) that CIM_Processor takes over as they are, as far as its lists go.

#include <cstdint>

namespace cimomd {

/// 1, the number for what a list does not have; its name goes into another property.
inline constexpr std::uint16_t kProcessorOther = 1;

/// The number itself when the standard has it in CIM_Processor.Family, or "other".
std::uint16_t processorFamilyOf(std::uint16_t smbiosFamily);

/// The same for CIM_Processor.UpgradeMethod.
std::uint16_t upgradeMethodOf(std::uint8_t smbiosUpgrade);

}  // namespace cimomd
