#pragma once

// os-release(5): which distribution this is.

#include <optional>
#include <string>
#include <string_view>

#include "system/SystemPaths.h"

namespace cimomd {

/// Values without their shell quoting; absent and empty ones are nothing.
struct OsRelease {
    std::optional<std::string> id;
    std::optional<std::string> name;
    std::optional<std::string> prettyName;
    std::optional<std::string> versionId;
};

/// Of equal keys the last counts. Lines that are no assignment are dropped.
OsRelease parseOsRelease(std::string_view text);

/// The administrator's file, else the vendor's; everything is nothing when neither can be read.
OsRelease readOsRelease(const SystemPaths& paths);

/// The name that is the key of the operating system.
std::string nameOf(const OsRelease& release);

}  // namespace cimomd
