#include "system/devices/PciDevice.h"

#include <algorithm>
#include <tuple>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/devices/DeviceFiles.h"
#include "system/devices/HardwareNames.h"

namespace cimomd {
namespace {

using Key = HardwareNames::Key;

/// A number of hexadecimal digits, `least` of them or more, that is not above `largest`.
std::optional<std::uint32_t> addressPart(std::string_view text, std::size_t least,
                                         std::uint32_t largest) {
    const auto number = parseHexDigits(text);
    if (!number || text.size() < least || *number > largest)
        return std::nullopt;
    return static_cast<std::uint32_t>(*number);
}

/// All bits set is what a device answers that is gone, or was never there.
Fact<std::uint16_t> identifierOf(const Fact<std::uint16_t>& number) {
    return number.then(
        [](std::uint16_t id) { return id == 0xFFFF ? std::nullopt : std::optional(id); });
}

PciDevice readDevice(const std::filesystem::path& directory, const std::string& name,
                     const PciAddress& address) {
    PciDevice out;
    out.name = name;
    out.address = address;
    out.vendor = identifierOf(readHexNumber<std::uint16_t>(directory / "vendor"));
    out.device = identifierOf(readHexNumber<std::uint16_t>(directory / "device"));
    out.subsystemVendor =
        identifierOf(readHexNumber<std::uint16_t>(directory / "subsystem_vendor"));
    out.subsystemDevice =
        identifierOf(readHexNumber<std::uint16_t>(directory / "subsystem_device"));
    if (out.subsystemVendor == std::uint16_t{0}) {
        out.subsystemVendor = Absence::Absent;
        out.subsystemDevice = Absence::Absent;
    }
    const auto classCode = readHexNumber<std::uint32_t>(directory / "class");
    out.baseClass = classCode.then([](std::uint32_t code) { return std::uint8_t(code >> 16); });
    out.subclass = classCode.then([](std::uint32_t code) { return std::uint8_t(code >> 8); });
    out.revision = readHexNumber<std::uint8_t>(directory / "revision");
    out.driver = readUeventValue(directory, "DRIVER");
    out.videoMemoryBytes = readNumber(directory / "mem_info_vram_total");
    return out;
}

/// The keys of a device's names; each missing when the numbers it takes are.
struct NameKeys {
    explicit NameKeys(const PciDevice& pci) {
        if (pci.vendor)
            vendor = HardwareNames::vendor(*pci.vendor);
        if (pci.vendor && pci.device)
            device = HardwareNames::device(*pci.vendor, *pci.device);
        if (device && pci.subsystemVendor && pci.subsystemDevice)
            subsystem =
                HardwareNames::subsystem(*device, *pci.subsystemVendor, *pci.subsystemDevice);
        if (pci.baseClass)
            baseClass = HardwareNames::baseClass(*pci.baseClass);
        if (pci.baseClass && pci.subclass)
            subclass = HardwareNames::subclass(*pci.baseClass, *pci.subclass);
    }

    std::optional<Key> vendor, device, subsystem, baseClass, subclass;
};

void want(HardwareNames& names, const NameKeys& keys) {
    for (const auto& key :
         {keys.vendor, keys.device, keys.subsystem, keys.baseClass, keys.subclass}) {
        if (key)
            names.want(*key);
    }
}

Fact<std::string> nameOf(const HardwareNames& names, const std::optional<Key>& key) {
    return key ? names.nameOf(*key) : Absence::Absent;
}

}  // namespace

std::optional<PciAddress> parsePciAddress(std::string_view text) {
    const std::size_t firstColon = text.find(':');
    const std::size_t dot = text.rfind('.');
    if (firstColon == std::string_view::npos || dot == std::string_view::npos ||
        dot != firstColon + 6 || text[firstColon + 3] != ':' || text.size() != dot + 2)
        return std::nullopt;
    const auto domain = addressPart(text.substr(0, firstColon), 4, UINT32_MAX);
    const auto bus = addressPart(text.substr(firstColon + 1, 2), 2, 0xFF);
    const auto device = addressPart(text.substr(firstColon + 4, 2), 2, 0x1F);
    const auto function = addressPart(text.substr(dot + 1), 1, 7);
    if (!domain || !bus || !device || !function)
        return std::nullopt;
    return PciAddress{*domain, static_cast<std::uint8_t>(*bus), static_cast<std::uint8_t>(*device),
                      static_cast<std::uint8_t>(*function)};
}

Fact<std::vector<PciDevice>> readPciDevices(const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    std::vector<PciDevice> devices;
    for (const std::string& name : *names) {
        if (const auto address = parsePciAddress(name))
            devices.push_back(readDevice(directory / name, name, *address));
    }
    std::sort(devices.begin(), devices.end(), [](const PciDevice& a, const PciDevice& b) {
        return std::tie(a.address, a.name) < std::tie(b.address, b.name);
    });
    return devices;
}

void namePciDevices(std::vector<PciDevice>& devices, const Fact<std::string>& list) {
    HardwareNames names;
    for (const PciDevice& device : devices)
        want(names, NameKeys(device));
    names.read(list);
    for (PciDevice& device : devices) {
        const NameKeys keys(device);
        device.vendorName = nameOf(names, keys.vendor);
        device.deviceName = nameOf(names, keys.device);
        device.subsystemName = nameOf(names, keys.subsystem);
        device.className = nameOf(names, keys.subclass);
        if (!device.className)
            device.className = nameOf(names, keys.baseClass);
    }
}

}  // namespace cimomd
