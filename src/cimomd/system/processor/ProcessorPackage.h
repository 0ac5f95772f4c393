#pragma once

// What is plugged into one processor socket, put together from the logical processors on it.

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "system/processor/CpuInfo.h"
#include "system/processor/LogicalProcessor.h"

namespace cimomd {

struct ProcessorPackage {
    /// The kernel's package number; a package the kernel does not number is 0.
    std::int64_t number = 0;
    std::optional<std::string> vendor;
    std::optional<std::string> model;
    std::optional<std::string> stepping;
    std::optional<std::uint32_t> maxMHz;
    std::optional<std::uint32_t> currentMHz;
    std::optional<std::uint16_t> width;
    /// Cores and threads that are on line.
    std::optional<std::uint16_t> cores;
    std::uint16_t threads = 0;
};

/// One package per number, ascending. Processors that are off line count nowhere. When `processors`
/// tell no ids at all, as in kernels without topology, those of `infos` are taken.
std::vector<ProcessorPackage> groupByPackage(std::vector<LogicalProcessor> processors,
                                             const std::vector<CpuInfo>& infos);

}  // namespace cimomd
