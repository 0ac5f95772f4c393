#include "system/storage/MountInfo.h"

#include <algorithm>
#include <array>
#include <map>
#include <optional>

#include "files/TextFields.h"

namespace cimomd {
namespace {

constexpr std::size_t kFixedFields = 6;
constexpr std::size_t kFieldsAfterDash = 3;

// File systems on devices of this machine, where statvfs does not wait for anybody else.
constexpr std::array<std::string_view, 25> kLocalTypes{
    "bcachefs", "btrfs", "exfat", "ext2",  "ext3",   "ext4", "f2fs",  "hfs",   "hfsplus",
    "iso9660",  "jfs",   "minix", "msdos", "nilfs2", "ntfs", "ntfs3", "ramfs", "reiserfs",
    "tmpfs",    "ubifs", "udf",   "ufs",   "vfat",   "xfs",  "zfs"};

constexpr std::array<std::string_view, 4> kSystemDirectories{"/dev", "/proc", "/run", "/sys"};

bool hasOption(std::string_view options, std::string_view wanted) {
    while (!options.empty()) {
        const std::size_t comma = options.find(',');
        if (options.substr(0, comma) == wanted)
            return true;
        options.remove_prefix(comma == std::string_view::npos ? options.size() : comma + 1);
    }
    return false;
}

/// id parent major:minor root point options [tags...] - type source options
std::optional<Mount> parseLine(std::string_view line) {
    const std::vector<std::string_view> fields = fieldsOf(line);
    if (fields.size() < kFixedFields)
        return std::nullopt;
    const auto dash = std::find(fields.begin() + kFixedFields, fields.end(), "-");
    if (static_cast<std::size_t>(fields.end() - dash) < kFieldsAfterDash + 1)
        return std::nullopt;
    Mount mount;
    mount.device = fields[2];
    mount.fileSystemRoot = unescapeOctal(fields[3]);
    mount.mountPoint = unescapeOctal(fields[4]);
    mount.type = dash[1];
    mount.source = unescapeOctal(dash[2]);
    mount.readOnly = hasOption(fields[5], "ro") || hasOption(dash[3], "ro");
    return mount;
}

bool isTemporary(const Mount& mount) {
    return mount.type == "tmpfs" || mount.type == "ramfs";
}

bool isInSystemDirectory(std::string_view path) {
    return std::any_of(
        kSystemDirectories.begin(), kSystemDirectories.end(), [path](std::string_view directory) {
            return path == directory || (path.substr(0, directory.size()) == directory &&
                                         path.substr(directory.size(), 1) == "/");
        });
}

bool isListed(const Mount& mount) {
    if (std::find(kLocalTypes.begin(), kLocalTypes.end(), mount.type) == kLocalTypes.end())
        return false;
    return !isTemporary(mount) || !isInSystemDirectory(mount.mountPoint);
}

}  // namespace

std::vector<Mount> parseMountInfo(std::string_view text) {
    std::vector<Mount> mounts;
    for (const std::string_view line : linesOf(text)) {
        if (auto mount = parseLine(line))
            mounts.push_back(std::move(*mount));
    }
    return mounts;
}

std::vector<Mount> localFileSystems(const std::vector<Mount>& mounts) {
    std::map<std::string_view, const Mount*> visibleAt;
    for (const Mount& mount : mounts)
        visibleAt[mount.mountPoint] = &mount;
    std::vector<Mount> out;
    std::map<std::string_view, std::size_t> placeOfDevice;
    for (const Mount& mount : mounts) {
        if (!isListed(mount) || visibleAt[mount.mountPoint] != &mount)
            continue;
        const auto [place, isNew] = placeOfDevice.emplace(mount.device, out.size());
        if (isNew)
            out.push_back(mount);
        else if (out[place->second].fileSystemRoot != "/" && mount.fileSystemRoot == "/")
            out[place->second] = mount;
    }
    return out;
}

}  // namespace cimomd
