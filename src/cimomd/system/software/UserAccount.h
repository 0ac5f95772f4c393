#pragma once

// passwd(5): the accounts of this machine. Passwords are neither read nor kept, wherever they are.

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct UserAccount {
    std::string name;
    std::uint32_t userId = 0;
    std::uint32_t groupId = 0;
    /// Full name, office, telephone numbers; empty ones are left out.
    std::vector<std::string> comments;
    Fact<std::string> homeDirectory;
    Fact<std::string> shell;
};

/// In the order of the file. Lines that are no account, and those of the network information
/// service, are dropped; of equal names the first counts, as everywhere.
std::vector<UserAccount> parseUserAccounts(std::string_view text);

Fact<std::vector<UserAccount>> readUserAccounts(const std::filesystem::path& path);

/// The time in a record of lastlog(8), in seconds since 1970; nothing when there was no login.
std::optional<std::int64_t> parseLastLogin(std::string_view record);

/// The last login in the file at `path`, which is as long as the largest user number demands and
/// mostly made of holes: only the account's own record is read.
Fact<std::int64_t> readLastLogin(const std::filesystem::path& path, std::uint32_t userId);

}  // namespace cimomd
