#pragma once

// The wireless LAN ports. Reads /sys/class/net and asks the drivers for the address burnt in, which
// the one in use often is not: random addresses are common on wireless networks.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/network/NetworkInterface.h"

namespace cimomd {

class WiFiPortProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_WiFiPort";

    /// `systemCalls` must outlive the provider and its streams.
    WiFiPortProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const NetworkInterface& interface,
                                    const LinkSettings& link);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
