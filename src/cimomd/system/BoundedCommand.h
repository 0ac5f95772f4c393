#pragma once

// Asking another program: for sources whose own tool is the interface. The program gets nothing of
// this process but its arguments, and can neither hang nor flood it.

#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct CommandLimits {
    std::size_t maxOutputBytes = std::size_t{16} << 20;
    std::chrono::milliseconds deadline = std::chrono::seconds(10);
};

/// What the program at this absolute path writes to its standard output. It runs in the C locale
/// with an empty environment, without input, its messages dropped. Absent: there is no such
/// program. NeedsRoot: it may not be executed. TimedOut: it did not end before the deadline.
/// Unreadable: it failed, or wrote more than allowed. No process of it is left behind in any case;
/// when the calling thread is ended meanwhile, the program ends with it.
Fact<std::string> outputOf(const std::filesystem::path& program,
                           const std::vector<std::string>& arguments,
                           const CommandLimits& limits = {});

}  // namespace cimomd
