#pragma once

// One line for the administrator on standard error, which the journal or a terminal shows.

#include <string_view>

namespace cimomd {

/// As syslog numbers them.
enum class LogLevel { Error = 3, Warning = 4, Info = 6 };

/// Writes "cimomd: <text>" in one piece. Control characters in `text` become "?", so that nobody
/// can forge lines. The journal gets the level in front, as its protocol has it.
void logLine(LogLevel level, std::string_view text);

}  // namespace cimomd
