#pragma once

// Who made a drive, and which one it is. Every kind of drive tells that in files of its own; where
// they say nothing, udev may have asked the drive itself.

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

#include "system/Fact.h"
#include "system/storage/UdevRecord.h"

namespace cimomd {

struct DriveIdentity {
    Fact<std::string> vendor;
    Fact<std::string> model;
    Fact<std::string> serial;
    Fact<std::string> firmware;
    /// A number no other drive in the world has, for example "naa.5000c500a1b2c3d4".
    Fact<std::string> worldWideId;
};

/// `directory` is the block device's own, for example /sys/block/sda.
DriveIdentity readDriveIdentity(const std::filesystem::path& directory, const UdevRecord& udev);

/// The serial number in the SCSI page 0x80 (SPC, unit serial number); nothing when the page is
/// broken or holds none.
std::optional<std::string> parseSerialPage(std::string_view bytes);

}  // namespace cimomd
