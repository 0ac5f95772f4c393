// Synthetic inventories as MOF (DSP0004), for an object manager that serves what it was told.

#pragma once

#include <string>

#include "bench/synthetic/SyntheticClass.h"
#include "bench/synthetic/SyntheticInstance.h"

namespace bench {

/// The declaration of the class with the properties that instances have.
std::string classMof(const SyntheticClass& synthetic);

std::string instanceMof(const SyntheticClass& synthetic, const InstanceTexts& texts);

}  // namespace bench
