#include "system/devices/HardwareNames.h"

#include <optional>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Key = HardwareNames::Key;

constexpr std::size_t kMaxListBytes = std::size_t{16} << 20;

/// Takes `digits` hexadecimal digits and the blanks after them away from the front.
std::optional<std::uint16_t> takeNumber(std::string_view& line, std::size_t digits) {
    const auto number = parseHexDigits(line.substr(0, digits));
    if (!number || line.size() <= digits || line[digits] != ' ')
        return std::nullopt;
    line = trimmed(line.substr(digits));
    return static_cast<std::uint16_t>(*number);
}

/// Follows the indentation: what a line names depends on the lines above it.
class ListReader {
  public:
    explicit ListReader(std::map<Key, Fact<std::string>>& answers) : wanted(answers) {}

    void readLine(std::string_view line) {
        if (line.empty() || line.front() == '#')
            return;
        if (line.front() != '\t')
            readOutermost(line);
        else if (line.substr(0, 2) != "\t\t")
            readInner(line.substr(1));
        else
            readInnermost(line.substr(2));
    }

  private:
    void readOutermost(std::string_view line) {
        inner.reset();
        outer.reset();
        if (line.substr(0, 2) == "C ") {
            line.remove_prefix(2);
            if (const auto number = takeNumber(line, 2))
                outer = HardwareNames::baseClass(static_cast<std::uint8_t>(*number));
        } else if (const auto number = takeNumber(line, 4)) {
            outer = HardwareNames::vendor(*number);
        }
        if (outer)
            answer(*outer, line);
    }

    void readInner(std::string_view line) {
        inner.reset();
        if (!outer)
            return;
        const bool isClass = outer->kind == Key::Kind::Class;
        const auto number = takeNumber(line, isClass ? 2 : 4);
        if (!number)
            return;
        inner = Key{isClass ? Key::Kind::Subclass : Key::Kind::Device,
                    {outer->numbers[0], *number, 0, 0}};
        answer(*inner, line);
    }

    void readInnermost(std::string_view line) {
        if (!inner || inner->kind != Key::Kind::Device)
            return;
        const auto subsystemVendor = takeNumber(line, 4);
        if (!subsystemVendor)
            return;
        if (const auto subsystemDevice = takeNumber(line, 4))
            answer(HardwareNames::subsystem(*inner, *subsystemVendor, *subsystemDevice), line);
    }

    void answer(const Key& key, std::string_view name) {
        const auto place = wanted.find(key);
        if (place != wanted.end() && !place->second && !name.empty())
            place->second = std::string(name);
    }

    std::map<Key, Fact<std::string>>& wanted;
    std::optional<Key> outer;
    std::optional<Key> inner;
};

}  // namespace

Key HardwareNames::vendor(std::uint16_t vendor) {
    return {Key::Kind::Vendor, {vendor, 0, 0, 0}};
}

Key HardwareNames::device(std::uint16_t vendor, std::uint16_t device) {
    return {Key::Kind::Device, {vendor, device, 0, 0}};
}

Key HardwareNames::subsystem(const Key& device, std::uint16_t subsystemVendor,
                             std::uint16_t subsystemDevice) {
    return {Key::Kind::Subsystem,
            {device.numbers[0], device.numbers[1], subsystemVendor, subsystemDevice}};
}

Key HardwareNames::baseClass(std::uint8_t baseClass) {
    return {Key::Kind::Class, {baseClass, 0, 0, 0}};
}

Key HardwareNames::subclass(std::uint8_t baseClass, std::uint8_t subclass) {
    return {Key::Kind::Subclass, {baseClass, subclass, 0, 0}};
}

void HardwareNames::read(const Fact<std::string>& list) {
    if (!list) {
        for (auto& [key, name] : wanted)
            name = list.reason();
        return;
    }
    ListReader reader(wanted);
    for (const std::string_view line : linesOf(*list))
        reader.readLine(line);
}

Fact<std::string> HardwareNames::nameOf(const Key& key) const {
    const auto place = wanted.find(key);
    return place == wanted.end() ? Absence::Absent : place->second;
}

Fact<std::string> readHardwareList(const SystemPaths& paths, std::string_view fileName) {
    Fact<std::string> list = readText(paths.miscellaneousLists() / fileName, kMaxListBytes);
    if (list || list.reason() != Absence::Absent)
        return list;
    return readText(paths.hardwareLists() / fileName, kMaxListBytes);
}

}  // namespace cimomd
