#pragma once

// /sys/devices/system/cpu/cpu*/cache: the caches between processors and memory.

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct ProcessorCache {
    /// The lowest number of the logical processors that share it.
    std::uint64_t firstProcessor = 0;
    std::uint64_t level = 0;
    /// "Data", "Instruction" or "Unified".
    Fact<std::string> type;
    Fact<std::uint64_t> sizeKB;
    Fact<std::uint64_t> lineBytes;
    Fact<std::uint64_t> ways;
    Fact<std::uint64_t> sets;
    /// "WriteBack" or "WriteThrough"; few architectures tell.
    Fact<std::string> writePolicy;
    /// The logical processors that share it, as the kernel writes lists.
    Fact<std::string> sharedBy;
};

/// "32K", "2048K" or "16M" in units of 1,024 bytes; nothing from anything else, and from 0.
std::optional<std::uint64_t> parseCacheSize(std::string_view text);

/// Each cache once, in the order of the processors, then of the kernel's numbers; missing for the
/// reason that the directory cannot be read.
Fact<std::vector<ProcessorCache>> readProcessorCaches(const std::filesystem::path& processors);

}  // namespace cimomd
