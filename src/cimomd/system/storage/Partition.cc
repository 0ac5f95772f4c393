#include "system/storage/Partition.h"

#include <algorithm>
#include <set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/storage/BlockDevice.h"
#include "system/storage/UdevRecord.h"
#include "text/DeviceNameOrder.h"

namespace cimomd {
namespace {

constexpr std::uint64_t kMaxPrimaryNumber = 4;
constexpr std::string_view kDosTable = "dos";

/// A partition and what its kind depends on.
struct Found {
    Partition partition;
    /// What sysfs calls the disk.
    std::string disk;
    /// Of the partition table; empty when udev does not tell it.
    std::string scheme;
    Fact<std::string> type;
};

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

/// sda1 is on sda, nvme0n1p1 on nvme0n1: the kernel sets a "p" between two numbers.
std::string diskNameOf(std::string_view name) {
    while (!name.empty() && isDigit(name.back()))
        name.remove_suffix(1);
    if (name.size() > 1 && name.back() == 'p' && isDigit(name[name.size() - 2]))
        name.remove_suffix(1);
    return std::string(name);
}

bool mayBeDos(const Found& found) {
    return found.scheme.empty() || found.scheme == kDosTable;
}

/// Of an extended partition the kernel gives away no more than the room for a boot loader: two
/// sectors, or one block of the disk.
bool isExtended(const Found& found, const Fact<std::uint64_t>& blockBytes) {
    if (!mayBeDos(found) || found.partition.number > kMaxPrimaryNumber)
        return false;
    if (const auto type = found.type.then([](const auto& text) { return parseHexadecimal(text); }))
        return *type == 0x5 || *type == 0xF || *type == 0x85;
    const std::uint64_t mostSectors =
        std::max(blockBytes.value_or(kSectorBytes) / kSectorBytes, std::uint64_t{2});
    const auto& size = found.partition.sizeSectors;
    return size.has_value() && *size > 0 && *size <= mostSectors;
}

Found readPartition(const SystemPaths& paths, const std::string& entry, std::uint64_t number) {
    const std::filesystem::path directory = paths.blockDevicesAndPartitions() / entry;
    const UdevRecord udev = readUdevRecord(paths.udevRecords(), directory);
    Found out;
    out.disk = diskNameOf(entry);
    out.partition.name = deviceNameOf(entry);
    out.partition.number = number;
    out.partition.startSectors = readSectors(directory / "start");
    out.partition.sizeSectors = readSectors(directory / "size");
    out.partition.isReadOnly = readFlag(directory / "ro");
    out.scheme = udev.property("ID_PART_ENTRY_SCHEME").value_or("");
    out.type = udev.property("ID_PART_ENTRY_TYPE");
    return out;
}

std::vector<Found> readAll(const SystemPaths& paths, const std::vector<std::string>& entries) {
    std::vector<Found> all;
    for (const std::string& entry : entries) {
        const auto number = readNumber(paths.blockDevicesAndPartitions() / entry / "partition");
        if (!number)
            continue;
        all.push_back(readPartition(paths, entry, *number));
        const std::string& disk = all.back().disk;
        if (std::binary_search(entries.begin(), entries.end(), disk, deviceNameLess))
            all.back().partition.disk = deviceNameOf(disk);
    }
    return all;
}

/// Only disks with an extended partition have logical ones: other tables number on beyond four.
void tellKinds(const SystemPaths& paths, std::vector<Found>& all) {
    std::set<std::string> disksWithLogicalOnes;
    for (Found& found : all) {
        const auto blockBytes =
            readNumber(paths.blockDevicesAndPartitions() / found.disk / "queue/logical_block_size");
        if (!isExtended(found, blockBytes))
            continue;
        found.partition.kind = PartitionKind::Extended;
        disksWithLogicalOnes.insert(found.disk);
    }
    for (Found& found : all) {
        if (mayBeDos(found) && found.partition.number > kMaxPrimaryNumber &&
            disksWithLogicalOnes.count(found.disk) != 0)
            found.partition.kind = PartitionKind::Logical;
    }
}

}  // namespace

Fact<std::vector<Partition>> readPartitions(const SystemPaths& paths) {
    return listDevices(paths.blockDevicesAndPartitions()).then([&paths](const auto& entries) {
        std::vector<Found> all = readAll(paths, entries);
        tellKinds(paths, all);
        std::vector<Partition> out;
        out.reserve(all.size());
        for (Found& found : all)
            out.push_back(std::move(found.partition));
        return std::optional(std::move(out));
    });
}

}  // namespace cimomd
