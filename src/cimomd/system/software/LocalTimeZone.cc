#include "system/software/LocalTimeZone.h"

#include "files/LinkTarget.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

std::optional<std::string> nameIn(const std::string& target) {
    constexpr std::string_view kDirectory = "zoneinfo/";
    const std::size_t place = target.rfind(kDirectory);
    if (place == std::string::npos || place + kDirectory.size() == target.size())
        return std::nullopt;
    return target.substr(place + kDirectory.size());
}

/// Below the root, also where the link starts at "/".
std::filesystem::path fileOf(const SystemPaths& paths, const Fact<std::string>& target) {
    if (!target)
        return paths.localTime();
    const auto path = (std::filesystem::path("/etc") / *target).lexically_normal();
    return paths.below(path.relative_path().string());
}

}  // namespace

LocalTimeZone readLocalTimeZone(const SystemPaths& paths, std::int64_t now) {
    LocalTimeZone out;
    const Fact<std::string> target = linkTargetOf(paths.localTime());
    out.name = target.then(nameIn, Absence::Absent);
    if (!out.name)
        out.name = readFact(paths.timeZoneName());
    out.file = readText(fileOf(paths, target))
                   .then([now](const std::string& bytes) { return parseTimeZoneFile(bytes, now); },
                         Absence::Unreadable);
    return out;
}

}  // namespace cimomd
