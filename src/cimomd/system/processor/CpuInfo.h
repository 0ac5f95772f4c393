#pragma once

// /proc/cpuinfo: one block of keys for each logical processor. The keys differ from architecture to
// architecture, so everything is optional.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

struct CpuInfo {
    std::uint64_t processor = 0;
    std::optional<std::string> vendor;
    std::optional<std::string> model;
    std::optional<std::string> stepping;
    std::optional<double> currentMHz;
    std::optional<std::int64_t> packageId;
    std::optional<std::int64_t> coreId;
    /// Width of the general registers in bits.
    std::optional<std::uint16_t> width;
};

/// The blocks that name a processor number, in the order of the text. A processor without a model
/// name (ARM) is named after its implementer and part numbers.
std::vector<CpuInfo> parseCpuInfo(std::string_view text);

}  // namespace cimomd
