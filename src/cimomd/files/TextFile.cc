#include "files/TextFile.h"

#include <algorithm>

#include "files/TextFields.h"
#include "text/Utf8.h"

namespace cimomd {

Absence absenceOf(FileStatus status) {
    switch (status) {
        case FileStatus::Absent:
            return Absence::Absent;
        case FileStatus::Forbidden:
            return Absence::NeedsRoot;
        default:
            return Absence::Unreadable;
    }
}

Absence absenceOf(const std::error_code& error) {
    if (error == std::errc::permission_denied || error == std::errc::operation_not_permitted)
        return Absence::NeedsRoot;
    const bool isNowhere =
        error == std::errc::no_such_file_or_directory || error == std::errc::not_a_directory;
    return isNowhere ? Absence::Absent : Absence::Unreadable;
}

Fact<std::string> readText(const std::filesystem::path& path, std::size_t maxBytes) {
    FileContent content = readBoundedFile(path, maxBytes);
    if (content.status != FileStatus::Read)
        return absenceOf(content.status);
    return std::move(content.bytes);
}

Fact<std::string> readFact(const std::filesystem::path& path) {
    return factIn(readText(path));
}

Fact<std::uint64_t> readNumber(const std::filesystem::path& path) {
    return numberIn(readFact(path));
}

Fact<std::int64_t> readSignedNumber(const std::filesystem::path& path) {
    return signedNumberIn(readFact(path));
}

Fact<std::string> factIn(const Fact<std::string>& text) {
    return text.then(
        [](const std::string& bytes) {
            const std::string_view fact = trimmed(bytes);
            return fact.empty() ? std::nullopt : std::optional<std::string>(fact);
        },
        Absence::Absent);
}

Fact<std::uint64_t> numberIn(const Fact<std::string>& fact) {
    return fact.then([](const std::string& digits) { return parseUnsigned(digits); });
}

Fact<std::int64_t> signedNumberIn(const Fact<std::string>& fact) {
    return fact.then([](const std::string& digits) { return parseSigned(digits); });
}

Fact<std::vector<std::string>> listDirectory(const std::filesystem::path& path,
                                             std::size_t maxEntries) {
    std::error_code error;
    std::filesystem::directory_iterator entry(path, error);
    if (error)
        return absenceOf(error);
    std::vector<std::string> names;
    const std::filesystem::directory_iterator end;
    while (entry != end) {
        if (names.size() == maxEntries)
            return Absence::Unreadable;
        names.push_back(entry->path().filename().string());
        entry.increment(error);
        if (error)
            return absenceOf(error);
    }
    std::sort(names.begin(), names.end());
    return names;
}

}  // namespace cimomd
