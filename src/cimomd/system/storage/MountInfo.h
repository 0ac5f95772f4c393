#pragma once

// /proc/self/mountinfo: what is mounted where.

#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

struct Mount {
    /// major:minor of the file system; the same for all mounts of one file system.
    std::string device;
    /// The directory of the file system that is mounted; "/" unless this is a bind mount.
    std::string fileSystemRoot;
    std::string mountPoint;
    std::string type;
    std::string source;
    bool readOnly = false;
};

/// All lines that are complete, in their order; paths with their escapes resolved.
std::vector<Mount> parseMountInfo(std::string_view text);

/// The mounts of local file systems, one for each file system: the first that is no bind mount,
/// else the first. What another mount hides, kernel file systems, layers, network and FUSE file
/// systems are left out, so are the temporary ones in the system's own directories.
std::vector<Mount> localFileSystems(const std::vector<Mount>& mounts);

}  // namespace cimomd
