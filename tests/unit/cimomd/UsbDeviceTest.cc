#include "system/devices/UsbDevice.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

TEST(UsbDevice, leavesRootHubsAndInterfacesOut) {
    RecordedTree tree;
    tree.directory("usb/usb1").directory("usb/1-0:1.0").directory("usb/1-1:1.0");
    tree.directory("usb/1-10").directory("usb/1-2.1").directory("usb/1-2").directory("usb/2-1");
    const auto devices = readUsbDevices(tree.root / "usb");
    ASSERT_EQ(devices->size(), 4U);
    EXPECT_EQ((*devices)[0].name, "1-2");
    EXPECT_EQ((*devices)[1].name, "1-2.1");
    EXPECT_EQ((*devices)[2].name, "1-10");
    EXPECT_EQ((*devices)[3].name, "2-1");
}

TEST(UsbDevice, gathersTheClassesOfItsInterfaces) {
    RecordedTree tree;
    tree.directory("usb/1-1")
        .file("usb/1-1:1.0/bInterfaceClass", "ff\n")
        .file("usb/1-1:1.1/bInterfaceClass", "03\n")
        .file("usb/1-1:1.2/bInterfaceClass", "03\n")
        .file("usb/1-1:1.3/bInterfaceClass", "xx\n")
        .file("usb/1-1.1:1.0/bInterfaceClass", "08\n");
    const auto devices = readUsbDevices(tree.root / "usb");
    ASSERT_EQ(devices->size(), 1U);
    EXPECT_EQ(devices->at(0).interfaceClasses, (std::vector<std::uint8_t>{3, 255}));
}

Fact<std::uint16_t> versionRead(const char* text) {
    RecordedTree tree;
    tree.file("usb/1-1/version", text);
    return readUsbDevices(tree.root / "usb")->at(0).usbVersion;
}

TEST(UsbDevice, readsVersionsAsCodedDecimals) {
    EXPECT_EQ(versionRead(" 2.00\n"), std::uint16_t{0x0200});
    EXPECT_EQ(versionRead(" 1.10\n"), std::uint16_t{0x0110});
    EXPECT_EQ(versionRead("12.34\n"), std::uint16_t{0x1234});
    for (const char* text :
         {"2\n", "2.0\n", "2.000\n", "100.00\n", ".00\n", "2.\n", "x.yz\n", "\n"})
        EXPECT_FALSE(versionRead(text)) << text;
}

TEST(UsbDevice, filtersTextsThatTellNothing) {
    RecordedTree tree;
    tree.file("usb/1-1/serial", "000000000000\n")
        .file("usb/1-1/product", "Unknown\n")
        .file("usb/1-1/manufacturer", "\n")
        .file("usb/1-1/speed", "unknown\n")
        .file("usb/1-1/idVendor", "-46d\n")
        .file("usb/1-1/idProduct", "10000\n")
        .file("usb/1-1/authorized", "2\n");
    auto devices = *readUsbDevices(tree.root / "usb");
    nameUsbDevices(devices, std::string("046d  Logitech, Inc.\n"));
    const UsbDevice& device = devices.at(0);
    EXPECT_EQ(device.serialNumber.reason(), Absence::Filtered);
    EXPECT_EQ(device.productText.reason(), Absence::Filtered);
    EXPECT_EQ(device.manufacturerText.reason(), Absence::Absent);
    EXPECT_FALSE(device.serialNumber || device.productText || device.manufacturerText);
    EXPECT_FALSE(device.speed || device.vendor || device.product || device.isAuthorized);
    EXPECT_FALSE(device.vendorName || device.productName);
}

TEST(UsbDevice, saysThatThereIsNoBus) {
    RecordedTree tree;
    EXPECT_EQ(readUsbDevices(tree.root / "usb").reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
