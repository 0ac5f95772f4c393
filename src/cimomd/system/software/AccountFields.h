#pragma once

// What the files of accounts and groups have in common.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

/// A hundred thousand accounts of ordinary length fit.
inline constexpr std::size_t kMaxAccountFileBytes = std::size_t{16} << 20;

/// Whether it is a name at all, and none of the signs for names of the network information service.
bool isAccountName(std::string_view name);

/// A user or group number; the largest one stands for "none" in system calls and is nobody's.
std::optional<std::uint32_t> accountNumber(std::string_view text);

/// What stands between commas, without blanks around it; empty parts are left out.
std::vector<std::string> listedTexts(std::string_view field);

}  // namespace cimomd
