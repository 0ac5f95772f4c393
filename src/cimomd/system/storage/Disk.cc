#include "system/storage/Disk.h"

#include <algorithm>
#include <array>

#include "files/TextFile.h"

namespace cimomd {
namespace {

constexpr std::array<std::string_view, 11> kOtherDevices{
    "bcache", "dm-", "drbd", "fd", "loop", "md", "mtdblock", "ram", "sr", "zd", "zram"};

/// Whether `entry` is `prefix` and a number: "md127", but not "mdisk".
bool isOfKind(std::string_view entry, std::string_view prefix) {
    return entry.substr(0, prefix.size()) == prefix &&
           entry.find_first_of("0123456789_", prefix.size()) == prefix.size();
}

/// The block device it belongs to, when it does, is the disk.
bool isPartOfADisk(const std::filesystem::path& directory) {
    return readNumber(directory / "device/size").has_value() ||
           readFlag(directory / "hidden") == true;
}

bool isDisk(const std::filesystem::path& directory) {
    const std::string entry = directory.filename().string();
    if (std::any_of(kOtherDevices.begin(), kOtherDevices.end(),
                    [&entry](std::string_view kind) { return isOfKind(entry, kind); }))
        return false;
    if (isOfKind(entry, "nbd") && readNumber(directory / "size").value_or(0) == 0)
        return false;
    return !isPartOfADisk(directory);
}

Disk readDisk(const SystemPaths& paths, const std::filesystem::path& directory) {
    Disk out;
    out.device = readBlockDevice(directory);
    out.identity = readDriveIdentity(directory, readUdevRecord(paths.udevRecords(), directory));
    out.state = readFact(directory / "device/state");
    return out;
}

}  // namespace

Fact<std::vector<Disk>> readDisks(const SystemPaths& paths) {
    return listDevices(paths.blockDevices()).then([&paths](const auto& entries) {
        std::vector<Disk> disks;
        for (const std::string& entry : entries) {
            if (isDisk(paths.blockDevices() / entry))
                disks.push_back(readDisk(paths, paths.blockDevices() / entry));
        }
        return std::optional(std::move(disks));
    });
}

}  // namespace cimomd
