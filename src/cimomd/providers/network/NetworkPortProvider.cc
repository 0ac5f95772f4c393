#include "providers/network/NetworkPortProvider.h"

#include "providers/network/NetworkPort.h"

namespace cimomd {

std::unique_ptr<InstanceStream> NetworkPortProvider::enumerate() const {
    return streamInterfaces(
        paths, calls, choice,
        [&systemCalls = calls, publish = publisher](const auto& hostName, const auto& interface) {
            return publish(hostName, interface, systemCalls.linkSettings(interface.name));
        });
}

}  // namespace cimomd
