#pragma once

// The partitions among the block devices of /sys/class/block.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

enum class PartitionKind {
    Primary,
    /// Holds the logical ones of a DOS partition table.
    Extended,
    Logical
};

struct Partition {
    /// As below /dev.
    std::string name;
    /// The name of the disk it is on; nothing when no device has that name.
    Fact<std::string> disk;
    std::uint64_t number = 0;
    /// In units of kSectorBytes.
    Fact<std::uint64_t> startSectors;
    Fact<std::uint64_t> sizeSectors;
    Fact<bool> isReadOnly;
    PartitionKind kind = PartitionKind::Primary;
};

/// In the order of their names; nothing when /sys/class/block cannot be read.
Fact<std::vector<Partition>> readPartitions(const SystemPaths& paths);

}  // namespace cimomd
