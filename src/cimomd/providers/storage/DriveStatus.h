#pragma once

// What the state of a drive, as its driver puts it, means in CIM.

#include <cstdint>
#include <string>

#include "system/Fact.h"

namespace cimomd {

/// CIM_ManagedSystemElement.OperationalStatus; Unknown when the driver tells no state.
std::uint16_t driveStatusOf(const Fact<std::string>& state);

/// CIM_EnabledLogicalElement.EnabledState; nothing when the driver tells no state.
Fact<std::uint16_t> driveEnabledStateOf(const Fact<std::string>& state);

}  // namespace cimomd
