#pragma once

// The drives for optical discs: /sys/block/sr* and the kernel's table of their abilities.

#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/storage/BlockDevice.h"
#include "system/storage/CdromInfo.h"
#include "system/storage/DriveIdentity.h"

namespace cimomd {

struct OpticalDrive {
    BlockDevice device;
    DriveIdentity identity;
    Fact<std::string> state;
    /// All without a value when the table does not list the drive.
    CdromAbilities abilities;
};

/// In the order of their names; nothing when /sys/block cannot be read.
Fact<std::vector<OpticalDrive>> readOpticalDrives(const SystemPaths& paths);

}  // namespace cimomd
