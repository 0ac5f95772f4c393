#pragma once

// The Ethernet ports that are hardware, a hypervisor's included.

#include "providers/network/NetworkPortProvider.h"

namespace cimomd {

class EthernetPortProvider : public NetworkPortProvider {
  public:
    static constexpr const char* kClassName = "Velmira_EthernetPort";

    /// `systemCalls` must outlive the provider and its streams.
    EthernetPortProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : NetworkPortProvider(std::move(systemPaths), systemCalls,
                              &NetworkInterface::isEthernetPort, publish) {}

    const char* className() const override { return kClassName; }

    static ProvidedInstance publish(const std::string& hostName, const NetworkInterface& interface,
                                    const LinkSettings& link);
};

}  // namespace cimomd
