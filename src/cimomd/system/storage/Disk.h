#pragma once

// The disks among the block devices of /sys/block: what keeps data of its own and is not made of
// other block devices.

#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/storage/BlockDevice.h"
#include "system/storage/DriveIdentity.h"

namespace cimomd {

struct Disk {
    BlockDevice device;
    DriveIdentity identity;
    /// As the driver puts it, for example "running" or "live".
    Fact<std::string> state;
};

/// In the order of their names; nothing when /sys/block cannot be read. Loop devices, memory,
/// volumes, optical and floppy drives, network block devices without a server, boot areas of
/// memory cards and hidden paths of NVMe are no disks.
Fact<std::vector<Disk>> readDisks(const SystemPaths& paths);

}  // namespace cimomd
