#include "system/computer/SmbiosStructure.h"

#include <stdexcept>

#include "system/computer/FirmwareText.h"

namespace cimomd {

SmbiosStructure::SmbiosStructure(std::string_view formattedArea, std::vector<std::string> textSet)
    : area(formattedArea), texts(std::move(textSet)) {
    if (area.size() < kHeaderBytes)
        throw std::logic_error("an SMBIOS structure without its header");
}

Fact<std::uint64_t> SmbiosStructure::number(std::size_t offset, std::size_t width) const {
    const Fact<std::string> field = bytes(offset, width);
    return field.then([](const std::string& littleEndian) {
        std::uint64_t value = 0;
        for (auto digit = littleEndian.rbegin(); digit != littleEndian.rend(); ++digit)
            value = value << 8 | static_cast<std::uint8_t>(*digit);
        return value;
    });
}

Fact<std::uint8_t> SmbiosStructure::byte(std::size_t offset) const {
    return number(offset, 1).then(
        [](std::uint64_t value) { return static_cast<std::uint8_t>(value); });
}

Fact<std::uint16_t> SmbiosStructure::word(std::size_t offset) const {
    return number(offset, 2).then(
        [](std::uint64_t value) { return static_cast<std::uint16_t>(value); });
}

Fact<std::uint32_t> SmbiosStructure::doubleWord(std::size_t offset) const {
    return number(offset, 4).then(
        [](std::uint64_t value) { return static_cast<std::uint32_t>(value); });
}

Fact<std::string> SmbiosStructure::bytes(std::size_t offset, std::size_t count) const {
    if (offset > area.size() || count > area.size() - offset)
        return Absence::Absent;
    return area.substr(offset, count);
}

Fact<std::string> SmbiosStructure::text(std::size_t offset) const {
    const Fact<std::uint8_t> number = byte(offset);
    if (!number || *number == 0)
        return Absence::Absent;
    if (*number > texts.size())
        return Absence::Unreadable;
    return withoutPlaceholder(texts[*number - 1U]);
}

}  // namespace cimomd
