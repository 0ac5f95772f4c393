#include "system/network/NetworkInterface.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

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
        .directory("net/enp1s0/device");
    const auto interfaces = readNetworkInterfaces(tree.root / "net");
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
    EXPECT_TRUE(port.isEthernetPort());
}

TEST(NetworkInterface, takesAnUnknownSpeedAsNothing) {
    RecordedTree tree;
    tree.file("net/a/speed", "-1\n").file("net/b/speed", "4294967295\n").file("net/c/speed", "0\n");
    tree.file("net/a/duplex", "unknown\n").file("net/b/duplex", "half\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net");
    ASSERT_EQ(interfaces->size(), 3U);
    EXPECT_EQ((*interfaces)[0].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[1].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[2].speedMbps, std::nullopt);
    EXPECT_EQ((*interfaces)[0].fullDuplex, std::nullopt);
    EXPECT_EQ((*interfaces)[1].fullDuplex, false);
}

TEST(NetworkInterface, takesOnlyWiredHardwareAsEthernetPorts) {
    RecordedTree tree;
    tree.file("net/br0/type", "1\n");
    tree.file("net/wlan0/type", "1\n")
        .directory("net/wlan0/device")
        .directory("net/wlan0/phy80211");
    tree.file("net/ib0/type", "32\n").directory("net/ib0/device");
    tree.file("net/bonding_masters", "bond0\n");
    const auto interfaces = readNetworkInterfaces(tree.root / "net");
    ASSERT_EQ(interfaces->size(), 3U);
    for (const NetworkInterface& interface : *interfaces)
        EXPECT_FALSE(interface.isEthernetPort()) << interface.name;
    EXPECT_FALSE(readNetworkInterfaces(tree.root / "none").has_value());
}

}  // namespace
}  // namespace cimomd
