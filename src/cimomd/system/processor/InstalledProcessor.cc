#include "system/processor/InstalledProcessor.h"

#include <algorithm>

namespace cimomd {

std::vector<InstalledProcessor> installedProcessors(
    const std::vector<ProcessorPackage>& packages,
    const Fact<std::vector<ProcessorSocket>>& sockets) {
    std::vector<ProcessorSocket> known = sockets.value_or({});
    const auto firstDisabled =
        std::stable_partition(known.begin(), known.end(),
                              [](const ProcessorSocket& socket) { return !socket.isDisabled(); });
    const auto enabledCount = static_cast<std::size_t>(firstDisabled - known.begin());
    std::vector<InstalledProcessor> out;
    for (std::size_t i = 0; i < packages.size(); ++i) {
        Fact<ProcessorSocket> socket(sockets ? Absence::Unreadable : sockets.reason());
        if (enabledCount == packages.size())
            socket = known[i];
        out.push_back({packages[i], socket});
    }
    for (auto socket = firstDisabled; socket != known.end(); ++socket)
        out.push_back({std::nullopt, *socket});
    return out;
}

}  // namespace cimomd
