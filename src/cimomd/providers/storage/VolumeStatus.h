#pragma once

// How a volume is, in CIM's numbers.

#include <cstdint>
#include <vector>

#include "system/storage/Volume.h"

namespace cimomd {

/// CIM_ManagedSystemElement.OperationalStatus.
std::uint16_t volumeStatusOf(const Volume& volume);

/// CIM_EnabledLogicalElement.EnabledState; nothing when the state of an array is not known.
Fact<std::uint16_t> volumeEnabledStateOf(const Volume& volume);

/// CIM_StorageExtent.ExtentStatus: all that holds, or that nothing is to be said.
std::vector<std::uint16_t> extentStatusOf(const Volume& volume);

}  // namespace cimomd
