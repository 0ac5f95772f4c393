#pragma once

// What the mount table tells about an NFS mount, see nfs(5). The kernel leaves out most options
// that have their usual value.

#include <cstdint>
#include <string>

#include "system/Fact.h"
#include "system/storage/MountOptions.h"

namespace cimomd {

struct NfsOptions {
    /// For example "4.2".
    Fact<std::string> version;
    /// For example "tcp".
    Fact<std::string> protocol;
    /// Whether a server that is away is waited for without end.
    Fact<bool> isHard;
    Fact<std::uint16_t> retransmissions;
    /// In tenths of seconds.
    Fact<std::uint32_t> timeoutTenths;
    Fact<std::uint64_t> readBytes;
    Fact<std::uint64_t> writeBytes;
    Fact<std::uint32_t> port;
    bool cachesAttributes = true;
    Fact<std::uint16_t> fileCacheMinSeconds;
    Fact<std::uint16_t> fileCacheMaxSeconds;
    Fact<std::uint16_t> directoryCacheMinSeconds;
    Fact<std::uint16_t> directoryCacheMaxSeconds;
};

NfsOptions nfsOptionsOf(const MountOptions& options);

}  // namespace cimomd
