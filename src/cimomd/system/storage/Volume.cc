#include "system/storage/Volume.h"

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

bool isDirectory(const std::filesystem::path& path) {
    std::error_code error;
    return std::filesystem::is_directory(path, error);
}

/// While its number of disks changes an array shows the old one behind the new: "4 (3)".
std::optional<std::uint64_t> diskCountIn(const std::string& text) {
    const auto fields = fieldsOf(text);
    return fields.empty() ? std::nullopt : parseUnsigned(fields.front());
}

RaidState readRaidState(const std::filesystem::path& directory) {
    RaidState out;
    out.level = readFact(directory / "level");
    out.arrayState = readFact(directory / "array_state");
    out.syncAction = readFact(directory / "sync_action");
    out.disks = readFact(directory / "raid_disks").then(diskCountIn);
    out.missingDisks = readNumber(directory / "degraded");
    return out;
}

Fact<std::vector<std::string>> readMembers(const std::filesystem::path& directory) {
    return listDevices(directory).then([](std::vector<std::string> names) {
        for (std::string& name : names)
            name = deviceNameOf(name);
        return std::optional(std::move(names));
    });
}

/// An array that is not running, and a mapping without a table, have the size 0 meanwhile.
Fact<std::uint64_t> sizeOfActive(const Fact<std::uint64_t>& sectors) {
    return sectors.then(
        [](std::uint64_t count) { return count == 0 ? std::nullopt : std::optional(count); },
        Absence::Absent);
}

Volume readVolume(const std::filesystem::path& directory) {
    Volume out;
    out.device = readBlockDevice(directory);
    out.device.sizeSectors = sizeOfActive(out.device.sizeSectors);
    out.isRaid = isDirectory(directory / "md");
    out.members = readMembers(directory / "slaves");
    if (out.isRaid) {
        out.raid = readRaidState(directory / "md");
        out.uuid = readFact(directory / "md/uuid");
    } else {
        out.mapperName = readFact(directory / "dm/name");
        out.uuid = readFact(directory / "dm/uuid");
        out.isSuspended = readFlag(directory / "dm/suspended");
    }
    return out;
}

}  // namespace

Fact<std::vector<Volume>> readVolumes(const SystemPaths& paths) {
    return listDevices(paths.blockDevices()).then([&paths](const auto& entries) {
        std::vector<Volume> volumes;
        for (const std::string& entry : entries) {
            const std::filesystem::path directory = paths.blockDevices() / entry;
            if (isDirectory(directory / "dm") || isDirectory(directory / "md"))
                volumes.push_back(readVolume(directory));
        }
        return std::optional(std::move(volumes));
    });
}

}  // namespace cimomd
