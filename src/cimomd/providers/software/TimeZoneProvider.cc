#include "providers/software/TimeZoneProvider.h"

#include <fmt/format.h>

#include "providers/CimTime.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/software/TimeZoneRules.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMDateTime;
using Pegasus::Sint32;
using Pegasus::Sint8;
using Pegasus::Uint8;

constexpr std::size_t kIdLength = 256;
constexpr std::int32_t kSecondsPerDay = 86400;

/// The earliest moment a datetime can name (DSP0004): for zones that always were as they are.
constexpr const char* kSinceEver = "00000101000000.000000+720";

CIMDateTime startOf(const LocalTimeZone& zone, const Fact<TimeZoneRules>& rules) {
    std::optional<CIMDateTime> start;
    if (rules && zone.file->standardSince)
        start = cimTimeOf(*zone.file->standardSince, rules->standardOffsetMinutes);
    return start.value_or(CIMDateTime(kSinceEver));
}

/// The day of the month on or after which the weekday is meant, or -1 for the month's last day, on
/// or before which it is.
Sint8 dayOf(const YearlyChange& change) {
    constexpr int kLastWeek = 5;
    constexpr int kDaysPerWeek = 7;
    return static_cast<Sint8>(change.week == kLastWeek ? -1 : (change.week - 1) * kDaysPerWeek + 1);
}

/// Sunday is 1, and below 0 when the day is counted from the month's end.
Sint8 weekdayOf(const YearlyChange& change) {
    return static_cast<Sint8>(dayOf(change) < 0 ? -(change.weekday + 1) : change.weekday + 1);
}

std::optional<CIMDateTime> timeOfDay(const YearlyChange& change) {
    constexpr int kSecondsPerHour = 3600;
    constexpr int kSecondsPerMinute = 60;
    const std::int32_t second = change.secondOfDay;
    if (second < 0 || second >= kSecondsPerDay)
        return std::nullopt;
    return CIMDateTime(cimString(
        fmt::format("00000000{:02}{:02}{:02}.000000:000", second / kSecondsPerHour,
                    second % kSecondsPerHour / kSecondsPerMinute, second % kSecondsPerMinute)));
}

/// The names of the properties of one change.
struct ChangeProperties {
    const char* month;
    const char* day;
    const char* dayOfWeek;
    const char* startInterval;
};
constexpr ChangeProperties kStandard{"StandardMonth", "StandardDay", "StandardDayOfWeek",
                                     "StandardStartInterval"};
constexpr ChangeProperties kDaylight{"DaylightMonth", "DaylightDay", "DaylightDayOfWeek",
                                     "DaylightStartInterval"};

void addChange(InstanceBuilder& builder, const ChangeProperties& names,
               const Fact<YearlyChange>& change) {
    builder
        .value<Uint8>(names.month, change.then([](const YearlyChange& yearly) {
            return std::optional(Uint8{yearly.month});
        }))
        .value<Sint8>(names.day, change.then([](const YearlyChange& yearly) {
            return std::optional(dayOf(yearly));
        }))
        .value<Sint8>(names.dayOfWeek, change.then([](const YearlyChange& yearly) {
            return std::optional(weekdayOf(yearly));
        }))
        .value<CIMDateTime>(names.startInterval, change.then(timeOfDay));
}

Fact<TimeZoneRules> rulesOf(const LocalTimeZone& zone) {
    return zone.file.then([](const TimeZoneFile& file) { return parseTimeZoneRules(file.rules); },
                          Absence::Unreadable);
}

Fact<std::string> nonEmptyRules(const LocalTimeZone& zone) {
    return zone.file.then([](const TimeZoneFile& file) {
        return file.rules.empty() ? std::nullopt : std::optional(file.rules);
    });
}

}  // namespace

std::unique_ptr<InstanceStream> TimeZoneProvider::enumerate() const {
    const LocalTimeZone zone = readLocalTimeZone(paths, calls.now());
    if (!zone.name && !nonEmptyRules(zone))
        return std::make_unique<EmptyStream>(zone.file.reason());
    return std::make_unique<RecordStream<LocalTimeZone>>(std::vector{zone}, publish);
}

ProvidedInstance TimeZoneProvider::publish(const LocalTimeZone& zone) {
    const Fact<TimeZoneRules> rules = rulesOf(zone);
    const Fact<std::string> posixRules = nonEmptyRules(zone);
    const std::string id = zone.name ? *zone.name : posixRules.value_or("");
    const Fact<DaylightRules> daylight =
        rules.then([](const TimeZoneRules& known) { return known.daylight; }, Absence::Absent);
    InstanceBuilder builder(kClassName);
    builder.label(id)
        .key("TimeZoneID", id, kIdLength)
        .value<CIMDateTime>("TimeZoneStartDate", startOf(zone, rules))
        .text("StandardName", rules.then([](const TimeZoneRules& known) {
            return std::optional(known.standardName);
        }))
        .value<Sint32>("StandardOffset", rules.then([](const TimeZoneRules& known) {
            return std::optional(Sint32{known.standardOffsetMinutes});
        }))
        .text("DaylightName",
              daylight.then([](const DaylightRules& known) { return std::optional(known.name); }))
        .value<Sint32>("DaylightOffset", daylight.then([](const DaylightRules& known) {
            return std::optional(Sint32{known.offsetMinutes});
        }))
        .text("PosixRules", posixRules);
    addChange(builder, kStandard,
              daylight.then([](const DaylightRules& known) { return known.end; }, Absence::Absent));
    addChange(
        builder, kDaylight,
        daylight.then([](const DaylightRules& known) { return known.start; }, Absence::Absent));
    return builder.take();
}

}  // namespace cimomd
