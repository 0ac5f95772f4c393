#include "system/devices/DeviceFiles.h"

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

std::optional<std::uint64_t> hexNumberOf(const std::string& text) {
    return text.rfind("0x", 0) == 0 ? parseHexadecimal(text) : parseHexDigits(text);
}

}  // namespace

template <typename Number>
Fact<Number> readHexNumber(const std::filesystem::path& path) {
    return readFact(path).then(hexNumberOf).then(narrowedTo<Number, std::uint64_t>);
}

template Fact<std::uint8_t> readHexNumber(const std::filesystem::path& path);
template Fact<std::uint16_t> readHexNumber(const std::filesystem::path& path);
template Fact<std::uint32_t> readHexNumber(const std::filesystem::path& path);

Fact<bool> readSwitch(const std::filesystem::path& path) {
    return switchIn(readNumber(path));
}

Fact<bool> switchIn(const Fact<std::uint64_t>& number) {
    return number.then(
        [](std::uint64_t state) { return state <= 1 ? std::optional(state == 1) : std::nullopt; });
}

Fact<std::string> ueventValue(std::string_view uevent, std::string_view key) {
    for (const std::string_view line : linesOf(uevent)) {
        const auto entry = keyValueOf(line, '=');
        if (entry && entry->key == key && !entry->value.empty())
            return std::string(entry->value);
    }
    return Absence::Absent;
}

Fact<std::string> readUeventValue(const std::filesystem::path& device, std::string_view key) {
    const Fact<std::string> text = readText(device / "uevent");
    return text ? ueventValue(*text, key) : text;
}

}  // namespace cimomd
