#include "system/devices/UsbDevice.h"

#include <algorithm>
#include <map>
#include <set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/computer/FirmwareText.h"
#include "system/devices/DeviceFiles.h"
#include "system/devices/HardwareNames.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

using InterfaceClasses = std::map<std::string, std::set<std::uint8_t>>;

/// "2.00" or "12.01" as binary-coded decimals.
std::optional<std::uint16_t> codedDecimals(const std::string& version) {
    const auto parts = keyValueOf(version, '.');
    if (!parts || parts->key.size() > 2 || parts->value.size() != 2)
        return std::nullopt;
    const auto whole = parseHexDigits(parts->key);
    const auto hundredths = parseHexDigits(parts->value);
    if (!whole || !hundredths)
        return std::nullopt;
    return static_cast<std::uint16_t>(*whole << 8 | *hundredths);
}

/// The directory lists 1-2:1.0, an interface, beside 1-2, its device.
InterfaceClasses readInterfaceClasses(const std::filesystem::path& directory,
                                      const std::vector<std::string>& names) {
    InterfaceClasses classes;
    for (const std::string& name : names) {
        const std::size_t colon = name.find(':');
        if (colon == std::string::npos)
            continue;
        if (const auto code = readHexNumber<std::uint8_t>(directory / name / "bInterfaceClass"))
            classes[name.substr(0, colon)].insert(*code);
    }
    return classes;
}

bool isDevice(const std::string& name) {
    return name.find(':') == std::string::npos && name.rfind("usb", 0) != 0;
}

UsbDevice readDevice(const std::filesystem::path& directory, const std::string& name) {
    UsbDevice out;
    out.name = name;
    out.vendor = readHexNumber<std::uint16_t>(directory / "idVendor");
    out.product = readHexNumber<std::uint16_t>(directory / "idProduct");
    out.release = readHexNumber<std::uint16_t>(directory / "bcdDevice");
    out.usbVersion = readFact(directory / "version").then(codedDecimals);
    out.deviceClass = readHexNumber<std::uint8_t>(directory / "bDeviceClass");
    out.manufacturerText = withoutPlaceholder(readFact(directory / "manufacturer"));
    out.productText = withoutPlaceholder(readFact(directory / "product"));
    out.serialNumber = withoutPlaceholder(readFact(directory / "serial"));
    out.speed = withoutPlaceholder(readFact(directory / "speed"));
    out.isAuthorized = readSwitch(directory / "authorized");
    return out;
}

}  // namespace

Fact<std::vector<UsbDevice>> readUsbDevices(const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    const InterfaceClasses classes = readInterfaceClasses(directory, *names);
    std::vector<UsbDevice> devices;
    for (const std::string& name : *names) {
        if (!isDevice(name))
            continue;
        devices.push_back(readDevice(directory / name, name));
        if (const auto found = classes.find(name); found != classes.end())
            devices.back().interfaceClasses.assign(found->second.begin(), found->second.end());
    }
    std::sort(devices.begin(), devices.end(), [](const UsbDevice& a, const UsbDevice& b) {
        return naturallyBefore(a.name, b.name);
    });
    return devices;
}

void nameUsbDevices(std::vector<UsbDevice>& devices, const Fact<std::string>& list) {
    HardwareNames names;
    for (const UsbDevice& device : devices) {
        if (!device.vendor || !device.product)
            continue;
        names.want(HardwareNames::vendor(*device.vendor));
        names.want(HardwareNames::device(*device.vendor, *device.product));
    }
    names.read(list);
    for (UsbDevice& device : devices) {
        if (!device.vendor || !device.product)
            continue;
        device.vendorName = names.nameOf(HardwareNames::vendor(*device.vendor));
        device.productName = names.nameOf(HardwareNames::device(*device.vendor, *device.product));
    }
}

}  // namespace cimomd
