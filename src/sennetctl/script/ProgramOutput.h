#pragma once

// Asking another program of the system.

#include <string>
#include <vector>

namespace sennetctl {

/// What the program writes to its standard output, no more than 64 KiB of it; its messages are
/// dropped. Empty when it cannot be started, or does not end its output in time.
/// @param words    the program, which is looked for in PATH, and its arguments
/// @param seconds  how long it may be silent
std::string outputOf(std::vector<std::string> words, unsigned seconds);

}  // namespace sennetctl
