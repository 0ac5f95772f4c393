#pragma once

// When a file was written last.

#include <cstdint>
#include <filesystem>

#include "system/Fact.h"

namespace cimomd {

/// Seconds since 1970 UTC; links are followed.
Fact<std::int64_t> modificationTimeOf(const std::filesystem::path& path);

}  // namespace cimomd
