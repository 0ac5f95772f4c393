#pragma once

// The monitors and panels that are connected. Reads /sys/class/drm and the monitors' EDID.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/Graphics.h"

namespace cimomd {

class DesktopMonitorProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_DesktopMonitor";

    explicit DesktopMonitorProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Monitor& monitor);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
