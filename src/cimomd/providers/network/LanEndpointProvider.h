#pragma once

// Where the computer takes part in local networks: every interface with a hardware address, virtual
// ones included. Reads /sys/class/net.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/network/NetworkInterface.h"

namespace cimomd {

class LanEndpointProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_LANEndpoint";

    /// `systemCalls` must outlive the provider.
    LanEndpointProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const NetworkInterface& interface);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
