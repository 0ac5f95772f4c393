#include "system/processor/ProcessorCache.h"

#include <algorithm>
#include <set>
#include <tuple>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

Fact<std::vector<std::string>> numberedEntries(const std::filesystem::path& directory,
                                               std::string_view prefix) {
    return listDirectory(directory).then([prefix](const std::vector<std::string>& names) {
        std::vector<std::string> out;
        for (const std::string& name : names) {
            if (name.substr(0, prefix.size()) == prefix &&
                parseUnsigned(name.substr(prefix.size())))
                out.push_back(name);
        }
        std::sort(out.begin(), out.end(), naturallyBefore);
        return out;
    });
}

/// A number of which 0 says that the kernel does not know.
Fact<std::uint64_t> readCount(const std::filesystem::path& path) {
    return readNumber(path).then(
        [](std::uint64_t count) { return count == 0 ? std::nullopt : std::optional(count); },
        Absence::Absent);
}

/// Nothing without a level: that is what tells a cache from others of its processor.
std::optional<ProcessorCache> readCache(const std::filesystem::path& directory) {
    const auto level = readCount(directory / "level");
    if (!level)
        return std::nullopt;
    ProcessorCache out;
    out.level = *level;
    out.type = readFact(directory / "type");
    out.sizeKB = readFact(directory / "size").then(parseCacheSize);
    out.lineBytes = readCount(directory / "coherency_line_size");
    out.ways = readCount(directory / "ways_of_associativity");
    out.sets = readCount(directory / "number_of_sets");
    out.writePolicy = readFact(directory / "write_policy");
    out.sharedBy = readFact(directory / "shared_cpu_list");
    return out;
}

using Identity = std::tuple<std::uint64_t, std::string, std::string>;

/// Caches of one level and type with the same processors are one. Without a list a cache belongs to
/// its own processor alone.
Identity identityOf(const ProcessorCache& cache, const std::string& processor) {
    return {cache.level, cache.type.value_or(""), cache.sharedBy.value_or(processor)};
}

}  // namespace

std::optional<std::uint64_t> parseCacheSize(std::string_view text) {
    constexpr std::uint64_t kMaxNumber = std::uint64_t{1} << 32U;
    if (text.empty() || (text.back() != 'K' && text.back() != 'M'))
        return std::nullopt;
    const auto number = parseUnsigned(text.substr(0, text.size() - 1));
    if (!number || *number == 0 || *number > kMaxNumber)
        return std::nullopt;
    return text.back() == 'M' ? *number * 1024 : *number;
}

Fact<std::vector<ProcessorCache>> readProcessorCaches(const std::filesystem::path& processors) {
    const auto names = numberedEntries(processors, "cpu");
    if (!names)
        return names.reason();
    std::set<Identity> known;
    std::vector<ProcessorCache> out;
    for (const std::string& name : *names) {
        const std::filesystem::path caches = processors / name / "cache";
        for (const std::string& index : numberedEntries(caches, "index").value_or({})) {
            auto cache = readCache(caches / index);
            if (!cache || !known.insert(identityOf(*cache, name)).second)
                continue;
            cache->firstProcessor = *parseUnsigned(name.substr(3));
            out.push_back(std::move(*cache));
        }
    }
    return out;
}

}  // namespace cimomd
