#include "system/network/IpAddress.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

IpAddress address(std::string_view text) {
    return IpAddress::parse(text).value();
}

TEST(IpAddress, readsAndWritesBothVersions) {
    EXPECT_EQ(address("192.0.2.1").text(), "192.0.2.1");
    EXPECT_EQ(address("192.0.2.1").version(), IpAddress::Version::V4);
    EXPECT_EQ(address("192.0.2.1").bits(), 32U);
    EXPECT_EQ(address("2001:DB8:0:0:0:0:0:1").text(), "2001:db8::1");
    EXPECT_EQ(address("2001:db8::1").version(), IpAddress::Version::V6);
    EXPECT_EQ(address("2001:db8::1").bits(), 128U);
    for (const char* wrong : {"", "192.0.2", "192.0.2.256", "192.0.2.1/24", "fe80::1%eth0", "::g",
                              "1:2:3:4:5:6:7:8:9", " ::1"})
        EXPECT_FALSE(IpAddress::parse(wrong).has_value()) << wrong;
}

TEST(IpAddress, takesTheBytesOfTheNetwork) {
    EXPECT_EQ(IpAddress::fromBytes({"\xC0\x00\x02\x01", 4})->text(), "192.0.2.1");
    EXPECT_EQ(IpAddress::fromBytes(std::string(15, '\0') + '\1')->text(), "::1");
    EXPECT_FALSE(IpAddress::fromBytes("").has_value());
    EXPECT_FALSE(IpAddress::fromBytes("12345").has_value());
    EXPECT_FALSE(IpAddress::fromBytes(std::string(17, '\0')).has_value());
}

TEST(IpAddress, makesNetmasks) {
    EXPECT_EQ(IpAddress::mask(IpAddress::Version::V4, 0).text(), "0.0.0.0");
    EXPECT_EQ(IpAddress::mask(IpAddress::Version::V4, 20).text(), "255.255.240.0");
    EXPECT_EQ(IpAddress::mask(IpAddress::Version::V4, 32).text(), "255.255.255.255");
    EXPECT_EQ(IpAddress::mask(IpAddress::Version::V4, 255).text(), "255.255.255.255");
    EXPECT_EQ(IpAddress::mask(IpAddress::Version::V6, 33).text(), "ffff:ffff:8000::");
}

TEST(IpAddress, knowsItsKind) {
    EXPECT_TRUE(address("127.1.2.3").isLoopback());
    EXPECT_TRUE(address("::1").isLoopback());
    EXPECT_FALSE(address("128.0.0.1").isLoopback());
    EXPECT_FALSE(address("::2").isLoopback());
    EXPECT_FALSE(address("fe80::1").isLoopback());
    EXPECT_TRUE(address("169.254.255.1").isLinkLocal());
    EXPECT_TRUE(address("fe80::1").isLinkLocal());
    EXPECT_TRUE(address("febf::1").isLinkLocal());
    EXPECT_FALSE(address("fec0::1").isLinkLocal());
    EXPECT_FALSE(address("169.253.0.1").isLinkLocal());
    EXPECT_TRUE(address("224.0.0.1").isMulticast());
    EXPECT_TRUE(address("239.255.255.255").isMulticast());
    EXPECT_TRUE(address("ff02::1").isMulticast());
    EXPECT_FALSE(address("240.0.0.1").isMulticast());
}

TEST(IpAddress, ordersByVersionThenByBytes) {
    EXPECT_LT(address("9.0.0.0"), address("10.0.0.0"));
    EXPECT_LT(address("255.255.255.255"), address("::"));
    EXPECT_EQ(address("::1"), address("0:0:0:0:0:0:0:1"));
    EXPECT_NE(address("0.0.0.0"), address("::"));
}

}  // namespace
}  // namespace cimomd
