#pragma once

// One MOF file in memory.

#include <string>

namespace cimomd {

struct MofSource {
    /// Names it in errors.
    std::string file;
    std::string text;
};

}  // namespace cimomd
