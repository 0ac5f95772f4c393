#pragma once

// Where a symbolic link points to.

#include <filesystem>
#include <string>

#include "system/Fact.h"

namespace cimomd {

/// The link's text as it is, which need not name anything that exists.
Fact<std::string> linkTargetOf(const std::filesystem::path& path);

}  // namespace cimomd
