#include "system/processor/ProcessorPackage.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <map>
#include <set>
#include <tuple>

namespace cimomd {
namespace {

using CoreKey = std::tuple<std::int64_t, std::int64_t, std::int64_t>;

/// A package with what is only needed while it is put together.
struct Draft {
    ProcessorPackage package;
    std::set<CoreKey> cores;
};

template <typename T>
void raise(std::optional<T>& highest, T value) {
    highest = highest ? std::max(*highest, value) : value;
}

std::uint16_t clamped(std::size_t count) {
    return static_cast<std::uint16_t>(
        std::min<std::size_t>(count, std::numeric_limits<std::uint16_t>::max()));
}

bool haveTopology(const std::vector<LogicalProcessor>& processors) {
    return std::any_of(processors.begin(), processors.end(), [](const LogicalProcessor& processor) {
        return processor.packageId.has_value();
    });
}

/// The processors of `infos` with their ids from there, the rest from `known`.
std::vector<LogicalProcessor> fromInfos(const std::vector<CpuInfo>& infos,
                                        const std::vector<LogicalProcessor>& known) {
    std::map<std::uint64_t, LogicalProcessor> byNumber;
    for (const LogicalProcessor& processor : known)
        byNumber.emplace(processor.number, processor);
    std::vector<LogicalProcessor> out;
    for (const CpuInfo& info : infos) {
        LogicalProcessor processor = byNumber[info.processor];
        processor.number = info.processor;
        processor.packageId = info.packageId.value_or(0);
        processor.coreId = info.coreId;
        out.push_back(processor);
    }
    return out;
}

/// Core numbers are only unique within their die and cluster.
CoreKey coreKey(const LogicalProcessor& processor) {
    return {processor.dieId.value_or(-1), processor.clusterId.value_or(-1), *processor.coreId};
}

void add(const LogicalProcessor& processor, Draft& draft) {
    draft.package.threads = clamped(std::size_t{draft.package.threads} + 1);
    if (processor.coreId)
        draft.cores.insert(coreKey(processor));
    constexpr std::uint64_t kMaxKHz = std::uint64_t{std::numeric_limits<std::uint32_t>::max()};
    if (processor.maxKHz && *processor.maxKHz > 0 && *processor.maxKHz <= kMaxKHz)
        raise(draft.package.maxMHz, static_cast<std::uint32_t>(*processor.maxKHz / 1000));
}

void add(const CpuInfo& info, ProcessorPackage& package) {
    const auto keepFirst = [](auto& known, const auto& value) {
        if (!known)
            known = value;
    };
    keepFirst(package.vendor, info.vendor);
    keepFirst(package.model, info.model);
    keepFirst(package.stepping, info.stepping);
    keepFirst(package.width, info.width);
    if (info.currentMHz)
        raise(package.currentMHz, static_cast<std::uint32_t>(std::lround(*info.currentMHz)));
}

}  // namespace

std::vector<ProcessorPackage> groupByPackage(std::vector<LogicalProcessor> processors,
                                             const std::vector<CpuInfo>& infos) {
    if (!haveTopology(processors))
        processors = fromInfos(infos, processors);
    std::map<std::uint64_t, const CpuInfo*> infoOf;
    for (const CpuInfo& info : infos)
        infoOf.emplace(info.processor, &info);
    std::map<std::int64_t, Draft> drafts;
    for (const LogicalProcessor& processor : processors) {
        if (!processor.packageId)
            continue;
        const std::int64_t number = std::max<std::int64_t>(0, *processor.packageId);
        Draft& draft = drafts[number];
        draft.package.number = number;
        add(processor, draft);
        const auto info = infoOf.find(processor.number);
        if (info != infoOf.end())
            add(*info->second, draft.package);
    }
    std::vector<ProcessorPackage> out;
    for (auto& [number, draft] : drafts) {
        if (!draft.cores.empty())
            draft.package.cores = clamped(draft.cores.size());
        out.push_back(std::move(draft.package));
    }
    return out;
}

}  // namespace cimomd
