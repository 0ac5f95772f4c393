#include "providers/devices/UsbDeviceProvider.h"

#include <fmt/format.h>

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

constexpr std::size_t kUsbTextLength = 256;

Fact<std::string> orElse(const Fact<std::string>& own, const Fact<std::string>& listed) {
    return own ? own : listed;
}

/// Binary-coded decimals for people: 0x0210 is 2.10.
Fact<std::string> versionText(const Fact<std::uint16_t>& coded) {
    return coded.then([](std::uint16_t version) {
        return fmt::format("{:x}.{:02x}", version >> 8, version & 0xFF);
    });
}

Fact<std::vector<Uint8>> interfaceClassesOf(const UsbDevice& device) {
    if (device.interfaceClasses.empty())
        return Absence::Absent;
    return device.interfaceClasses;
}

}  // namespace

std::unique_ptr<InstanceStream> UsbDeviceProvider::enumerate() const {
    auto devices = readUsbDevices(paths.usbDevices());
    if (!devices)
        return std::make_unique<EmptyStream>(devices.reason());
    std::vector<UsbDevice> named = *devices;
    if (!named.empty())
        nameUsbDevices(named, readHardwareList(paths, "usb.ids"));
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<UsbDevice>>(
        std::move(named),
        [hostName](const UsbDevice& device) { return publish(hostName, device); });
}

ProvidedInstance UsbDeviceProvider::publish(const std::string& hostName, const UsbDevice& device) {
    const Fact<std::string> hardwareId = hardwareIdOf(device.vendor, device.product);
    const std::string title =
        titleOf(orElse(device.manufacturerText, device.vendorName),
                orElse(device.productText, device.productName), hardwareId.value_or(device.name));
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", Absence::Absent)
        .value<Uint16>("EnabledState",
                       device.isAuthorized.then([](bool is) { return is ? kEnabled : kDisabled; }))
        .deviceKeys(hostName, device.name)
        .value<Uint16>("USBVersionInBCD", device.usbVersion)
        .value<Uint16>("VendorID", device.vendor)
        .value<Uint16>("ProductID", device.product)
        .value<Uint16>("DeviceReleaseNumber", device.release)
        .value<Uint8>("ClassCode", device.deviceClass)
        .text("Manufacturer", device.manufacturerText, kUsbTextLength)
        .text("Product", device.productText, kUsbTextLength)
        .text("SerialNumber", device.serialNumber, kUsbTextLength)
        .text("HardwareId", hardwareId)
        .text("VendorName", device.vendorName)
        .text("ProductName", device.productName)
        .text("USBVersion", versionText(device.usbVersion))
        .text("DeviceRelease", versionText(device.release))
        .text("SpeedMbps", device.speed)
        .values<Uint8>("InterfaceClasses", interfaceClassesOf(device));
    return builder.take();
}

}  // namespace cimomd
