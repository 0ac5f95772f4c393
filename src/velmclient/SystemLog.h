// The one place where this library speaks of failures.
#pragma once

#include <string>

namespace Velm {

// Reports to the system log that `action` (a verb, such as "read") failed on a path, with the text
// of the error number. Leaves errno as it was.
void logFailure(const char* action, const std::string& path, int error);

}  // namespace Velm
