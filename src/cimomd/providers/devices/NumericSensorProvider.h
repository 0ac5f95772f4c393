#pragma once

// The sensors of the monitoring chips. Reads /sys/class/hwmon.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/HardwareSensor.h"

namespace cimomd {

class NumericSensorProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_NumericSensor";

    explicit NumericSensorProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const HardwareSensor& sensor);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
