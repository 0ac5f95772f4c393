#include "system/storage/MountedFileSystem.h"

#include <algorithm>
#include <array>
#include <map>
#include <tuple>

#include "system/storage/MountTree.h"

namespace cimomd {
namespace {

constexpr std::array<std::string_view, 4> kSystemDirectories{"/dev", "/proc", "/run", "/sys"};

constexpr std::array<std::string_view, 2> kCoverDirectories{"/systemd/inaccessible/",
                                                            "/host/inaccessible/"};

bool isInSystemDirectory(std::string_view path) {
    return std::any_of(
        kSystemDirectories.begin(), kSystemDirectories.end(), [path](std::string_view directory) {
            return path == directory || (path.substr(0, directory.size()) == directory &&
                                         path.substr(directory.size(), 1) == "/");
        });
}

// systemd mounts a part of its own temporary file system over what a service shall not see.
bool coversADirectory(const Mount& mount) {
    return std::any_of(kCoverDirectories.begin(), kCoverDirectories.end(),
                       [&mount](std::string_view directory) {
                           return mount.fileSystemRoot.find(directory) != std::string::npos;
                       });
}

bool isListed(const Mount& mount, FileSystemKind kind) {
    return fileSystemKindOf(mount.type) == kind &&
           !(isTemporary(mount.type) &&
             (isInSystemDirectory(mount.mountPoint) || coversADirectory(mount)));
}

// The order of the table is not asked: a service can have its mounts in another one.
bool namesBetter(const Mount& left, const Mount& right) {
    const auto rank = [](const Mount& mount) {
        return std::make_tuple(mount.fileSystemRoot != "/", mount.mountPoint.size(),
                               std::string_view(mount.mountPoint));
    };
    return rank(left) < rank(right);
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
        else if (namesBetter(mount, out[place->second].mount))
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
