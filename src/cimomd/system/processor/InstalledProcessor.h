#pragma once

// The processors of this machine: what the kernel sees, beside what the firmware says.

#include <optional>
#include <vector>

#include "system/Fact.h"
#include "system/processor/ProcessorPackage.h"
#include "system/processor/ProcessorSocket.h"

namespace cimomd {

struct InstalledProcessor {
    /// Nothing for a processor that the firmware has disabled: the kernel does not see it.
    std::optional<ProcessorPackage> package;
    Fact<ProcessorSocket> socket;
};

/// The packages in their order, then the disabled processors. Neither side names the other: they
/// are taken in their order, and only when they are equally many. When they are not, the sockets of
/// the packages are Unreadable.
std::vector<InstalledProcessor> installedProcessors(
    const std::vector<ProcessorPackage>& packages,
    const Fact<std::vector<ProcessorSocket>>& sockets);

}  // namespace cimomd
