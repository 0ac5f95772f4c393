#include "system/software/KernelTables.h"

#include <utmpx.h>

#include <cstring>

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxTableBytes = std::size_t{4} << 20;

std::optional<std::uint64_t> kilobytes(std::string_view value) {
    const std::vector<std::string_view> fields = fieldsOf(value);
    if (fields.size() != 2 || fields[1] != "kB")
        return std::nullopt;
    return parseUnsigned(fields[0]);
}

}  // namespace

MemoryInfo parseMemoryInfo(std::string_view text) {
    MemoryInfo out;
    for (const std::string_view line : linesOf(text)) {
        const auto entry = keyValueOf(line, ':');
        if (!entry)
            continue;
        if (entry->key == "MemTotal")
            out.totalKB = kilobytes(entry->value);
        else if (entry->key == "MemFree")
            out.freeKB = kilobytes(entry->value);
        else if (entry->key == "SwapTotal")
            out.swapTotalKB = kilobytes(entry->value);
        else if (entry->key == "SwapFree")
            out.swapFreeKB = kilobytes(entry->value);
    }
    return out;
}

Fact<std::uint64_t> readTotalMemoryKB(const SystemPaths& paths) {
    return readText(paths.memory())
        .then(
            [](const std::string& text) -> std::optional<std::uint64_t> {
                return parseMemoryInfo(text).totalKB;
            },
            Absence::Unreadable);
}

MemoryInfo readMemoryInfo(const SystemPaths& paths) {
    const Fact<std::string> text = readText(paths.memory());
    if (text)
        return parseMemoryInfo(*text);
    return {text.reason(), text.reason(), text.reason(), text.reason()};
}

std::optional<std::int64_t> parseBootTime(std::string_view text) {
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = fieldsOf(line);
        if (fields.size() == 2 && fields[0] == "btime")
            return parseSigned(fields[1]);
    }
    return std::nullopt;
}

Fact<std::int64_t> readBootTime(const SystemPaths& paths) {
    return readText(paths.kernelStatistics(), kMaxTableBytes).then(parseBootTime, Absence::Absent);
}

std::uint32_t countSessions(std::string_view bytes) {
    std::uint32_t count = 0;
    while (bytes.size() >= sizeof(utmpx)) {
        utmpx record{};
        std::memcpy(&record, bytes.data(), sizeof record);
        count += record.ut_type == USER_PROCESS ? 1 : 0;
        bytes.remove_prefix(sizeof record);
    }
    return count;
}

Fact<std::uint32_t> readSessionCount(const SystemPaths& paths) {
    return readText(paths.sessions(), kMaxTableBytes).then([](const std::string& bytes) {
        return std::optional(countSessions(bytes));
    });
}

}  // namespace cimomd
