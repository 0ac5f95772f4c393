#include "system/devices/VideoController.h"

#include <algorithm>
#include <iterator>

#include "system/devices/Graphics.h"
#include "system/devices/HardwareNames.h"
#include "system/devices/PciDevice.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kDisplayClass = 3;

std::vector<PciDevice> namedDisplayDevices(const SystemPaths& paths,
                                           const std::vector<PciDevice>& devices) {
    std::vector<PciDevice> display;
    std::copy_if(devices.begin(), devices.end(), std::back_inserter(display),
                 [](const PciDevice& device) { return device.baseClass == kDisplayClass; });
    if (!display.empty())
        namePciDevices(display, readHardwareList(paths, "pci.ids"));
    return display;
}

VideoController controllerOf(const PciDevice& device) {
    return {device.name,       device.vendor, device.device,          device.vendorName,
            device.deviceName, device.driver, device.videoMemoryBytes};
}

VideoController controllerOf(const BuiltInGraphics& graphics) {
    VideoController out;
    out.id = graphics.card;
    out.processor = graphics.compatible;
    out.driver = graphics.driver;
    return out;
}

}  // namespace

Fact<std::vector<VideoController>> readVideoControllers(const SystemPaths& paths) {
    const auto devices = readPciDevices(paths.pciDevices());
    const auto builtIn = readBuiltInGraphics(paths.graphics());
    if (!devices && !builtIn)
        return devices.reason();
    std::vector<VideoController> controllers;
    if (devices) {
        for (const PciDevice& device : namedDisplayDevices(paths, *devices))
            controllers.push_back(controllerOf(device));
    }
    if (builtIn) {
        for (const BuiltInGraphics& graphics : *builtIn)
            controllers.push_back(controllerOf(graphics));
    }
    return controllers;
}

}  // namespace cimomd
