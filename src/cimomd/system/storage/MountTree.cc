#include "system/storage/MountTree.h"

#include <algorithm>
#include <set>

namespace cimomd {
namespace {

// Stands for the parent of mounts whose own is out of sight, as in a container.
constexpr std::string_view kNoParent;

// No path leads through more mounts; only a table that contradicts itself could.
constexpr std::size_t kMaxWay = 1000;

}  // namespace

MountTree::MountTree(const std::vector<Mount>& mounts) {
    std::set<std::string_view> ids;
    for (const Mount& mount : mounts)
        ids.insert(mount.id);
    for (const Mount& mount : mounts) {
        const bool hasParent = mount.parentId != mount.id && ids.count(mount.parentId) != 0;
        mountedOn[{hasParent ? std::string_view(mount.parentId) : kNoParent, mount.mountPoint}] =
            &mount;
    }
}

std::vector<const Mount*> MountTree::wayTo(std::string_view path) const {
    std::vector<const Mount*> way;
    std::size_t end = 0;
    while (end != std::string_view::npos) {
        const std::string_view place = path.substr(0, std::max(end, std::size_t{1}));
        // Several mounts can lie on top of each other.
        while (way.size() < kMaxWay) {
            const auto next =
                mountedOn.find({way.empty() ? kNoParent : std::string_view(way.back()->id), place});
            if (next == mountedOn.end())
                break;
            way.push_back(next->second);
        }
        end = end >= path.size() ? std::string_view::npos
                                 : std::min(path.find('/', end + 1), path.size());
    }
    return way;
}

}  // namespace cimomd
