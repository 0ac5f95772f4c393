#pragma once

// A machine's files below a directory of their own, for the time of one test.

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

#include "system/SystemPaths.h"

namespace cimomd {

class RecordedTree {
  public:
    RecordedTree() {
        std::string pattern = (std::filesystem::temp_directory_path() / "machine-XXXXXX").string();
        root = ::mkdtemp(pattern.data());
    }
    ~RecordedTree() { std::filesystem::remove_all(root); }
    RecordedTree(const RecordedTree&) = delete;
    RecordedTree& operator=(const RecordedTree&) = delete;

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

    std::filesystem::path root;
};

}  // namespace cimomd
