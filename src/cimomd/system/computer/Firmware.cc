#include "system/computer/Firmware.h"

#include <fmt/format.h>

#include <chrono>

#include "files/TextFields.h"
#include "system/Narrowing.h"
#include "system/computer/FirmwareText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

/// Two numbers; 0xFF stands for "no such number".
Fact<std::string> releaseAt(const SmbiosStructure& structure, std::size_t offset) {
    constexpr std::uint8_t kNone = 0xFF;
    const Fact<std::uint8_t> majorNumber = structure.byte(offset);
    const Fact<std::uint8_t> minorNumber = structure.byte(offset + 1);
    if (!majorNumber || !minorNumber || *majorNumber == kNone || *minorNumber == kNone)
        return Absence::Absent;
    return fmt::format("{}.{}", *majorNumber, *minorNumber);
}

/// Two bits for the unit, megabytes or gigabytes, and the number of them.
std::optional<std::uint32_t> extendedRomKB(std::uint16_t bits) {
    const unsigned unit = bits >> 14U;
    const std::uint64_t size = bits & 0x3FFFU;
    if (size == 0 || unit > 1)
        return std::nullopt;
    return narrowedToCount(unit == 0 ? size << 10U : size << 20U);
}

Fact<std::uint32_t> romSizeOf(const SmbiosStructure& structure) {
    constexpr std::uint8_t kMaySeeExtended = 0xFF;
    constexpr std::uint32_t kKBPerStep = 64;
    const Fact<std::uint8_t> steps = structure.byte(0x09);
    const Fact<std::uint16_t> extended = structure.word(0x18);
    // Before SMBIOS 3.1 there was nothing to see further: 16 MiB were just the most.
    if (steps == kMaySeeExtended && extended)
        return extended.then(extendedRomKB);
    return steps.then([](std::uint8_t count) { return (count + 1U) * kKBPerStep; });
}

Fact<CalendarDate> dateOf(const Fact<std::string>& text) {
    return text.then([](const std::string& date) { return parseFirmwareDate(date); },
                     Absence::Unreadable);
}

Firmware firmwareOf(const SmbiosStructure& structure) {
    Firmware out;
    out.vendor = structure.text(0x04);
    out.version = structure.text(0x05);
    out.releaseDate = dateOf(structure.text(0x08));
    out.release = releaseAt(structure, 0x14);
    out.controllerRelease = releaseAt(structure, 0x16);
    out.romKB = romSizeOf(structure);
    return out;
}

/// `missing`: why the tables cannot be read.
Fact<std::vector<Firmware>> firmwareFromKernel(const std::filesystem::path& directory,
                                               Absence missing) {
    const auto fact = [&directory](const char* name) { return readFirmwareText(directory / name); };
    const auto text = [&fact, missing](const char* name) { return fact(name).orElse(missing); };
    if (!fact("bios_vendor") && !fact("bios_version"))
        return missing;
    Firmware out;
    out.vendor = text("bios_vendor");
    out.version = text("bios_version");
    out.releaseDate = dateOf(text("bios_date"));
    out.release = text("bios_release");
    out.controllerRelease = text("ec_firmware_release");
    out.romKB = missing;
    return std::vector<Firmware>{out};
}

/// The number of one or two digits, or of four for the year, before the next slash.
std::optional<int> takeNumber(std::string_view& text) {
    const std::size_t slash = std::min(text.find('/'), text.size());
    const auto number = parseUnsigned(text.substr(0, slash));
    const bool tooLong = slash > 4;
    text.remove_prefix(std::min(slash + 1, text.size()));
    return number && !tooLong ? std::optional<int>(static_cast<int>(*number)) : std::nullopt;
}

/// The first tables are of 1995.
int fullYear(int year) {
    constexpr int kFirstYear = 95;
    constexpr int kYearsPerCentury = 100;
    if (year >= kYearsPerCentury)
        return year;
    return year + (year < kFirstYear ? 2000 : 1900);
}

}  // namespace

std::optional<CalendarDate> parseFirmwareDate(std::string_view text) {
    std::string_view rest = trimmed(text);
    const std::optional<int> month = takeNumber(rest);
    const std::optional<int> day = takeNumber(rest);
    const bool yearHasItsDigits = rest.size() == 2 || rest.size() == 4;
    const std::optional<int> year = takeNumber(rest);
    if (!month || !day || !year || !yearHasItsDigits)
        return std::nullopt;
    const CalendarDate date{fullYear(*year), static_cast<unsigned>(*month),
                            static_cast<unsigned>(*day)};
    const std::chrono::year_month_day calendar{
        std::chrono::year(date.year), std::chrono::month(date.month), std::chrono::day(date.day)};
    return calendar.ok() && date.year >= fullYear(95) ? std::optional(date) : std::nullopt;
}

std::vector<Firmware> firmwareOf(const SmbiosTable& table) {
    std::vector<Firmware> found;
    for (const SmbiosStructure* structure : table.ofType(smbios::kFirmware)) {
        found.push_back(firmwareOf(*structure));
        found.back().index = found.size() - 1;
    }
    return found;
}

Fact<std::vector<Firmware>> readFirmware(const SystemPaths& paths) {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    if (table)
        return firmwareOf(*table);
    return firmwareFromKernel(paths.firmwareIdentity(), table.reason());
}

bool startedByUefi(const SystemPaths& paths) {
    std::error_code error;
    return std::filesystem::is_directory(paths.uefi(), error);
}

}  // namespace cimomd
