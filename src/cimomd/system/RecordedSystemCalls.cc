#include "system/RecordedSystemCalls.h"

#include <array>

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {

namespace {

constexpr std::string_view kTimedOut = "timeout";
constexpr std::size_t kNumberCount = 5;

std::optional<FileSystemSize> sizeOf(const std::vector<std::string_view>& fields) {
    if (fields.size() != kNumberCount + 1)
        return std::nullopt;
    std::array<std::uint64_t, kNumberCount> numbers{};
    for (std::size_t i = 0; i < kNumberCount; ++i) {
        const auto number = parseUnsigned(fields[i + 1]);
        if (!number)
            return std::nullopt;
        numbers[i] = *number;
    }
    return FileSystemSize{numbers[0], numbers[1], numbers[2], numbers[3], numbers[4]};
}

}  // namespace

std::map<std::string, Fact<FileSystemSize>> parseRecordedSizes(std::string_view text) {
    std::map<std::string, Fact<FileSystemSize>> sizes;
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = fieldsOf(line);
        if (const auto size = sizeOf(fields))
            sizes[unescapeOctal(fields[0])] = *size;
        else if (fields.size() == 2 && fields[1] == kTimedOut)
            sizes[unescapeOctal(fields[0])] = Absence::TimedOut;
    }
    return sizes;
}

RecordedSystemCalls::RecordedSystemCalls(const SystemPaths& paths)
    : sizes(parseRecordedSizes(readText(paths.recordedFileSystemSizes()).value_or(""))),
      addresses(readText(paths.recordedAddresses()).then(parseRecordedAddresses)),
      links(parseRecordedLinks(readText(paths.recordedLinks()).value_or(""))) {}

Fact<FileSystemSize> RecordedSystemCalls::fileSystemSize(const std::string& mountPoint) const {
    const auto place = sizes.find(mountPoint);
    if (place == sizes.end())
        return std::nullopt;
    return place->second;
}

Fact<FileSystemSize> RecordedSystemCalls::fileSystemSizeInTime(const std::string& mountPoint,
                                                               const std::string&) const {
    return fileSystemSize(mountPoint);
}

std::optional<std::string> RecordedSystemCalls::machine() const {
    return std::nullopt;
}

Fact<std::vector<InterfaceAddress>> RecordedSystemCalls::interfaceAddresses() const {
    return addresses;
}

LinkSettings RecordedSystemCalls::linkSettings(const std::string& interfaceName) const {
    const auto place = links.find(interfaceName);
    return place == links.end() ? LinkSettings() : place->second;
}

}  // namespace cimomd
