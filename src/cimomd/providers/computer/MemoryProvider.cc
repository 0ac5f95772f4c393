#include "providers/computer/MemoryProvider.h"

#include <algorithm>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/Megabytes.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"
#include "system/software/KernelTables.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr Uint64 kBlockBytes = 1024;
constexpr Uint16 kNoExtentStatus = 2;

Fact<std::vector<MemoryDevice>> readMemoryDevices(const SystemPaths& paths) {
    return readSmbiosTable(paths).then(
        [](const SmbiosTable& table) { return memoryDevicesOf(table); });
}

Fact<Uint32> mainMemoryModules(const Fact<std::vector<MemoryDevice>>& devices) {
    return devices.then([](const std::vector<MemoryDevice>& found) {
        return static_cast<Uint32>(
            std::count_if(found.begin(), found.end(),
                          [](const MemoryDevice& device) { return device.isMainMemory; }));
    });
}

/// The modules' capacities in all, as the firmware says.
Fact<std::uint64_t> capacityOf(const Fact<std::vector<MemoryDevice>>& devices) {
    return devices ? totalCapacityBytes(*devices) : devices.reason();
}

}  // namespace

std::unique_ptr<InstanceStream> MemoryProvider::enumerate() const {
    const Fact<std::uint64_t> totalKB = readTotalMemoryKB(paths);
    if (!totalKB)
        return std::make_unique<EmptyStream>(totalKB.reason());
    const std::string hostName = readHostName(paths);
    const Fact<std::vector<MemoryDevice>> devices = readMemoryDevices(paths);
    return std::make_unique<RecordStream<std::uint64_t>>(
        std::vector<std::uint64_t>{*totalKB},
        [hostName, devices](std::uint64_t total) { return publish(hostName, total, devices); });
}

ProvidedInstance MemoryProvider::publish(const std::string& hostName, std::uint64_t totalKB,
                                         const Fact<std::vector<MemoryDevice>>& devices) {
    const Fact<std::uint64_t> capacity = capacityOf(devices);
    const auto usesMore = [totalKB](std::uint64_t bytes) { return totalKB > bytes / kBlockBytes; };
    const auto unlessShort = [&usesMore](std::uint64_t bytes) {
        return usesMore(bytes) ? std::nullopt : std::optional(bytes);
    };
    InstanceBuilder builder(kClassName);
    builder.label("Main memory")
        .deviceKeys(hostName, "Memory")
        .text("Name", "Main memory")
        .values<Uint16>("OperationalStatus", {kOperationalOk})
        .value<Uint16>("EnabledState", kEnabled)
        .value<Uint64>("BlockSize", kBlockBytes)
        .value<Uint64>("NumberOfBlocks", totalKB)
        .values<Uint16>("ExtentStatus", {kNoExtentStatus})
        .value<Uint16>("NameFormat", Absence::Absent)
        .value<Pegasus::Boolean>("Volatile", true)
        .value<Uint32>("TotalMB", megabytesOf(memoryOfKernel(totalKB).capacityBytes))
        .value<Uint32>("ModulesMB", megabytesOf(capacity.then(unlessShort)))
        .value<Uint32>("NumberOfModules", mainMemoryModules(devices))
        .value<Pegasus::Boolean>("FirmwareTablesShort", capacity.then(usesMore));
    return builder.take();
}

}  // namespace cimomd
