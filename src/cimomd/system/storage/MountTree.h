#pragma once

// Which mounts a path leads through. A mount can be hidden: by another at the same place, or by one
// that was put over a directory above it.

#include <map>
#include <string_view>
#include <utility>
#include <vector>

#include "system/storage/MountInfo.h"

namespace cimomd {

class MountTree {
  public:
    /// Looks into `mounts`, which must outlive it and stay unchanged.
    explicit MountTree(const std::vector<Mount>& mounts);

    /// The mounts that the kernel passes when it looks up the absolute `path`; the last is the one
    /// that shows there. Empty when there is none.
    std::vector<const Mount*> wayTo(std::string_view path) const;

  private:
    using ParentAndPlace = std::pair<std::string_view, std::string_view>;

    std::map<ParentAndPlace, const Mount*> mountedOn;
};

}  // namespace cimomd
