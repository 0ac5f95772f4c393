#pragma once

// The time zone the machine is in.

#include <cstdint>
#include <string>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/software/TimeZoneFile.h"

namespace cimomd {

struct LocalTimeZone {
    /// For example "Europe/Berlin".
    Fact<std::string> name;
    Fact<TimeZoneFile> file;
};

/// The name from the link /etc/localtime, else from /etc/timezone.
LocalTimeZone readLocalTimeZone(const SystemPaths& paths, std::int64_t now);

}  // namespace cimomd
