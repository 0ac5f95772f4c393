#pragma once

// The wireless LAN ports. The address burnt in often is not the one in use: random addresses are
// common on wireless networks.

#include "providers/network/NetworkPortProvider.h"

namespace cimomd {

class WiFiPortProvider : public NetworkPortProvider {
  public:
    static constexpr const char* kClassName = "Velmira_WiFiPort";

    /// `systemCalls` must outlive the provider and its streams.
    WiFiPortProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : NetworkPortProvider(std::move(systemPaths), systemCalls, &NetworkInterface::isWifiPort,
                              publish) {}

    const char* className() const override { return kClassName; }

    static ProvidedInstance publish(const std::string& hostName, const NetworkInterface& interface,
                                    const LinkSettings& link);
};

}  // namespace cimomd
