#pragma once

// The devices on the USB. Reads /sys/bus/usb/devices; names beside the devices' own texts come from
// usb.ids.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/devices/UsbDevice.h"

namespace cimomd {

class UsbDeviceProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_USBDevice";

    explicit UsbDeviceProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const UsbDevice& device);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
