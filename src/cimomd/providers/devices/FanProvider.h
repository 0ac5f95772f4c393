#pragma once

// The fans whose speed is measured. Reads /sys/class/hwmon.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/HardwareSensor.h"

namespace cimomd {

class FanProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Fan";

    explicit FanProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const HardwareSensor& fan);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
