#pragma once

// The single facts that an operating system record takes from tables below /proc and from utmp.

#include <cstdint>
#include <optional>
#include <string_view>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

/// /proc/meminfo, in KB of 1024 bytes.
struct MemoryInfo {
    Fact<std::uint64_t> totalKB;
    Fact<std::uint64_t> freeKB;
    Fact<std::uint64_t> swapTotalKB;
    Fact<std::uint64_t> swapFreeKB;
};
MemoryInfo parseMemoryInfo(std::string_view text);
MemoryInfo readMemoryInfo(const SystemPaths& paths);

/// All memory that the kernel uses, in KB of 1024 bytes.
Fact<std::uint64_t> readTotalMemoryKB(const SystemPaths& paths);

/// The boot time of /proc/stat in seconds since 1970.
std::optional<std::int64_t> parseBootTime(std::string_view text);
Fact<std::int64_t> readBootTime(const SystemPaths& paths);

/// The number of user sessions in the records of a utmp file; an incomplete last record is dropped.
std::uint32_t countSessions(std::string_view bytes);
Fact<std::uint32_t> readSessionCount(const SystemPaths& paths);

}  // namespace cimomd
