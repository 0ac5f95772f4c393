#pragma once

// System calls for tests of file systems: fixed sizes by mount point, and a note of who was asked
// with a deadline.

#include <map>
#include <string>
#include <vector>

#include "system/SystemCalls.h"

namespace cimomd {

class ScriptedSizes : public SystemCalls {
  public:
    std::int64_t now() const override { return 0; }
    int utcOffsetMinutes(std::int64_t) const override { return 0; }
    std::optional<std::string> machine() const override { return std::nullopt; }
    Fact<FileSystemSize> fileSystemSize(const std::string& mountPoint) const override {
        const auto place = sizes.find(mountPoint);
        return place == sizes.end() ? Fact<FileSystemSize>() : place->second;
    }
    Fact<FileSystemSize> fileSystemSizeInTime(const std::string& mountPoint,
                                              const std::string& device) const override {
        askedInTime.push_back(device);
        return fileSystemSize(mountPoint);
    }

    std::map<std::string, Fact<FileSystemSize>> sizes;
    mutable std::vector<std::string> askedInTime;
};

}  // namespace cimomd
