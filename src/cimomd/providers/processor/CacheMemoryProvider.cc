#include "providers/processor/CacheMemoryProvider.h"

#include <fmt/format.h>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr Uint64 kBytesPerKB = 1024;

// CIM_StorageExtent.ExtentStatus
constexpr Uint16 kNoExtentStatus = 2;

// CIM_CacheMemory: what all of its numbered lists have.
constexpr Uint16 kOther = 1;

Uint16 levelOf(std::uint64_t level) {
    constexpr Uint16 kPrimary = 3;
    constexpr std::uint64_t kLastNamed = 3;
    return level <= kLastNamed ? static_cast<Uint16>(kPrimary + level - 1) : kOther;
}

Uint16 typeOf(const std::string& type) {
    if (type == "Instruction")
        return 3;
    if (type == "Data")
        return 4;
    return type == "Unified" ? 5 : kOther;
}

Uint16 writePolicyOf(const std::string& policy) {
    if (policy == "WriteBack")
        return 2;
    return policy == "WriteThrough" ? 3 : kOther;
}

/// One set holds everything: the cache is fully associative, whatever the number of ways.
Fact<Uint16> associativityOf(const ProcessorCache& cache) {
    constexpr Uint16 kFully = 5;
    if (cache.sets == std::uint64_t{1} && cache.ways.value_or(0) > 1)
        return kFully;
    return cache.ways.then([](std::uint64_t ways) -> Uint16 {
        switch (ways) {
            case 1:
                return 2;
            case 2:
                return 3;
            case 4:
                return 4;
            case 8:
                return 6;
            case 16:
                return 7;
            default:
                return kOther;
        }
    });
}

/// As in "L1d" and "L2": the level, and what the cache is for when there are two of a level.
std::string shortNameOf(const ProcessorCache& cache) {
    const char* suffix = "";
    if (cache.type == "Data")
        suffix = "d";
    else if (cache.type == "Instruction")
        suffix = "i";
    return fmt::format("L{}{}", cache.level, suffix);
}

}  // namespace

std::unique_ptr<InstanceStream> CacheMemoryProvider::enumerate() const {
    auto caches = readProcessorCaches(paths.logicalProcessors());
    if (!caches)
        return std::make_unique<EmptyStream>(caches.reason());
    return std::make_unique<RecordStream<ProcessorCache>>(
        *caches, [hostName = readHostName(paths)](const ProcessorCache& cache) {
            return publish(hostName, cache);
        });
}

ProvidedInstance CacheMemoryProvider::publish(const std::string& hostName,
                                              const ProcessorCache& cache) {
    const auto narrow = narrowedToCount<std::uint64_t>;
    const std::string deviceId = fmt::format("{}-{}", shortNameOf(cache), cache.firstProcessor);
    InstanceBuilder builder(kClassName);
    builder.label(fmt::format("{} cache of processor {}", shortNameOf(cache), cache.firstProcessor))
        .text("Name", deviceId)
        .values<Uint16>("OperationalStatus", {kOperationalOk})
        .value<Uint16>("EnabledState", kEnabled)
        .deviceKeys(hostName, deviceId)
        .value<Uint64>("BlockSize", kBytesPerKB)
        .value<Uint64>("NumberOfBlocks", cache.sizeKB)
        .values<Uint16>("ExtentStatus", {kNoExtentStatus})
        .value<Uint16>("NameFormat", Absence::Absent)
        .value<Pegasus::Boolean>("Volatile", true)
        .value<Uint16>("Level", levelOf(cache.level))
        .value<Uint16>("WritePolicy", cache.writePolicy.then(writePolicyOf))
        .enumerated("CacheType", cache.type.then(typeOf))
        .value<Uint32>("LineSize", cache.lineBytes.then(narrow))
        .value<Uint16>("Associativity", associativityOf(cache))
        .value<Uint32>("SizeKB", cache.sizeKB.then(narrow))
        .value<Uint16>("LevelNumber", narrowedTo<Uint16>(cache.level))
        .value<Uint32>("Ways", cache.ways.then(narrow))
        .text("SharedBy", cache.sharedBy);
    return builder.take();
}

}  // namespace cimomd
