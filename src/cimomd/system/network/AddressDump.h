#pragma once

// The internet addresses of this machine's interfaces, asked from the kernel over rtnetlink(7),
// which alone tells how long an address stays and who set it.

#include <vector>

#include "system/Fact.h"
#include "system/network/InterfaceAddress.h"

namespace cimomd {

/// In the kernel's order, at most 100,000. TimedOut when the kernel does not answer within two
/// seconds, Unreadable when it refuses or when the addresses change again and again meanwhile.
Fact<std::vector<InterfaceAddress>> dumpAddresses();

}  // namespace cimomd
