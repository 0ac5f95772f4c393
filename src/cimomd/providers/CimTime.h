#pragma once

// Points in time as CIM writes them.

#include <Pegasus/Common/CIMDateTime.h>

#include <cstdint>
#include <optional>

namespace cimomd {

/// The datetime of `time` (seconds since 1970 UTC) in a zone that is `offsetMinutes` ahead of UTC;
/// nothing outside the years 1 to 9999 or for offsets that three digits cannot show.
std::optional<Pegasus::CIMDateTime> cimTimeOf(std::int64_t time, int offsetMinutes);

}  // namespace cimomd
