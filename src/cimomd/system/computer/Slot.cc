#include "system/computer/Slot.h"

#include <fmt/format.h>

namespace cimomd {
namespace {

Fact<bool> usageOf(const SmbiosStructure& structure) {
    constexpr std::uint8_t kAvailable = 3;
    constexpr std::uint8_t kInUse = 4;
    return structure.byte(0x07).then(
        [](std::uint8_t usage) {
            const bool isTold = usage == kAvailable || usage == kInUse;
            return isTold ? std::optional(usage == kInUse) : std::nullopt;
        },
        Absence::Absent);
}

/// All bits set: no such address, the slot is for something else or empty.
Fact<std::string> addressOf(const SmbiosStructure& structure) {
    constexpr std::uint16_t kNoSegment = 0xFFFF;
    constexpr std::uint8_t kNone = 0xFF;
    const Fact<std::uint16_t> segment = structure.word(0x0D);
    const Fact<std::uint8_t> bus = structure.byte(0x0F);
    const Fact<std::uint8_t> function = structure.byte(0x10);
    if (!segment || !bus || !function)
        return Absence::Absent;
    if (*segment == kNoSegment || (*bus == kNone && *function == kNone))
        return Absence::Absent;
    return fmt::format("{:04x}:{:02x}:{:02x}.{:x}", *segment, *bus, *function >> 3U,
                       *function & 7U);
}

Slot slotOf(const SmbiosStructure& structure) {
    constexpr unsigned kHotPlugBit = 1;
    Slot out;
    out.designation = structure.text(0x04);
    out.type = structure.byte(0x05);
    out.dataBusWidth = structure.byte(0x06);
    out.inUse = usageOf(structure);
    out.number = structure.word(0x09);
    out.supportsHotPlug = structure.byte(0x0C).then(
        [](std::uint8_t bits) { return (bits >> kHotPlugBit & 1U) != 0; });
    out.pciAddress = addressOf(structure);
    return out;
}

}  // namespace

std::vector<Slot> slotsOf(const SmbiosTable& table) {
    std::vector<Slot> found;
    for (const SmbiosStructure* structure : table.ofType(smbios::kSlot)) {
        found.push_back(slotOf(*structure));
        found.back().index = found.size() - 1;
    }
    return found;
}

}  // namespace cimomd
