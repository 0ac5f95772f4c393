// The bounds that the kernel's control groups set to the memory of this process.

#pragma once

#include <Pegasus/Common/Config.h>

#include <string>

namespace Pegasus {

/// The least limit of the control groups of this process and of all groups around them, in octets,
/// of version 1 and 2; the greatest Uint64 where there is none. `root` stands before the paths of
/// the kernel's files, without a slash at its end.
Uint64 controlGroupMemoryLimit(const std::string& root = {});

}  // namespace Pegasus
