#include "providers/software/OperatingSystemProvider.h"

#include <algorithm>
#include <array>
#include <limits>

#include "files/TextFile.h"
#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"
#include "system/software/ProcessTable.h"

namespace cimomd {
namespace {

constexpr std::size_t kVersionLength = 64;

// What is called `family`, or has a name that begins with it and a separator: "sles_sap",
// "opensuse-leap".
struct Distribution {
    std::string_view family;
    std::uint16_t type64;
    std::uint16_t type32;

    bool has(std::string_view id) const {
        return id.substr(0, family.size()) == family &&
               (id.size() == family.size() || id[family.size()] == '-' || id[family.size()] == '_');
    }
};

constexpr std::array<Distribution, 11> kDistributions{{{"debian", 96, 95},
                                                       {"ubuntu", 94, 93},
                                                       {"rhel", 80, 79},
                                                       {"centos", 107, 106},
                                                       {"ol", 109, 108},
                                                       {"sles", 85, 84},
                                                       {"suse", 83, 82},
                                                       {"opensuse", 83, 82},
                                                       {"sled", 83, 82},
                                                       {"sle", 83, 82},
                                                       {"sl-micro", 83, 82}}};
constexpr Distribution kOtherLinux{"", 101, 36};

/// Almost all machines with addresses of 64 bits have the number in the name that uname gives.
bool is64Bit(std::string_view machine) {
    return machine.find("64") != std::string_view::npos || machine == "s390x" || machine == "alpha";
}

Fact<Pegasus::CIMDateTime> bootTimeOf(const OperatingSystemFacts& facts) {
    return facts.bootTime.then(
        [&](std::int64_t time) { return cimTimeOf(time, facts.utcOffsetAtBootMinutes); });
}

/// The readers' numbers have fixed widths, the client library's types others of the same size.
template <typename To, typename From>
Fact<To> as(const Fact<From>& value) {
    return value.then([](From number) { return std::optional(static_cast<To>(number)); });
}

Fact<std::uint64_t> sumOf(const Fact<std::uint64_t>& a, const Fact<std::uint64_t>& b) {
    if (!b)
        return b.reason();
    return a.then([&](std::uint64_t size) {
        return size > std::numeric_limits<std::uint64_t>::max() - *b ? std::nullopt
                                                                     : std::optional(size + *b);
    });
}

Fact<Pegasus::Uint32> inMB(const Fact<std::uint64_t>& sizeKB) {
    constexpr std::uint64_t kKBPerMB = 1024;
    return sizeKB.then([](std::uint64_t size) { return narrowedToCount(size / kKBPerMB); });
}

Fact<std::uint32_t> readProcessCount(const SystemPaths& paths) {
    return listProcesses(paths.processes()).then([](const std::vector<std::uint64_t>& ids) {
        return std::optional(static_cast<std::uint32_t>(ids.size()));
    });
}

void addMemory(InstanceBuilder& builder, const MemoryInfo& memory) {
    using Pegasus::Uint32;
    using Pegasus::Uint64;
    builder.value<Uint64>("TotalSwapSpaceSize", as<Uint64>(memory.swapTotalKB))
        .value<Uint64>("TotalVirtualMemorySize",
                       as<Uint64>(sumOf(memory.totalKB, memory.swapTotalKB)))
        .value<Uint64>("FreeVirtualMemory", as<Uint64>(sumOf(memory.freeKB, memory.swapFreeKB)))
        .value<Uint64>("TotalVisibleMemorySize", as<Uint64>(memory.totalKB))
        .value<Uint64>("FreePhysicalMemory", as<Uint64>(memory.freeKB))
        .value<Uint32>("TotalSwapSpaceSizeMB", inMB(memory.swapTotalKB))
        .value<Uint32>("TotalVisibleMemorySizeMB", inMB(memory.totalKB))
        .value<Uint32>("FreePhysicalMemoryMB", inMB(memory.freeKB));
}

}  // namespace

std::unique_ptr<InstanceStream> OperatingSystemProvider::enumerate() const {
    return std::make_unique<RecordStream<OperatingSystemFacts>>(
        std::vector<OperatingSystemFacts>{read()}, publish);
}

OperatingSystemFacts OperatingSystemProvider::read() const {
    OperatingSystemFacts facts;
    facts.hostName = readHostName(paths);
    facts.release = readOsRelease(paths);
    facts.kernelRelease = readFact(paths.kernelRelease());
    facts.machine = readFact(paths.architecture());
    if (!facts.machine)
        facts.machine = calls.machine();
    facts.memory = readMemoryInfo(paths);
    facts.bootTime = readBootTime(paths);
    facts.now = calls.now();
    facts.utcOffsetMinutes = calls.utcOffsetMinutes(facts.now);
    facts.utcOffsetAtBootMinutes = calls.utcOffsetMinutes(facts.bootTime.value_or(facts.now));
    facts.processes = readProcessCount(paths);
    facts.sessions = readSessionCount(paths);
    return facts;
}

std::optional<std::uint16_t> OperatingSystemProvider::osTypeOf(
    const std::optional<std::string>& id, const std::optional<std::string>& machine) {
    if (!machine)
        return std::nullopt;
    const auto known =
        std::find_if(kDistributions.begin(), kDistributions.end(),
                     [&id](const Distribution& entry) { return id && entry.has(*id); });
    const Distribution& distribution = known == kDistributions.end() ? kOtherLinux : *known;
    return is64Bit(*machine) ? distribution.type64 : distribution.type32;
}

ProvidedInstance OperatingSystemProvider::publish(const OperatingSystemFacts& facts) {
    const std::string name = nameOf(facts.release);
    const std::string title = facts.release.prettyName.value_or(name);
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .key("Name", name, kSystemNameLength)
        .values<Pegasus::Uint16>("OperationalStatus", {kOperationalOk})
        .value<Pegasus::Uint16>("EnabledState", kEnabled)
        .text("CSCreationClassName", kComputerSystemClass)
        .text("CSName", facts.hostName, kSystemNameLength)
        .text("CreationClassName", kClassName)
        .enumerated("OSType", osTypeOf(facts.release.id, facts.machine))
        .text("Version", facts.release.versionId)
        .value<Pegasus::CIMDateTime>("LastBootUpTime", bootTimeOf(facts))
        .value<Pegasus::CIMDateTime>("LocalDateTime", cimTimeOf(facts.now, facts.utcOffsetMinutes))
        .value<Pegasus::Sint16>("CurrentTimeZone",
                                static_cast<Pegasus::Sint16>(facts.utcOffsetMinutes))
        .value<Pegasus::Uint32>("NumberOfUsers", as<Pegasus::Uint32>(facts.sessions))
        .value<Pegasus::Uint32>("NumberOfProcesses", as<Pegasus::Uint32>(facts.processes))
        .text("DistributionId", facts.release.id, kVersionLength)
        .text("KernelRelease", facts.kernelRelease, kVersionLength)
        .text("Architecture", facts.machine, kVersionLength);
    addMemory(builder, facts.memory);
    return builder.take();
}

}  // namespace cimomd
