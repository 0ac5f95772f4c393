#pragma once

// The devices on the PCI buses. Reads /sys/bus/pci/devices; names come from pci.ids.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/PciDevice.h"

namespace cimomd {

class PciDeviceProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_PCIDevice";

    explicit PciDeviceProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const PciDevice& device);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
