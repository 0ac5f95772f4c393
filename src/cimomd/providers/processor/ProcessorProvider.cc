#include "providers/processor/ProcessorProvider.h"

#include <fmt/format.h>

#include "files/TextFile.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

// A line of flags takes more than a kilobyte, and there are machines with thousands of threads.
constexpr std::size_t kMaxCpuInfoBytes = std::size_t{64} << 20;

// CIM_Processor.Family when only a name is known, and CIM_Processor.CPUStatus.
constexpr std::uint16_t kFamilyOther = 1;
constexpr std::uint16_t kCpuEnabled = 1;
constexpr std::size_t kFamilyTextLength = 64;

}  // namespace

std::unique_ptr<InstanceStream> ProcessorProvider::enumerate() const {
    const auto text = readText(paths.processors(), kMaxCpuInfoBytes);
    std::vector<LogicalProcessor> processors = readLogicalProcessors(paths.logicalProcessors());
    if (!text && processors.empty())
        throw ProviderError("neither the processor topology nor /proc/cpuinfo can be read");
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<ProcessorPackage>>(
        groupByPackage(std::move(processors), parseCpuInfo(text.value_or(""))),
        [hostName](const ProcessorPackage& package) { return publish(hostName, package); });
}

ProvidedInstance ProcessorProvider::publish(const std::string& hostName,
                                            const ProcessorPackage& package) {
    const std::string deviceId = fmt::format("CPU{}", package.number);
    const auto family = package.model ? std::optional<Pegasus::Uint16>(kFamilyOther) : std::nullopt;
    InstanceBuilder builder(kClassName);
    builder.label(package.model.value_or(deviceId))
        .text("Name", deviceId)
        .values<Pegasus::Uint16>("OperationalStatus", {kOperationalOk})
        .value<Pegasus::Uint16>("EnabledState", kEnabled)
        .deviceKeys(hostName, deviceId)
        .value<Pegasus::Uint16>("Family", family)
        .text("OtherFamilyDescription", package.model, kFamilyTextLength)
        .value<Pegasus::Uint32>("MaxClockSpeed", package.maxMHz)
        .value<Pegasus::Uint32>("CurrentClockSpeed", package.currentMHz)
        .value<Pegasus::Uint16>("DataWidth", package.width)
        .value<Pegasus::Uint16>("AddressWidth", package.width)
        .text("Stepping", package.stepping)
        .value<Pegasus::Uint16>("CPUStatus", kCpuEnabled)
        .value<Pegasus::Uint16>("NumberOfEnabledCores", package.cores)
        .text("Manufacturer", package.vendor)
        .text("Model", package.model)
        .value<Pegasus::Uint16>("NumberOfEnabledThreads", package.threads);
    return builder.take();
}

}  // namespace cimomd
