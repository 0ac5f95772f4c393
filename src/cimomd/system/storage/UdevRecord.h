#pragma once

// What udev found out about a block device: /run/udev/data/bMAJOR:MINOR.

#include <filesystem>
#include <map>
#include <string>
#include <string_view>

#include "system/Fact.h"

namespace cimomd {

class UdevRecord {
  public:
    UdevRecord() = default;
    /// Reads the lines `E:NAME=value`.
    explicit UdevRecord(std::string_view text);

    Fact<std::string> property(std::string_view name) const;
    /// A text that udev keeps twice: with blanks as underscores under `name`, and exactly, with
    /// escapes \xHH, under `name`_ENC.
    Fact<std::string> text(std::string_view name) const;

  private:
    std::map<std::string, std::string, std::less<>> properties;
};

/// The record of the device whose numbers stand in `deviceDirectory`/dev; an empty one when there
/// is none.
UdevRecord readUdevRecord(const std::filesystem::path& udevDirectory,
                          const std::filesystem::path& deviceDirectory);

}  // namespace cimomd
