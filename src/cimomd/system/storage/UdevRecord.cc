#include "system/storage/UdevRecord.h"

#include <algorithm>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

constexpr std::size_t kEscapeLength = 4;

/// Resolves \xHH.
std::string unescaped(std::string_view text) {
    std::string out;
    while (!text.empty()) {
        const std::string_view start = text.substr(0, kEscapeLength);
        const auto code = start.substr(0, 2) == "\\x" && start.size() == kEscapeLength
                              ? parseHexadecimal("0x" + std::string(start.substr(2)))
                              : std::nullopt;
        out += code ? static_cast<char>(*code) : text.front();
        text.remove_prefix(code ? kEscapeLength : 1);
    }
    return out;
}

bool isDeviceNumber(std::string_view text) {
    const auto parts = keyValueOf(text, ':');
    return parts && parseUnsigned(parts->key) && parseUnsigned(parts->value);
}

}  // namespace

UdevRecord::UdevRecord(std::string_view text) {
    constexpr std::string_view kPropertyMark = "E:";
    for (const std::string_view line : linesOf(text)) {
        if (line.substr(0, kPropertyMark.size()) != kPropertyMark)
            continue;
        if (const auto pair = keyValueOf(line.substr(kPropertyMark.size()), '='))
            properties[std::string(pair->key)] = pair->value;
    }
}

Fact<std::string> UdevRecord::property(std::string_view name) const {
    const auto place = properties.find(name);
    if (place == properties.end() || trimmed(place->second).empty())
        return std::nullopt;
    return std::string(trimmed(place->second));
}

Fact<std::string> UdevRecord::text(std::string_view name) const {
    if (const auto exact = property(std::string(name) + "_ENC"))
        return std::string(trimmed(unescaped(*exact)));
    return property(name).then([](std::string value) {
        std::replace(value.begin(), value.end(), '_', ' ');
        return std::optional(std::move(value));
    });
}

UdevRecord readUdevRecord(const std::filesystem::path& udevDirectory,
                          const std::filesystem::path& deviceDirectory) {
    const auto number = readFact(deviceDirectory / "dev");
    if (!number || !isDeviceNumber(*number))
        return {};
    return UdevRecord(readText(udevDirectory / ("b" + *number)).value_or(""));
}

}  // namespace cimomd
