#pragma once

// The rules of a time zone as POSIX writes them, for example "CET-1CEST,M3.5.0,M10.5.0/3".

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

/// A day in each year, and a time of that day.
struct YearlyChange {
    /// 1 to 12.
    std::uint8_t month = 1;
    /// The first to fourth such day of the month; 5 is the last.
    std::uint8_t week = 1;
    /// 0 is Sunday.
    std::uint8_t weekday = 0;
    /// Local time in force until then; below 0 and above a day's end it counts into other days.
    std::int32_t secondOfDay = 0;
};

struct DaylightRules {
    std::string name;
    /// How far daylight time is ahead of UTC.
    int offsetMinutes = 0;
    /// Nothing when the rules count days in another way than by weeks.
    std::optional<YearlyChange> start;
    std::optional<YearlyChange> end;
};

struct TimeZoneRules {
    std::string standardName;
    /// How far standard time is ahead of UTC.
    int standardOffsetMinutes = 0;
    std::optional<DaylightRules> daylight;
};

/// Nothing when `text` is not of the form above.
std::optional<TimeZoneRules> parseTimeZoneRules(std::string_view text);

}  // namespace cimomd
