#include "system/storage/MountedFileSystem.h"

#include <algorithm>
#include <array>
#include <map>

#include "system/storage/MountTree.h"

namespace cimomd {
namespace {

constexpr std::array<std::string_view, 4> kSystemDirectories{"/dev", "/proc", "/run", "/sys"};

bool isInSystemDirectory(std::string_view path) {
    return std::any_of(
        kSystemDirectories.begin(), kSystemDirectories.end(), [path](std::string_view directory) {
            return path == directory || (path.substr(0, directory.size()) == directory &&
                                         path.substr(directory.size(), 1) == "/");
        });
}

bool isListed(const Mount& mount, FileSystemKind kind) {
    return fileSystemKindOf(mount.type) == kind &&
           !(isTemporary(mount.type) && isInSystemDirectory(mount.mountPoint));
}

}  // namespace

std::vector<MountedFileSystem> mountedFileSystems(const std::vector<Mount>& mounts,
                                                  FileSystemKind kind) {
    const MountTree tree(mounts);
    std::vector<MountedFileSystem> out;
    std::map<std::string_view, std::size_t> placeOfDevice;
    for (const Mount& mount : mounts) {
        if (!isListed(mount, kind))
            continue;
        const auto way = tree.wayTo(mount.mountPoint);
        if (way.empty() || way.back() != &mount)
            continue;
        const bool mayWait = std::any_of(way.begin(), way.end(),
                                         [](const Mount* on) { return !answersAtOnce(on->type); });
        const auto [place, isNew] = placeOfDevice.emplace(mount.device, out.size());
        if (isNew)
            out.push_back({mount, mayWait});
        else if (out[place->second].mount.fileSystemRoot != "/" && mount.fileSystemRoot == "/")
            out[place->second] = {mount, mayWait};
    }
    return out;
}

Fact<FileSystemSize> sizeOf(const MountedFileSystem& fileSystem, const SystemCalls& calls) {
    const Mount& mount = fileSystem.mount;
    return fileSystem.mayWait ? calls.fileSystemSizeInTime(mount.mountPoint, mount.device)
                              : calls.fileSystemSize(mount.mountPoint);
}

}  // namespace cimomd
