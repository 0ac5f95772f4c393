#include "system/computer/MemoryDevice.h"

#include <limits>
#include <set>

namespace cimomd {
namespace {

constexpr std::uint16_t kUnknown = 0xFFFF;

Fact<std::uint64_t> extendedCapacity(const SmbiosStructure& structure) {
    constexpr std::uint64_t kMegabytesMask = 0x7FFFFFFF;
    return structure.doubleWord(0x1C).then([](std::uint32_t field) -> std::optional<std::uint64_t> {
        const std::uint64_t megabytes = field & kMegabytesMask;
        return megabytes == 0 ? std::nullopt : std::optional(megabytes << 20U);
    });
}

/// 0 in an empty socket.
Fact<std::uint64_t> capacityOf(const SmbiosStructure& structure) {
    constexpr std::uint16_t kSeeExtended = 0x7FFF;
    constexpr unsigned kKilobytesBit = 0x8000;
    const Fact<std::uint16_t> size = structure.word(0x0C);
    if (size == kUnknown)
        return Absence::Absent;
    if (size == kSeeExtended)
        return extendedCapacity(structure);
    return size.then([](std::uint16_t field) {
        const std::uint64_t count = field & ~kKilobytesBit;
        return (field & kKilobytesBit) != 0 ? count << 10U : count << 20U;
    });
}

Fact<std::uint16_t> widthAt(const SmbiosStructure& structure, std::size_t offset) {
    const Fact<std::uint16_t> width = structure.word(offset);
    return width == kUnknown ? Fact<std::uint16_t>(Absence::Absent) : width;
}

/// A module that only corrects errors has no data bits, but one without any bits has no widths.
void checkWidths(MemoryDevice& device) {
    if (device.totalWidthBits != 0)
        return;
    device.totalWidthBits = Absence::Filtered;
    if (device.dataWidthBits == 0)
        device.dataWidthBits = Absence::Filtered;
}

Fact<std::uint32_t> speedAt(const SmbiosStructure& structure, std::size_t offset,
                            std::size_t extendedOffset) {
    constexpr std::uint32_t kExtendedMask = 0x7FFFFFFF;
    Fact<std::uint32_t> speed = structure.word(offset).then(
        [](std::uint16_t field) { return static_cast<std::uint32_t>(field); });
    if (speed == std::uint32_t{kUnknown})
        speed = structure.doubleWord(extendedOffset).then([](std::uint32_t field) {
            return field & kExtendedMask;
        });
    return speed == 0U ? Fact<std::uint32_t>(Absence::Absent) : speed;
}

/// The handles of arrays that are for something else than main memory.
std::set<std::uint16_t> otherArrays(const SmbiosTable& table) {
    constexpr std::uint8_t kMainMemory = 3;
    std::set<std::uint16_t> handles;
    for (const SmbiosStructure* array : table.ofType(smbios::kMemoryArray)) {
        if (array->byte(0x05).value_or(kMainMemory) != kMainMemory)
            handles.insert(array->handle());
    }
    return handles;
}

MemoryDevice deviceOf(const SmbiosStructure& structure) {
    MemoryDevice out;
    out.capacityBytes = capacityOf(structure);
    out.formFactor = structure.byte(0x0E);
    out.type = structure.byte(0x12);
    out.totalWidthBits = widthAt(structure, 0x08);
    out.dataWidthBits = widthAt(structure, 0x0A);
    checkWidths(out);
    out.maxSpeedMHz = speedAt(structure, 0x15, 0x54);
    out.configuredSpeedMHz = speedAt(structure, 0x20, 0x58);
    out.locator = structure.text(0x10);
    out.bankLabel = structure.text(0x11);
    out.manufacturer = structure.text(0x17);
    out.serialNumber = structure.text(0x18);
    out.assetTag = structure.text(0x19);
    out.partNumber = structure.text(0x1A);
    return out;
}

}  // namespace

std::vector<MemoryDevice> memoryDevicesOf(const SmbiosTable& table) {
    std::vector<MemoryDevice> found;
    const std::set<std::uint16_t> others = otherArrays(table);
    std::size_t socketNumber = 0;
    for (const SmbiosStructure* structure : table.ofType(smbios::kMemoryDevice)) {
        MemoryDevice device = deviceOf(*structure);
        device.socketNumber = socketNumber++;
        const bool tellsItsSize = structure->word(0x0C).has_value();
        if (!tellsItsSize || device.capacityBytes == std::uint64_t{0})
            continue;
        const Fact<std::uint16_t> array = structure->word(0x04);
        device.isMainMemory = !array || others.count(*array) == 0;
        found.push_back(std::move(device));
    }
    return found;
}

MemoryDevice memoryOfKernel(std::uint64_t totalKB) {
    constexpr std::uint64_t kMaxKB = std::numeric_limits<std::uint64_t>::max() >> 10U;
    MemoryDevice out;
    out.describedByFirmware = false;
    out.capacityBytes = totalKB > kMaxKB ? Fact<std::uint64_t>(Absence::Filtered) : totalKB << 10U;
    return out;
}

Fact<std::uint64_t> totalCapacityBytes(const std::vector<MemoryDevice>& devices) {
    std::uint64_t total = 0;
    for (const MemoryDevice& device : devices) {
        if (!device.isMainMemory)
            continue;
        if (!device.capacityBytes)
            return device.capacityBytes.reason();
        total += *device.capacityBytes;
    }
    return total == 0 ? Fact<std::uint64_t>(Absence::Absent) : total;
}

}  // namespace cimomd
