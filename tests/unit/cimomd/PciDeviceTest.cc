#include "system/devices/PciDevice.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

TEST(PciDevice, readsAddresses) {
    EXPECT_EQ(parsePciAddress("0000:00:1f.3"), (PciAddress{0, 0, 31, 3}));
    EXPECT_EQ(parsePciAddress("10000:e1:00.0"), (PciAddress{0x10000, 0xE1, 0, 0}));
    EXPECT_EQ(parsePciAddress("ffffffff:ff:1f.7"), (PciAddress{0xFFFFFFFF, 0xFF, 31, 7}));
}

TEST(PciDevice, refusesOtherNames) {
    for (const char* name :
         {"", "0000", "00:1f.3", "000:00:1f.3", "0000:00:20.0", "0000:00:1f.8", "0000:00:1f.",
          "0000:00:1f.33", "0000:0:1f.3", "0000:00:1.3", "0000.00:1f.3", "100000000:00:1f.3",
          "0000:00:1f:3", "0000:00.1f.3", "-001:00:1f.3", ":00:00.0", "0000:00:1f.3:0000:00:1f.3"})
        EXPECT_FALSE(parsePciAddress(name).has_value()) << name;
}

TEST(PciDevice, ordersByAddressAndNotByName) {
    RecordedTree tree;
    tree.directory("pci/10000:e0:06.0").directory("pci/0000:a0:00.0").directory("pci/2000:00:00.0");
    tree.directory("pci/rescan");
    const auto devices = readPciDevices(tree.root / "pci");
    ASSERT_EQ(devices->size(), 3U);
    EXPECT_EQ((*devices)[0].name, "0000:a0:00.0");
    EXPECT_EQ((*devices)[1].name, "2000:00:00.0");
    EXPECT_EQ((*devices)[2].name, "10000:e0:06.0");
}

TEST(PciDevice, tellsNothingOfADeviceWithoutFiles) {
    RecordedTree tree;
    tree.directory("pci/0000:00:00.0");
    auto devices = *readPciDevices(tree.root / "pci");
    namePciDevices(devices, std::string("8086  Intel\n"));
    ASSERT_EQ(devices.size(), 1U);
    const PciDevice& device = devices[0];
    EXPECT_FALSE(device.vendor || device.device || device.subsystemVendor ||
                 device.subsystemDevice);
    EXPECT_FALSE(device.baseClass || device.subclass || device.revision || device.driver);
    EXPECT_FALSE(device.vendorName || device.deviceName || device.subsystemName ||
                 device.className);
    EXPECT_EQ(device.vendor.reason(), Absence::Absent);
}

TEST(PciDevice, filtersWhatCannotBeTrue) {
    RecordedTree tree;
    const std::string base = "pci/0000:00:00.0/";
    tree.file(base + "vendor", "0xffff\n")
        .file(base + "device", "0x12345\n")
        .file(base + "class", "garbage\n")
        .file(base + "revision", "0x100\n")
        .file(base + "subsystem_vendor", "0x0000\n")
        .file(base + "subsystem_device", "0x0001\n")
        .file(base + "uevent", "DRIVER=\nPCI_CLASS\n");
    const auto devices = readPciDevices(tree.root / "pci");
    const PciDevice& device = devices->at(0);
    EXPECT_EQ(device.vendor.reason(), Absence::Filtered);
    EXPECT_EQ(device.device.reason(), Absence::Filtered);
    EXPECT_EQ(device.subsystemVendor.reason(), Absence::Absent);
    EXPECT_FALSE(device.vendor || device.device || device.subsystemVendor ||
                 device.subsystemDevice);
    EXPECT_FALSE(device.baseClass || device.revision || device.driver);
}

TEST(PciDevice, takesTheNameOfTheClassWhereTheSubclassHasNone) {
    std::vector<PciDevice> devices(1);
    devices[0].baseClass = std::uint8_t{2};
    devices[0].subclass = std::uint8_t{0x42};
    namePciDevices(devices, std::string("C 02  Network controller\n\t00  Ethernet controller\n"));
    EXPECT_EQ(devices[0].className, "Network controller");
}

TEST(PciDevice, saysThatThereIsNoBus) {
    RecordedTree tree;
    EXPECT_EQ(readPciDevices(tree.root / "pci").reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
