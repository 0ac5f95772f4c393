#include "system/software/TimeZoneFile.h"

#include <cstddef>

namespace cimomd {
namespace {

constexpr std::size_t kHeaderBytes = 44;
constexpr std::size_t kTypeBytes = 6;
constexpr std::size_t kLongTimeBytes = 8;
constexpr std::size_t kShortTimeBytes = 4;

std::uint64_t bigEndian(std::string_view bytes) {
    std::uint64_t number = 0;
    for (const char c : bytes)
        number = number << 8 | static_cast<unsigned char>(c);
    return number;
}

/// The counts in a header.
struct Header {
    char version = '\0';
    std::uint64_t utcIndicators = 0;
    std::uint64_t standardIndicators = 0;
    std::uint64_t leapSeconds = 0;
    std::uint64_t times = 0;
    std::uint64_t types = 0;
    std::uint64_t nameBytes = 0;

    std::uint64_t dataBytes(std::uint64_t timeBytes) const {
        return times * (timeBytes + 1) + types * kTypeBytes + nameBytes +
               leapSeconds * (timeBytes + 4) + standardIndicators + utcIndicators;
    }
};

std::optional<Header> takeHeader(std::string_view& bytes) {
    constexpr std::size_t kVersionPlace = 4;
    constexpr std::size_t kFirstCount = 20;
    if (bytes.size() < kHeaderBytes || bytes.substr(0, kVersionPlace) != "TZif")
        return std::nullopt;
    Header header;
    header.version = bytes[kVersionPlace];
    std::size_t place = kFirstCount;
    for (std::uint64_t* count :
         {&header.utcIndicators, &header.standardIndicators, &header.leapSeconds, &header.times,
          &header.types, &header.nameBytes}) {
        *count = bigEndian(bytes.substr(place, sizeof(std::uint32_t)));
        place += sizeof(std::uint32_t);
    }
    bytes.remove_prefix(kHeaderBytes);
    return header;
}

/// The kinds of local time in a data block.
class LocalTimes {
  public:
    LocalTimes(std::string_view dataBlock, const Header& fileHeader)
        : block(dataBlock), header(fileHeader) {}

    std::int64_t time(std::size_t index) const {
        return static_cast<std::int64_t>(
            bigEndian(block.substr(index * kLongTimeBytes, kLongTimeBytes)));
    }
    std::size_t typeFrom(std::size_t index) const {
        return static_cast<unsigned char>(block[header.times * kLongTimeBytes + index]);
    }
    bool isStandard(std::size_t type) const { return typeAt(type)[4] == '\0'; }
    std::int32_t offsetSeconds(std::size_t type) const {
        return static_cast<std::int32_t>(bigEndian(typeAt(type).substr(0, 4)));
    }

  private:
    std::string_view typeAt(std::size_t type) const {
        return block.substr(header.times * (kLongTimeBytes + 1) + type * kTypeBytes, kTypeBytes);
    }

    std::string_view block;
    Header header;
};

std::optional<std::int64_t> standardSince(const LocalTimes& local, const Header& header,
                                          std::int64_t now) {
    std::optional<std::int64_t> since;
    // Before the first change the first type holds.
    std::int32_t offset = local.offsetSeconds(0);
    for (std::size_t i = 0; i < header.times && local.time(i) <= now; ++i) {
        const std::size_t type = local.typeFrom(i);
        if (type >= header.types || !local.isStandard(type) || local.offsetSeconds(type) == offset)
            continue;
        offset = local.offsetSeconds(type);
        since = local.time(i);
    }
    return since;
}

}  // namespace

std::optional<TimeZoneFile> parseTimeZoneFile(std::string_view bytes, std::int64_t now) {
    const auto first = takeHeader(bytes);
    if (!first || first->version < '2' || first->dataBytes(kShortTimeBytes) > bytes.size())
        return std::nullopt;
    bytes.remove_prefix(first->dataBytes(kShortTimeBytes));
    const auto second = takeHeader(bytes);
    if (!second || second->types == 0 || second->dataBytes(kLongTimeBytes) > bytes.size())
        return std::nullopt;
    const std::string_view footer = bytes.substr(second->dataBytes(kLongTimeBytes));
    const std::size_t end = footer.find('\n', 1);
    if (footer.empty() || footer.front() != '\n' || end == std::string_view::npos)
        return std::nullopt;
    return TimeZoneFile{std::string(footer.substr(1, end - 1)),
                        standardSince(LocalTimes(bytes, *second), *second, now)};
}

}  // namespace cimomd
