#pragma once

// The mounted file systems that an inventory lists.

#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"
#include "system/storage/FileSystemKind.h"
#include "system/storage/MountInfo.h"

namespace cimomd {

struct MountedFileSystem {
    Mount mount;
    /// Whether the way to it leads through something that may never answer, or ends there.
    bool mayWait = false;
};

/// The file systems of `kind`, each once: its mount with the shortest path that is no bind mount,
/// else the shortest of all. What another mount hides is left out, so are temporary file systems in
/// the system's own directories, and what systemd makes directories inaccessible with.
std::vector<MountedFileSystem> mountedFileSystems(const std::vector<Mount>& mounts,
                                                  FileSystemKind kind);

/// Never waits for long, whatever the file system does.
Fact<FileSystemSize> sizeOf(const MountedFileSystem& fileSystem, const SystemCalls& calls);

}  // namespace cimomd
