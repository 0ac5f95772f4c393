#pragma once

// group(5): the groups of this machine. Passwords are neither read nor kept.

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct UserGroup {
    std::string name;
    std::uint32_t groupId = 0;
    /// Those the file names; accounts whose first group this is are not among them.
    std::vector<std::string> members;
};

/// In the order of the file. Lines that are no group are dropped; of equal names the first counts.
std::vector<UserGroup> parseUserGroups(std::string_view text);

Fact<std::vector<UserGroup>> readUserGroups(const std::filesystem::path& path);

}  // namespace cimomd
