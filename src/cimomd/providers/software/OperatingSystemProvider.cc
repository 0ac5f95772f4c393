#include "providers/software/OperatingSystemProvider.h"

#include <algorithm>
#include <array>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxTableBytes = std::size_t{4} << 20;
constexpr std::size_t kVersionLength = 64;

struct Distribution {
    std::string_view id;
    std::uint16_t type64;
    std::uint16_t type32;
};

constexpr std::array<Distribution, 11> kDistributions{{
    {"debian", 96, 95},
    {"ubuntu", 94, 93},
    {"rhel", 80, 79},
    {"centos", 107, 106},
    {"ol", 109, 108},
    {"sles", 85, 84},
    {"suse", 83, 82},
    {"opensuse", 83, 82},
    {"opensuse-leap", 83, 82},
    {"opensuse-tumbleweed", 83, 82},
    {"sled", 83, 82},
}};
constexpr Distribution kOtherLinux{"", 101, 36};

constexpr std::array<std::string_view, 7> kMachines64{"x86_64", "aarch64", "ppc64", "ppc64le",
                                                      "s390x",  "riscv64", "mips64"};

bool is64Bit(std::string_view machine) {
    return std::find(kMachines64.begin(), kMachines64.end(), machine) != kMachines64.end();
}

bool isProcessDirectory(const std::string& name) {
    return parseUnsigned(name).has_value();
}

std::optional<std::uint32_t> countProcesses(const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return std::nullopt;
    return static_cast<std::uint32_t>(
        std::count_if(names->begin(), names->end(), isProcessDirectory));
}

std::optional<Pegasus::CIMDateTime> bootTimeOf(const OperatingSystemFacts& facts) {
    return facts.bootTime ? cimTimeOf(*facts.bootTime, facts.utcOffsetAtBootMinutes) : std::nullopt;
}

/// The readers' numbers have fixed widths, the client library's types others of the same size.
template <typename To, typename From>
std::optional<To> as(const std::optional<From>& value) {
    return value ? std::optional<To>(static_cast<To>(*value)) : std::nullopt;
}

}  // namespace

std::unique_ptr<InstanceStream> OperatingSystemProvider::enumerate() const {
    return std::make_unique<RecordStream<OperatingSystemFacts>>(
        std::vector<OperatingSystemFacts>{read()}, publish);
}

OperatingSystemFacts OperatingSystemProvider::read() const {
    OperatingSystemFacts facts;
    facts.hostName = readHostName(paths);
    auto release = readText(paths.osRelease());
    if (!release)
        release = readText(paths.vendorOsRelease());
    facts.release = parseOsRelease(release.value_or(""));
    facts.kernelRelease = readFact(paths.kernelRelease());
    facts.machine = readFact(paths.architecture());
    if (!facts.machine)
        facts.machine = calls.machine();
    facts.memory = parseMemoryInfo(readText(paths.memory()).value_or(""));
    facts.bootTime = parseBootTime(readText(paths.kernelStatistics(), kMaxTableBytes).value_or(""));
    facts.now = calls.now();
    facts.utcOffsetMinutes = calls.utcOffsetMinutes(facts.now);
    facts.utcOffsetAtBootMinutes = calls.utcOffsetMinutes(facts.bootTime.value_or(facts.now));
    facts.processes = countProcesses(paths.processes());
    if (const auto sessions = readText(paths.sessions(), kMaxTableBytes))
        facts.sessions = countSessions(*sessions);
    return facts;
}

std::optional<std::uint16_t> OperatingSystemProvider::osTypeOf(
    const std::optional<std::string>& id, const std::optional<std::string>& machine) {
    if (!machine)
        return std::nullopt;
    const auto known = std::find_if(kDistributions.begin(), kDistributions.end(),
                                    [&id](const Distribution& entry) { return entry.id == id; });
    const Distribution& distribution = known == kDistributions.end() ? kOtherLinux : *known;
    return is64Bit(*machine) ? distribution.type64 : distribution.type32;
}

ProvidedInstance OperatingSystemProvider::publish(const OperatingSystemFacts& facts) {
    const std::string name = facts.release.name.value_or("Linux");
    const std::string title = facts.release.prettyName.value_or(name);
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .key("Name", name, kSystemNameLength)
        .values<Pegasus::Uint16>("OperationalStatus", {kOperationalOk})
        .value<Pegasus::Uint16>("EnabledState", kEnabled)
        .text("CSCreationClassName", kComputerSystemClass)
        .text("CSName", facts.hostName, kSystemNameLength)
        .text("CreationClassName", kClassName)
        .value<Pegasus::Uint16>("OSType", osTypeOf(facts.release.id, facts.machine))
        .text("Version", facts.release.versionId)
        .value<Pegasus::CIMDateTime>("LastBootUpTime", bootTimeOf(facts))
        .value<Pegasus::CIMDateTime>("LocalDateTime", cimTimeOf(facts.now, facts.utcOffsetMinutes))
        .value<Pegasus::Sint16>("CurrentTimeZone",
                                static_cast<Pegasus::Sint16>(facts.utcOffsetMinutes))
        .value<Pegasus::Uint32>("NumberOfUsers", as<Pegasus::Uint32>(facts.sessions))
        .value<Pegasus::Uint32>("NumberOfProcesses", as<Pegasus::Uint32>(facts.processes))
        .value<Pegasus::Uint64>("TotalSwapSpaceSize", as<Pegasus::Uint64>(facts.memory.swapTotalKB))
        .value<Pegasus::Uint64>("TotalVisibleMemorySize", as<Pegasus::Uint64>(facts.memory.totalKB))
        .value<Pegasus::Uint64>("FreePhysicalMemory", as<Pegasus::Uint64>(facts.memory.freeKB))
        .text("DistributionId", facts.release.id, kVersionLength)
        .text("KernelRelease", facts.kernelRelease, kVersionLength)
        .text("Architecture", facts.machine, kVersionLength);
    return builder.take();
}

}  // namespace cimomd
