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
    std::optional<std::uint64_t> totalKB;
    std::optional<std::uint64_t> freeKB;
    std::optional<std::uint64_t> swapTotalKB;
};
MemoryInfo parseMemoryInfo(std::string_view text);

/// All memory that the kernel uses, in KB of 1024 bytes.
Fact<std::uint64_t> readTotalMemoryKB(const SystemPaths& paths);

/// The boot time of /proc/stat in seconds since 1970.
std::optional<std::int64_t> parseBootTime(std::string_view text);

/// The number of user sessions in the records of a utmp file; an incomplete last record is dropped.
std::uint32_t countSessions(std::string_view bytes);

}  // namespace cimomd
