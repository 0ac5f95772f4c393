#pragma once

// A machine's files below a directory of their own, for the time of one test.

#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

#include "support/TempDirectory.h"
#include "system/SystemPaths.h"

namespace cimomd {

class RecordedTree {
    support::TempDirectory place;

  public:
    RecordedTree& file(const std::string& path, std::string_view text) {
        const std::filesystem::path full = root / path;
        std::filesystem::create_directories(full.parent_path());
        std::ofstream(full, std::ios::binary) << text;
        return *this;
    }
    RecordedTree& directory(const std::string& path) {
        std::filesystem::create_directories(root / path);
        return *this;
    }

    SystemPaths paths() const { return SystemPaths(root); }

    const std::filesystem::path root = place.path();
};

}  // namespace cimomd
