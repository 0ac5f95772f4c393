#include "system/computer/Chassis.h"

#include "files/TextFile.h"
#include "system/computer/FirmwareText.h"

namespace cimomd {
namespace {

constexpr unsigned kLockBit = 0x80;

/// The elements that may be in the chassis stand before the number of this text.
Fact<std::string> skuOf(const SmbiosStructure& structure) {
    constexpr std::size_t kElements = 0x15;
    const Fact<std::uint8_t> count = structure.byte(0x13);
    const Fact<std::uint8_t> length = structure.byte(0x14);
    if (!count || !length)
        return Absence::Absent;
    return structure.text(kElements + std::size_t{*count} * *length);
}

/// 0 stands for "not told".
Fact<std::uint8_t> countAt(const SmbiosStructure& structure, std::size_t offset) {
    const Fact<std::uint8_t> count = structure.byte(offset);
    return count == 0 ? Fact<std::uint8_t>(Absence::Absent) : count;
}

Chassis chassisOf(const SmbiosStructure& structure) {
    Chassis out;
    const Fact<std::uint8_t> type = structure.byte(0x05);
    out.manufacturer = structure.text(0x04);
    out.type =
        type.then([](std::uint8_t bits) { return static_cast<std::uint8_t>(bits & ~kLockBit); });
    out.lockPresent = type.then([](std::uint8_t bits) { return (bits & kLockBit) != 0; });
    out.version = structure.text(0x06);
    out.serialNumber = structure.text(0x07);
    out.assetTag = structure.text(0x08);
    out.heightUnits = countAt(structure, 0x11);
    out.powerCords = countAt(structure, 0x12);
    out.sku = skuOf(structure);
    return out;
}

Fact<std::uint8_t> typeNumber(const Fact<std::uint64_t>& file) {
    return file.then([](std::uint64_t number) {
        return number < kLockBit ? std::optional(static_cast<std::uint8_t>(number)) : std::nullopt;
    });
}

/// `missing`: why the tables cannot be read.
Fact<std::vector<Chassis>> chassisFromKernel(const std::filesystem::path& directory,
                                             Absence missing) {
    const auto fact = [&directory](const char* name) { return readFirmwareText(directory / name); };
    const auto text = [&fact, missing](const char* name) { return fact(name).orElse(missing); };
    const Fact<std::uint64_t> type = readNumber(directory / "chassis_type");
    if (!type && !fact("chassis_vendor"))
        return missing;
    Chassis out;
    out.manufacturer = text("chassis_vendor");
    out.type = typeNumber(type);
    out.lockPresent = missing;
    out.version = text("chassis_version");
    out.serialNumber = text("chassis_serial");
    out.assetTag = text("chassis_asset_tag");
    out.sku = missing;
    out.heightUnits = missing;
    out.powerCords = missing;
    return std::vector<Chassis>{out};
}

}  // namespace

std::vector<Chassis> chassisOf(const SmbiosTable& table) {
    std::vector<Chassis> found;
    for (const SmbiosStructure* structure : table.ofType(smbios::kChassis)) {
        found.push_back(chassisOf(*structure));
        found.back().index = found.size() - 1;
    }
    return found;
}

Fact<std::vector<Chassis>> readChassis(const SystemPaths& paths) {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    if (table)
        return chassisOf(*table);
    return chassisFromKernel(paths.firmwareIdentity(), table.reason());
}

}  // namespace cimomd
