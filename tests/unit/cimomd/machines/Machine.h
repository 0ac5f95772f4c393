#pragma once

// The recorded machines below tests/machines.

#include <filesystem>

#include "system/SystemPaths.h"

namespace cimomd {

/// `name`: laptop, server, virtual or arm.
inline SystemPaths machine(const char* name) {
    return SystemPaths(std::filesystem::path(MACHINES_DIR) / name);
}

}  // namespace cimomd
