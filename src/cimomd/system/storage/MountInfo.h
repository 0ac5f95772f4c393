#pragma once

// /proc/self/mountinfo: what is mounted where.

#include <string>
#include <string_view>
#include <vector>

#include "system/storage/MountOptions.h"

namespace cimomd {

struct Mount {
    /// What tells the mount from others, and the one whose directory it is mounted on.
    std::string id;
    std::string parentId;
    /// major:minor of the file system; the same for all mounts of one file system.
    std::string device;
    /// The directory of the file system that is mounted; "/" unless this is a bind mount.
    std::string fileSystemRoot;
    std::string mountPoint;
    std::string type;
    std::string source;
    /// Whether the file system is, not only this mount of it.
    bool readOnly = false;
    /// Those of the file system, as opposed to those of this mount.
    MountOptions fileSystemOptions;
};

/// All lines that are complete, in their order; paths with their escapes resolved.
std::vector<Mount> parseMountInfo(std::string_view text);

}  // namespace cimomd
