#pragma once

// /sys/block: what the kernel says about every block device in the same way.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

/// The unit of the kernel's sizes and offsets, whatever the device's own block size.
inline constexpr std::uint64_t kSectorBytes = 512;

struct BlockDevice {
    /// As below /dev, for example "sda" or "cciss/c0d0".
    std::string name;
    Fact<std::uint64_t> sizeSectors;
    Fact<std::uint64_t> logicalBlockBytes;
    Fact<bool> isReadOnly;
    /// Whether the medium can be taken out.
    Fact<bool> isRemovable;
    Fact<bool> isRotational;
};

/// `directory` is the device's own, for example /sys/block/sda.
BlockDevice readBlockDevice(const std::filesystem::path& directory);

/// The name below /dev of what sysfs calls `entry`.
std::string deviceNameOf(std::string_view entry);

/// The entries of a directory of devices in the order of their names; nothing when it cannot be
/// read.
Fact<std::vector<std::string>> listDevices(const std::filesystem::path& directory);

/// A file that holds 0 or 1; anything else is filtered.
Fact<bool> readFlag(const std::filesystem::path& file);

/// A size in sectors as it is; filtered when its bytes need more than 64 bits.
Fact<std::uint64_t> readSectors(const std::filesystem::path& file);

}  // namespace cimomd
