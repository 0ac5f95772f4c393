#pragma once

// The graphics units. Reads /sys/bus/pci/devices, pci.ids and /sys/class/drm.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/VideoController.h"

namespace cimomd {

class VideoControllerProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_VideoController";

    explicit VideoControllerProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const VideoController& controller);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
