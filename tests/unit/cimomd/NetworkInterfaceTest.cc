#include "system/network/NetworkInterface.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "WatchedSystemCalls.h"

namespace cimomd {
namespace {

TEST(NetworkInterface, readsAPort) {
    RecordedTree tree;
    tree.file("net/enp1s0/address", "52:54:00:ab:cd:ef\n")
        .file("net/enp1s0/addr_assign_type", "0\n")
        .file("net/enp1s0/type", "1\n")
        .file("net/enp1s0/mtu", "9000\n")
        .file("net/enp1s0/operstate", "up\n")
        .file("net/enp1s0/flags", "0x1003\n")
        .file("net/enp1s0/speed", "10000\n")
        .file("net/enp1s0/duplex", "full\n")
        .file("net/enp1s0/carrier", "1\n")
        .file("net/enp1s0/uevent", "INTERFACE=enp1s0\nIFINDEX=2\n")
        .file("net/enp1s0/device/uevent",
              "DRIVER=ixgbe\nPCI_CLASS=20000\nPCI_SLOT_NAME=0000:01:00.0\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_TRUE(interfaces);
    ASSERT_EQ(interfaces->size(), 1U);
    const NetworkInterface& port = interfaces->front();
    EXPECT_EQ(port.name, "enp1s0");
    EXPECT_EQ(port.address, "52:54:00:ab:cd:ef");
    EXPECT_EQ(port.addressIsPermanent, true);
    EXPECT_EQ(port.mtuBytes, 9000U);
    EXPECT_EQ(port.operationalState, "up");
    EXPECT_EQ(port.flags, 0x1003U);
    EXPECT_EQ(port.speedMbps, 10000U);
    EXPECT_EQ(port.fullDuplex, true);
    EXPECT_EQ(port.hasCarrier, true);
    EXPECT_EQ(port.kind, std::nullopt);
    EXPECT_EQ(port.driver, "ixgbe");
    EXPECT_EQ(port.busAddress, "0000:01:00.0");
    EXPECT_TRUE(port.isEthernetPort());
    EXPECT_FALSE(port.isWifiPort());
}

// The PCI address belongs to the device that carries the virtio one; a USB adapter has none.
TEST(NetworkInterface, findsThePciAddressOfItsParent) {
    RecordedTree tree;
    tree.file("devices/0000:00:03.0/uevent", "DRIVER=virtio-pci\nPCI_SLOT_NAME=0000:00:03.0\n")
        .file("devices/0000:00:03.0/virtio0/uevent", "DRIVER=virtio_net\n")
        .file("devices/0000:00:14.0/uevent", "DRIVER=xhci_hcd\nPCI_SLOT_NAME=0000:00:14.0\n")
        .file("devices/0000:00:14.0/usb1/uevent", "DRIVER=usb\n")
        .file("devices/0000:00:14.0/usb1/1-1:1.0/uevent", "DRIVER=cdc_ether\n")
        .directory("net/eth0")
        .directory("net/eth1");
    std::filesystem::create_directory_symlink("../../devices/0000:00:03.0/virtio0",
                                              tree.root / "net/eth0/device");
    std::filesystem::create_directory_symlink("../../devices/0000:00:14.0/usb1/1-1:1.0",
                                              tree.root / "net/eth1/device");
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_EQ(interfaces->size(), 2U);
    EXPECT_EQ((*interfaces)[0].driver, "virtio_net");
    EXPECT_EQ((*interfaces)[0].busAddress, "0000:00:03.0");
    EXPECT_EQ((*interfaces)[1].driver, "cdc_ether");
    EXPECT_EQ((*interfaces)[1].busAddress.reason(), Absence::Absent);
    EXPECT_FALSE((*interfaces)[1].busAddress);
}

TEST(NetworkInterface, readsOddTexts) {
    RecordedTree tree;
    tree.file("net/eth0/address", "\n")
        .file("net/eth0/addr_assign_type", "-3\n")
        .file("net/eth0/type", "99999999999999999999\n")
        .file("net/eth0/mtu", "a lot\n")
        .file("net/eth0/flags", "1003\n")
        .file("net/eth0/carrier", "\xFF\n")
        .file("net/eth0/speed", "99999999999999999999\n")
        .file("net/eth0/duplex", "both\n")
        .file("net/eth0/uevent", std::string(100000, 'x'))
        .file("net/eth0/device/uevent", "DRIVER\n=x\nDRIVER=\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_EQ(interfaces->size(), 1U);
    const NetworkInterface& port = interfaces->front();
    EXPECT_EQ(port.address, std::nullopt);
    EXPECT_EQ(port.addressIsPermanent, std::nullopt);
    EXPECT_EQ(port.linkType, std::nullopt);
    EXPECT_EQ(port.mtuBytes, std::nullopt);
    EXPECT_EQ(port.flags, std::nullopt);
    EXPECT_EQ(port.hasCarrier, std::nullopt);
    EXPECT_EQ(port.speedMbps, std::nullopt);
    EXPECT_EQ(port.fullDuplex, std::nullopt);
    EXPECT_EQ(port.kind.reason(), Absence::Unreadable);
    EXPECT_EQ(port.driver, std::nullopt);
    EXPECT_FALSE(port.isEthernetPort());
}

TEST(NetworkInterface, ordersByTheNumbersInNames) {
    RecordedTree tree;
    for (const char* name : {"eth10", "eth2", "bond0", "eth1"})
        tree.directory(std::string("net/") + name);
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_EQ(interfaces->size(), 4U);
    EXPECT_EQ((*interfaces)[0].name, "bond0");
    EXPECT_EQ((*interfaces)[1].name, "eth1");
    EXPECT_EQ((*interfaces)[2].name, "eth2");
    EXPECT_EQ((*interfaces)[3].name, "eth10");
}

TEST(NetworkInterface, takesAnUnknownSpeedAsNothing) {
    RecordedTree tree;
    tree.file("net/a/speed", "-1\n").file("net/b/speed", "4294967295\n").file("net/c/speed", "0\n");
    tree.file("net/d/speed", "2147483648\n").file("net/e/speed", "2147483647\n");
    tree.file("net/a/duplex", "unknown\n").file("net/b/duplex", "half\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_EQ(interfaces->size(), 5U);
    // The kernel has no speeds above what a signed number holds.
    EXPECT_EQ((*interfaces)[3].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[4].speedMbps, 2147483647U);
    EXPECT_EQ((*interfaces)[0].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[1].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[2].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[0].fullDuplex, std::nullopt);
    EXPECT_EQ((*interfaces)[1].fullDuplex, false);
}

// The kernel asks the driver for these, and waits for it.
TEST(NetworkInterface, hasNoSpeedWhenTheDriverHangs) {
    RecordedTree tree;
    tree.file("net/a/speed", "1000\n").file("net/a/mtu", "1500\n").file("net/a/carrier", "1\n");
    WatchedSystemCalls calls;
    calls.silent = tree.root / "net/a/speed";
    const auto interfaces = readNetworkInterfaces(tree.root / "net", calls);
    ASSERT_EQ(interfaces->size(), 1U);
    EXPECT_FALSE((*interfaces)[0].speedMbps);
    EXPECT_EQ((*interfaces)[0].speedMbps.reason(), Absence::TimedOut);
    EXPECT_EQ((*interfaces)[0].hasCarrier, true);
    EXPECT_EQ((*interfaces)[0].mtuBytes, 1500U);
    EXPECT_TRUE(calls.wasAskedFor("net/a/duplex"));
    EXPECT_EQ(calls.sources, std::set{TextSource::NetworkDrivers});
}

TEST(NetworkInterface, takesOnlyWiredHardwareAsEthernetPorts) {
    RecordedTree tree;
    tree.file("net/br0/type", "1\n");
    tree.file("net/wlan0/type", "1\n")
        .directory("net/wlan0/device")
        .directory("net/wlan0/phy80211");
    tree.file("net/ib0/type", "32\n").directory("net/ib0/device");
    tree.file("net/bnep0/type", "1\n")
        .file("net/bnep0/uevent", "DEVTYPE=bluetooth\n")
        .directory("net/bnep0/device");
    tree.file("net/bonding_masters", "bond0\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net", FixedSystemCalls());
    ASSERT_EQ(interfaces->size(), 4U);
    for (const NetworkInterface& interface : *interfaces)
        EXPECT_FALSE(interface.isEthernetPort()) << interface.name;
    EXPECT_TRUE((*interfaces)[3].isWifiPort());
    EXPECT_EQ(readNetworkInterfaces(tree.root / "none", FixedSystemCalls()).reason(),
              Absence::Absent);
}

}  // namespace
}  // namespace cimomd
