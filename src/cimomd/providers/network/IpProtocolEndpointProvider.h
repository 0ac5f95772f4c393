#pragma once

// The internet addresses of all network interfaces, of both versions, as the kernel tells them over
// rtnetlink.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"

namespace cimomd {

class IpProtocolEndpointProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_IPProtocolEndpoint";

    /// `systemCalls` must outlive the provider.
    IpProtocolEndpointProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const InterfaceAddress& address);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
