#include "files/TextFile.h"

#include <algorithm>

#include "files/BoundedFile.h"
#include "files/TextFields.h"
#include "text/Utf8.h"

namespace cimomd {

std::optional<std::string> readText(const std::filesystem::path& path, std::size_t maxBytes) {
    FileContent content = readBoundedFile(path, maxBytes);
    if (content.status != FileStatus::Read)
        return std::nullopt;
    return std::move(content.bytes);
}

std::optional<std::string> readFact(const std::filesystem::path& path) {
    const std::optional<std::string> text = readText(path);
    if (!text)
        return std::nullopt;
    const std::string_view fact = trimmed(*text);
    if (fact.empty())
        return std::nullopt;
    return std::string(fact);
}

std::optional<std::uint64_t> readNumber(const std::filesystem::path& path) {
    const std::optional<std::string> fact = readFact(path);
    return fact ? parseUnsigned(*fact) : std::nullopt;
}

std::optional<std::int64_t> readSignedNumber(const std::filesystem::path& path) {
    const std::optional<std::string> fact = readFact(path);
    return fact ? parseSigned(*fact) : std::nullopt;
}

std::optional<std::vector<std::string>> listDirectory(const std::filesystem::path& path) {
    std::error_code error;
    std::filesystem::directory_iterator entry(path, error);
    if (error)
        return std::nullopt;
    std::vector<std::string> names;
    const std::filesystem::directory_iterator end;
    while (entry != end && names.size() < kMaxListedEntries) {
        names.push_back(entry->path().filename().string());
        entry.increment(error);
        if (error)
            break;
    }
    std::sort(names.begin(), names.end());
    return names;
}

}  // namespace cimomd
