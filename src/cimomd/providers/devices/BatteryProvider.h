#pragma once

// The batteries that feed the computer. Reads /sys/class/power_supply.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/Battery.h"

namespace cimomd {

class BatteryProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Battery";

    /// `systemCalls` must outlive the provider.
    BatteryProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Battery& battery);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
