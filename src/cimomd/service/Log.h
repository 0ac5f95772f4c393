#pragma once

// Messages for the administrator on standard error, which the journal or a terminal shows.

#include <string_view>

namespace cimomd {

/// As syslog numbers them.
enum class LogLevel { Error = 3, Warning = 4, Info = 6 };

/// Writes "cimomd: " and a line of `text`, for each of its lines, in one piece. Control characters
/// become "?". The journal gets the level in front, as its protocol has it.
void logText(LogLevel level, std::string_view text);

}  // namespace cimomd
