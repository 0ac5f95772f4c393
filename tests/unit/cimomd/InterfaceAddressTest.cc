#include "system/network/InterfaceAddress.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(InterfaceAddress, readsRecordedLines) {
    const auto addresses = parseRecordedAddresses(
        "eth0 192.0.2.10 - 24 0x80 forever\n"
        "tun0 10.8.0.2 10.8.0.1 32 0x0 3600\n"
        "eth0 2001:db8::7 - 64 0x301 0 2");
    ASSERT_EQ(addresses.size(), 3U);
    EXPECT_EQ(addresses[0].interfaceName, "eth0");
    EXPECT_EQ(addresses[0].local.text(), "192.0.2.10");
    EXPECT_FALSE(addresses[0].peer.has_value());
    EXPECT_EQ(addresses[0].prefixLength, 24);
    EXPECT_EQ(addresses[0].flags, 0x80U);
    EXPECT_FALSE(addresses[0].validSeconds.has_value());
    EXPECT_EQ(addresses[1].peer->text(), "10.8.0.1");
    EXPECT_EQ(addresses[1].validSeconds, 3600U);
    EXPECT_EQ(addresses[2].flags, 0x301U);
    EXPECT_EQ(addresses[2].validSeconds, 0U);
    EXPECT_EQ(addresses[1].origin, 0);
    EXPECT_EQ(addresses[2].origin, 2);
}

TEST(InterfaceAddress, dropsLinesThatMakeNoSense) {
    for (const char* line :
         {"", "eth0", "eth0 192.0.2.10 - 24 0x80", "eth0 here - 24 0x80 forever",
          "eth0 192.0.2.10 - 33 0x80 forever", "eth0 ::1 - 256 0x80 forever",
          "eth0 192.0.2.10 there 24 0x80 forever", "eth0 192.0.2.10 - 24 128 forever",
          "eth0 192.0.2.10 - 24 0x80 never", "eth0 192.0.2.10 - 24 0x80 4294967296",
          "eth0 192.0.2.10 - 24 0x80 forever more", "eth0 192.0.2.10 - 24 0x80 forever 256",
          "eth0 192.0.2.10 - 24 0x80 forever 1 2"})
        EXPECT_TRUE(parseRecordedAddresses(line).empty()) << line;
}

}  // namespace
}  // namespace cimomd
