// The generator's input for a synthetic inventory.

#pragma once

#include <filesystem>
#include <vector>

#include "bench/synthetic/SyntheticClass.h"

namespace bench {

/// Writes into `directory` an inventory script per class, which lists all properties that instances
/// have, and `sennet.properties` with readable names for them. Throws std::runtime_error.
void writeScripts(const std::filesystem::path& directory,
                  const std::vector<SyntheticClass>& classes);

}  // namespace bench
