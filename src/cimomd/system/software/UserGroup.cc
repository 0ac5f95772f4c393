#include "system/software/UserGroup.h"

#include <unordered_set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/software/AccountFields.h"

namespace cimomd {
namespace {

enum Field : std::size_t { kName, kPassword, kGroupId, kMembers, kFieldCount };

}  // namespace

std::vector<UserGroup> parseUserGroups(std::string_view text) {
    std::vector<UserGroup> groups;
    std::unordered_set<std::string_view> names;
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = partsOf(line, ':');
        if (fields.size() != kFieldCount || !isAccountName(fields[kName]))
            continue;
        const auto groupId = accountNumber(fields[kGroupId]);
        if (groupId && names.insert(fields[kName]).second)
            groups.push_back({std::string(fields[kName]), *groupId, listedTexts(fields[kMembers])});
    }
    return groups;
}

Fact<std::vector<UserGroup>> readUserGroups(const std::filesystem::path& path) {
    return readText(path, kMaxAccountFileBytes).then([](const std::string& text) {
        return std::optional(parseUserGroups(text));
    });
}

}  // namespace cimomd
