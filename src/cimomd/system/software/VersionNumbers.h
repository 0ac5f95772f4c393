#pragma once

// The numbers at the front of a version: 252.38 or 1.1.1n.

#include <cstdint>
#include <string_view>

#include "system/Fact.h"

namespace cimomd {

struct VersionNumbers {
    Fact<std::uint16_t> major;
    Fact<std::uint16_t> minor;
    Fact<std::uint16_t> revision;
    Fact<std::uint16_t> build;
};

/// Up to four numbers with dots between them; what comes after the first other character does not
/// count. A number above 65535 is nothing, those after it stay in their places.
VersionNumbers versionNumbersOf(std::string_view version);

}  // namespace cimomd
