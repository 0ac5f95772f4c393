#pragma once

// The compiled form of a time zone, TZif (RFC 9636), as far as an inventory needs it.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

struct TimeZoneFile {
    /// The rules for all times after those in the file, in POSIX' form.
    std::string rules;
    /// When the standard time in force began, in seconds since 1970; nothing when it always was.
    std::optional<std::int64_t> standardSince;
};

/// Changes after `now` are not looked at. Nothing when `bytes` is no such file, or one of the first
/// version, which has no rules.
std::optional<TimeZoneFile> parseTimeZoneFile(std::string_view bytes, std::int64_t now);

}  // namespace cimomd
