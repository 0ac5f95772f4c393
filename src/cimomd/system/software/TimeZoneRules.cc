#include "system/software/TimeZoneRules.h"

#include <charconv>

namespace cimomd {
namespace {

constexpr std::int32_t kSecondsPerMinute = 60;
constexpr std::int32_t kSecondsPerHour = 3600;
constexpr int kMinutesPerHour = 60;
constexpr std::int32_t kDefaultChangeTime = 2 * kSecondsPerHour;

bool isLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

/// Takes a text apart from its front.
class RulesReader {
  public:
    explicit RulesReader(std::string_view text) : rest(text) {}

    bool atEnd() const { return rest.empty(); }
    bool isNext(char c) const { return !rest.empty() && rest.front() == c; }
    bool take(char c) {
        if (!isNext(c))
            return false;
        rest.remove_prefix(1);
        return true;
    }

    /// At least three letters, or anything between angle brackets.
    std::optional<std::string> name() {
        constexpr std::size_t kShortest = 3;
        const bool isQuoted = take('<');
        std::size_t length = 0;
        while (length < rest.size() && (isQuoted ? rest[length] != '>' : isLetter(rest[length])))
            ++length;
        const std::string found(rest.substr(0, length));
        rest.remove_prefix(length);
        if (length < kShortest || (isQuoted && !take('>')))
            return std::nullopt;
        return found;
    }

    std::optional<std::int32_t> number(std::int32_t largest) {
        std::int32_t value = 0;
        const auto [stop, error] = std::from_chars(rest.data(), rest.data() + rest.size(), value);
        if (error != std::errc() || rest.front() == '-' || value > largest)
            return std::nullopt;
        rest.remove_prefix(static_cast<std::size_t>(stop - rest.data()));
        return value;
    }

    /// [+-]hours[:minutes[:seconds]] in seconds.
    std::optional<std::int32_t> time() {
        constexpr std::int32_t kMostHours = 167;
        constexpr std::int32_t kMostMinutes = 59;
        const bool isNegative = take('-');
        if (!isNegative)
            take('+');
        std::optional<std::int32_t> part = number(kMostHours);
        std::int32_t seconds = part.value_or(0) * kSecondsPerHour;
        for (const std::int32_t unit : {kSecondsPerMinute, 1}) {
            if (!part || !take(':'))
                break;
            part = number(kMostMinutes);
            seconds += part.value_or(0) * unit;
        }
        return part ? std::optional(isNegative ? -seconds : seconds) : std::nullopt;
    }

    /// Everything up to a comma or the end.
    std::string_view untilComma() {
        const std::string_view part = rest.substr(0, rest.find(','));
        rest.remove_prefix(part.size());
        return part;
    }

  private:
    std::string_view rest;
};

/// POSIX counts what has to be added to local time.
std::optional<int> offsetMinutes(RulesReader& reader) {
    const auto seconds = reader.time();
    return seconds ? std::optional(-*seconds / kSecondsPerMinute) : std::nullopt;
}

std::optional<YearlyChange> parseChange(std::string_view text) {
    constexpr std::int32_t kMonths = 12;
    constexpr std::int32_t kLastWeek = 5;
    constexpr std::int32_t kSaturday = 6;
    RulesReader reader(text);
    if (!reader.take('M'))
        return std::nullopt;
    const auto month = reader.number(kMonths);
    const auto week = reader.take('.') ? reader.number(kLastWeek) : std::nullopt;
    const auto weekday = reader.take('.') ? reader.number(kSaturday) : std::nullopt;
    const auto time = reader.take('/') ? reader.time() : std::optional(kDefaultChangeTime);
    if (!month || *month == 0 || !week || *week == 0 || !weekday || !time || !reader.atEnd())
        return std::nullopt;
    return YearlyChange{static_cast<std::uint8_t>(*month), static_cast<std::uint8_t>(*week),
                        static_cast<std::uint8_t>(*weekday), *time};
}

std::optional<DaylightRules> parseDaylight(RulesReader& reader, int standardOffsetMinutes) {
    const auto name = reader.name();
    if (!name)
        return std::nullopt;
    DaylightRules out{*name, standardOffsetMinutes + kMinutesPerHour, {}, {}};
    if (!reader.atEnd() && !reader.isNext(',')) {
        const auto offset = offsetMinutes(reader);
        if (!offset)
            return std::nullopt;
        out.offsetMinutes = *offset;
    }
    if (reader.take(','))
        out.start = parseChange(reader.untilComma());
    if (reader.take(','))
        out.end = parseChange(reader.untilComma());
    return reader.atEnd() ? std::optional(out) : std::nullopt;
}

}  // namespace

std::optional<TimeZoneRules> parseTimeZoneRules(std::string_view text) {
    RulesReader reader(text);
    const auto name = reader.name();
    const auto offset = name ? offsetMinutes(reader) : std::nullopt;
    if (!offset)
        return std::nullopt;
    TimeZoneRules out{*name, *offset, {}};
    if (reader.atEnd())
        return out;
    out.daylight = parseDaylight(reader, *offset);
    return out.daylight ? std::optional(out) : std::nullopt;
}

}  // namespace cimomd
