#include "providers/devices/PciDeviceProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/devices/HardwareTitle.h"
#include "system/computer/SystemIdentity.h"
#include "system/devices/HardwareNames.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint8;

}  // namespace

std::unique_ptr<InstanceStream> PciDeviceProvider::enumerate() const {
    auto devices = readPciDevices(paths.pciDevices());
    if (!devices)
        return std::make_unique<EmptyStream>(devices.reason());
    std::vector<PciDevice> named = *devices;
    if (!named.empty())
        namePciDevices(named, readHardwareList(paths, "pci.ids"));
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<PciDevice>>(
        std::move(named),
        [hostName](const PciDevice& device) { return publish(hostName, device); });
}

ProvidedInstance PciDeviceProvider::publish(const std::string& hostName, const PciDevice& device) {
    const Fact<std::string> hardwareId = hardwareIdOf(device.vendor, device.device);
    const std::string title =
        titleOf(device.vendorName, device.deviceName, hardwareId.value_or(device.name));
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", Absence::Absent)
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .deviceKeys(hostName, device.name)
        .value<Uint8>("ClassCode", device.baseClass)
        .value<Uint16>("VendorID", device.vendor)
        .value<Uint16>("PCIDeviceID", device.device)
        .value<Uint16>("SubsystemVendorID", device.subsystemVendor)
        .value<Uint16>("SubsystemID", device.subsystemDevice)
        .value<Uint8>("BusNumber", device.address.bus)
        .value<Uint8>("DeviceNumber", device.address.device)
        .value<Uint8>("FunctionNumber", device.address.function)
        .value<Uint8>("RevisionNumber", device.revision)
        .text("HardwareId", hardwareId)
        .text("VendorName", device.vendorName)
        .text("ProductName", device.deviceName)
        .text("SubsystemName", device.subsystemName)
        .text("ClassName", device.className)
        .text("Driver", device.driver);
    return builder.take();
}

}  // namespace cimomd
