#include "system/processor/LogicalProcessor.h"

#include <algorithm>

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

std::optional<std::uint64_t> processorNumber(std::string_view name) {
    if (name.substr(0, 3) != "cpu")
        return std::nullopt;
    return parseUnsigned(name.substr(3));
}

LogicalProcessor read(const std::filesystem::path& directory, std::uint64_t number) {
    const std::filesystem::path topology = directory / "topology";
    LogicalProcessor out;
    out.number = number;
    out.packageId = readSignedNumber(topology / "physical_package_id");
    out.dieId = readSignedNumber(topology / "die_id");
    out.clusterId = readSignedNumber(topology / "cluster_id");
    out.coreId = readSignedNumber(topology / "core_id");
    out.maxKHz = readNumber(directory / "cpufreq" / "cpuinfo_max_freq");
    return out;
}

}  // namespace

std::vector<LogicalProcessor> readLogicalProcessors(const std::filesystem::path& directory) {
    std::vector<LogicalProcessor> out;
    const auto names = listDirectory(directory);
    if (!names)
        return out;
    for (const std::string& name : *names) {
        if (const auto number = processorNumber(name))
            out.push_back(read(directory / name, *number));
    }
    std::sort(out.begin(), out.end(),
              [](const auto& a, const auto& b) { return a.number < b.number; });
    return out;
}

}  // namespace cimomd
