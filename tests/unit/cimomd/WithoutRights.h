#pragma once

// A thread that may read no more than any user, though the tests may be run by root.

#include <sys/fsuid.h>

#include <filesystem>

#include "RecordedTree.h"

namespace cimomd {

/// While it lives, this thread's file accesses are those of a user without any rights.
class WithoutRights {
    static constexpr uid_t kNobody = 65534;

  public:
    WithoutRights() : owner(static_cast<uid_t>(::setfsuid(kNobody))) {}
    WithoutRights(const WithoutRights&) = delete;
    WithoutRights& operator=(const WithoutRights&) = delete;
    ~WithoutRights() { ::setfsuid(owner); }

  private:
    uid_t owner;
};

/// Leaves a file of the tree to root, and lets everyone look into the tree's root.
inline void forbid(const RecordedTree& tree, const std::string& path) {
    namespace fs = std::filesystem;
    fs::permissions(tree.root, fs::perms{0755});
    fs::permissions(tree.root / path, fs::perms::none);
}

}  // namespace cimomd
