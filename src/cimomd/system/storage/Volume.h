#pragma once

// Block devices that are made of others: the device mapper's (LVM, encryption, multipath) and
// software RAID.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/storage/BlockDevice.h"

namespace cimomd {

/// Facts of software RAID only; without a value for the device mapper's volumes.
struct RaidState {
    /// For example "raid1" or "linear".
    Fact<std::string> level;
    /// For example "clean" or "inactive".
    Fact<std::string> arrayState;
    /// For example "idle" or "recover"; levels without redundancy have none.
    Fact<std::string> syncAction;
    Fact<std::uint64_t> disks;
    /// How many of the disks are missing or failed.
    Fact<std::uint64_t> missingDisks;
};

struct Volume {
    /// Without a size while it is not running.
    BlockDevice device;
    bool isRaid = false;
    /// The name and the identity that the device mapper knows it by; for example "vg-root" and
    /// "LVM-0FQJ...". Of software RAID the identity only, if at all.
    Fact<std::string> mapperName;
    Fact<std::string> uuid;
    /// Whether the device mapper holds its input and output back.
    Fact<bool> isSuspended;
    /// The names of the devices it is made of, in the order of their names.
    Fact<std::vector<std::string>> members;
    RaidState raid;
};

/// In the order of their names; nothing when /sys/block cannot be read.
Fact<std::vector<Volume>> readVolumes(const SystemPaths& paths);

}  // namespace cimomd
