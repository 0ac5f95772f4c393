#pragma once

// On which server a remote file system lies.

#include <string>

#include "system/Fact.h"
#include "system/storage/MountInfo.h"

namespace cimomd {

/// The server in the mount's source: "server:/directory", "[address]:/directory", "//server/share"
/// or "user@server:directory"; nothing when the source is written in another way.
Fact<std::string> serverNameOf(const Mount& mount);

}  // namespace cimomd
