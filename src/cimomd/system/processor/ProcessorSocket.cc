#include "system/processor/ProcessorSocket.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kProcessorType = 4;
constexpr std::uint8_t kUnknown = 2;
constexpr std::uint8_t kFirstSpecialPurpose = 4;
constexpr std::uint8_t kLastSpecialPurpose = 6;
constexpr std::uint8_t kFamilyIsWide = 0xFE;
constexpr unsigned kPopulated = 0x40;
constexpr unsigned kStatusMask = 0x07;

template <typename Number>
Fact<Number> unless(Number unknown, const Fact<Number>& number) {
    return number.then(
        [unknown](Number known) { return known == unknown ? std::nullopt : std::optional(known); },
        Absence::Absent);
}

Fact<std::uint16_t> familyOf(const SmbiosStructure& structure) {
    const Fact<std::uint8_t> narrow = structure.byte(0x06);
    const Fact<std::uint16_t> family =
        narrow == kFamilyIsWide
            ? structure.word(0x28)
            : narrow.then([](std::uint8_t number) { return std::uint16_t{number}; });
    return unless<std::uint16_t>(0, unless<std::uint16_t>(kUnknown, family));
}

bool isCentralProcessor(const SmbiosStructure& structure) {
    const auto kind = structure.byte(0x05);
    return !kind || *kind < kFirstSpecialPurpose || *kind > kLastSpecialPurpose;
}

ProcessorSocket socketOf(const SmbiosStructure& structure, std::size_t number) {
    ProcessorSocket out;
    out.number = number;
    out.designation = structure.text(0x04);
    out.family = familyOf(structure);
    out.manufacturer = structure.text(0x07);
    out.version = structure.text(0x10);
    out.serialNumber = structure.text(0x20);
    out.partNumber = structure.text(0x22);
    out.externalClockMHz = unless<std::uint16_t>(0, structure.word(0x12));
    out.maxMHz = unless<std::uint16_t>(0, structure.word(0x14));
    out.currentMHz = unless<std::uint16_t>(0, structure.word(0x16));
    out.status = static_cast<std::uint8_t>(structure.byte(0x18).value_or(0) & kStatusMask);
    out.upgrade = unless<std::uint8_t>(0, unless(kUnknown, structure.byte(0x19)));
    return out;
}

}  // namespace

std::vector<ProcessorSocket> processorSockets(const SmbiosTable& table) {
    std::vector<ProcessorSocket> out;
    std::size_t number = 0;
    for (const SmbiosStructure* structure : table.ofType(kProcessorType)) {
        ++number;
        const bool isPopulated = (structure->byte(0x18).value_or(0) & kPopulated) != 0;
        if (isPopulated && isCentralProcessor(*structure))
            out.push_back(socketOf(*structure, number));
    }
    return out;
}

}  // namespace cimomd
