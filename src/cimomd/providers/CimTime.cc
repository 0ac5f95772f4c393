#include "providers/CimTime.h"

#include <fmt/format.h>

#include <cstdlib>
#include <ctime>

#include "text/CimText.h"

namespace cimomd {

std::optional<Pegasus::CIMDateTime> cimTimeOf(std::int64_t time, int offsetMinutes) {
    constexpr std::int64_t kFirst = -62135596800;
    constexpr std::int64_t kLast = 253402300799;
    const std::int64_t offsetSeconds = std::int64_t{offsetMinutes} * 60;
    if (std::abs(offsetMinutes) > 999 || time < kFirst - offsetSeconds ||
        time > kLast - offsetSeconds)
        return std::nullopt;
    const std::time_t local = time + offsetSeconds;
    std::tm parts{};
    if (::gmtime_r(&local, &parts) == nullptr)
        return std::nullopt;
    return Pegasus::CIMDateTime(cimString(
        fmt::format("{:04}{:02}{:02}{:02}{:02}{:02}.000000{}{:03}", parts.tm_year + 1900,
                    parts.tm_mon + 1, parts.tm_mday, parts.tm_hour, parts.tm_min, parts.tm_sec,
                    offsetMinutes < 0 ? '-' : '+', std::abs(offsetMinutes))));
}

}  // namespace cimomd
