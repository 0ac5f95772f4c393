#pragma once

// /sys/bus/usb/devices: what is plugged into the USB, hubs included. The root hubs (usb1, usb2 ...)
// are left out: they are the host controllers seen from the other side, not devices of their own.

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct UsbDevice {
    /// The way to it: bus, dash, the ports with dots between them.
    std::string name;
    Fact<std::uint16_t> vendor;
    Fact<std::uint16_t> product;
    /// Binary-coded decimals.
    Fact<std::uint16_t> release;
    /// Binary-coded decimals; 2.00 is 0x0200.
    Fact<std::uint16_t> usbVersion;
    /// 0 when each interface has its own.
    Fact<std::uint8_t> deviceClass;
    /// Each once, in the order of their numbers.
    std::vector<std::uint8_t> interfaceClasses;
    // What the device says of itself.
    Fact<std::string> manufacturerText;
    Fact<std::string> productText;
    Fact<std::string> serialNumber;
    /// In Mbit/s, such as 1.5 or 5000.
    Fact<std::string> speed;
    /// Whether the kernel may use it.
    Fact<bool> isAuthorized;
    // The names that usb.ids has, after nameUsbDevices.
    Fact<std::string> vendorName;
    Fact<std::string> productName;
};

/// Ordered by bus and ports; missing when the directory cannot be read.
Fact<std::vector<UsbDevice>> readUsbDevices(const std::filesystem::path& directory);

/// Adds the names from `list`, the text of usb.ids, in one pass over it.
void nameUsbDevices(std::vector<UsbDevice>& devices, const Fact<std::string>& list);

}  // namespace cimomd
