#pragma once

// How the computer resolves names, as one instance. Reads /etc/resolv.conf, and what
// systemd-resolved keeps behind it.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/network/ResolverSettings.h"

namespace cimomd {

class DnsSettingDataProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_DNSSettingData";

    explicit DnsSettingDataProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const ResolverSettings& settings);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
