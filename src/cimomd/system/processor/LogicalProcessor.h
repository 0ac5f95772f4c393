#pragma once

// /sys/devices/system/cpu: which logical processors there are and where they sit.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <vector>

namespace cimomd {

/// A processor that is off line shows no topology: the ids are nothing then.
struct LogicalProcessor {
    std::uint64_t number = 0;
    /// May be -1, where the kernel does not know.
    std::optional<std::int64_t> packageId;
    std::optional<std::int64_t> dieId;
    std::optional<std::int64_t> clusterId;
    std::optional<std::int64_t> coreId;
    std::optional<std::uint64_t> maxKHz;
};

/// In ascending order of the number; empty when the directory cannot be read.
std::vector<LogicalProcessor> readLogicalProcessors(const std::filesystem::path& directory);

}  // namespace cimomd
