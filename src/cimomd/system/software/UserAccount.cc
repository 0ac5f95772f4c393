#include "system/software/UserAccount.h"

#include <lastlog.h>
#include <cstring>
#include <unordered_set>

#include "files/BoundedFile.h"
#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/software/AccountFields.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

enum Field : std::size_t {
    kName,
    kPassword,
    kUserId,
    kGroupId,
    kComments,
    kHomeDirectory,
    kShell,
    kFieldCount
};

Fact<std::string> textOrNothing(std::string_view field) {
    return field.empty() ? Fact<std::string>() : Fact<std::string>(std::string(field));
}

}  // namespace

std::vector<UserAccount> parseUserAccounts(std::string_view text) {
    std::vector<UserAccount> accounts;
    std::unordered_set<std::string_view> names;
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = partsOf(line, ':');
        if (fields.size() != kFieldCount || !isAccountName(fields[kName]))
            continue;
        const auto userId = accountNumber(fields[kUserId]);
        const auto groupId = accountNumber(fields[kGroupId]);
        if (!userId || !groupId || !names.insert(fields[kName]).second)
            continue;
        accounts.push_back({std::string(fields[kName]), *userId, *groupId,
                            listedTexts(fields[kComments]), textOrNothing(fields[kHomeDirectory]),
                            textOrNothing(trimmed(fields[kShell]))});
    }
    return accounts;
}

Fact<std::vector<UserAccount>> readUserAccounts(const std::filesystem::path& path) {
    return readText(path, kMaxAccountFileBytes).then([](const std::string& text) {
        return std::optional(parseUserAccounts(text));
    });
}

std::optional<std::int64_t> parseLastLogin(std::string_view record) {
    lastlog entry{};
    if (record.size() < sizeof entry)
        return std::nullopt;
    std::memcpy(&entry, record.data(), sizeof entry);
    // Some architectures declare it signed; it is read as unsigned until 2106.
    const auto time = static_cast<std::uint32_t>(entry.ll_time);
    return time == 0 ? std::nullopt : std::optional<std::int64_t>(time);
}

Fact<std::int64_t> readLastLogin(const std::filesystem::path& path, std::uint32_t userId) {
    const FileContent record =
        readFilePart(path, std::uint64_t{userId} * sizeof(lastlog), sizeof(lastlog));
    if (record.status != FileStatus::Read)
        return absenceOf(record.status);
    return parseLastLogin(record.bytes);
}

}  // namespace cimomd
