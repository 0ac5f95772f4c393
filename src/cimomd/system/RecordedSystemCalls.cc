#include "system/RecordedSystemCalls.h"

#include <array>

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {

std::map<std::string, FileSystemSize> parseRecordedSizes(std::string_view text) {
    constexpr std::size_t kFieldCount = 6;
    std::map<std::string, FileSystemSize> sizes;
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = fieldsOf(line);
        if (fields.size() != kFieldCount)
            continue;
        std::array<std::optional<std::uint64_t>, kFieldCount - 1> numbers;
        bool complete = true;
        for (std::size_t i = 0; i < numbers.size(); ++i) {
            numbers[i] = parseUnsigned(fields[i + 1]);
            complete = complete && numbers[i].has_value();
        }
        if (complete)
            sizes[unescapeOctal(fields[0])] = {*numbers[0], *numbers[1], *numbers[2], *numbers[3],
                                               *numbers[4]};
    }
    return sizes;
}

RecordedSystemCalls::RecordedSystemCalls(const SystemPaths& paths)
    : sizes(parseRecordedSizes(readText(paths.recordedFileSystemSizes()).value_or(""))) {}

std::optional<FileSystemSize> RecordedSystemCalls::fileSystemSize(
    const std::string& mountPoint) const {
    const auto place = sizes.find(mountPoint);
    if (place == sizes.end())
        return std::nullopt;
    return place->second;
}

std::optional<std::string> RecordedSystemCalls::machine() const {
    return std::nullopt;
}

}  // namespace cimomd
