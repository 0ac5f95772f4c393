#include "system/network/RouteTable.h"

#include <gtest/gtest.h>

#include <bit>

namespace cimomd {
namespace {

// The tables are written as a little-endian machine writes them.
static_assert(std::endian::native == std::endian::little);

constexpr std::string_view kHead =
    "Iface\tDestination\tGateway \tFlags\tRefCnt\tUse\tMetric\tMask\t\tMTU\tWindow\tIRTT\n";

std::string v4(std::string_view row) {
    return std::string(kHead) + std::string(row) + "\n";
}

TEST(RouteTable, readsIpv4) {
    const auto routes =
        parseIpv4Routes(v4("eth0\t00000000\t010200C0\t0003\t0\t0\t100\t00000000\t0\t0\t0   \n"
                           "eth0\t000200C0\t00000000\t0001\t0\t0\t4294967295\t00FFFFFF\t0\t0\t0"));
    ASSERT_EQ(routes.size(), 2U);
    EXPECT_EQ(routes[0].destination.text(), "0.0.0.0");
    EXPECT_EQ(routes[0].prefixLength, 0);
    EXPECT_EQ(routes[0].gateway->text(), "192.0.2.1");
    EXPECT_EQ(routes[0].interfaceName, "eth0");
    EXPECT_EQ(routes[0].metric, 100U);
    EXPECT_EQ(routes[1].destination.text(), "192.0.2.0");
    EXPECT_EQ(routes[1].prefixLength, 24);
    EXPECT_FALSE(routes[1].gateway.has_value());
    EXPECT_EQ(routes[1].metric, 4294967295U);
}

TEST(RouteTable, namesNoInterfaceForRoutesThatRefuse) {
    const auto routes =
        parseIpv4Routes(v4("*\t0000000A\t00000000\t0201\t0\t0\t0\t000000FF\t0\t0\t0"));
    ASSERT_EQ(routes.size(), 1U);
    EXPECT_EQ(routes[0].destination.text(), "10.0.0.0");
    EXPECT_EQ(routes[0].prefixLength, 8);
    EXPECT_FALSE(routes[0].interfaceName.has_value());
}

TEST(RouteTable, namesNoInterfaceForBlackHoles) {
    const auto routes =
        parseIpv4Routes(v4("*\t00001FAC\t00000000\t0001\t0\t0\t0\t0000FFFF\t0\t0\t0"));
    ASSERT_EQ(routes.size(), 1U);
    EXPECT_EQ(routes[0].destination.text(), "172.31.0.0");
    EXPECT_FALSE(routes[0].interfaceName.has_value());
}

TEST(RouteTable, dropsIpv4LinesThatMakeNoSense) {
    for (const char* row : {
             "", "eth0",
             "eth0 00000000 010200C0 0002 0 0 0 00000000 0 0 0",     // not in use
             "eth0 0000000 010200C0 0003 0 0 0 00000000 0 0 0",      // a digit too few
             "eth0 000000000 010200C0 0003 0 0 0 00000000 0 0 0",    // a digit too many
             "eth0 00000000 0102x0C0 0003 0 0 0 00000000 0 0 0",     // no number
             "eth0 00000000 010200C0 0003 0 0 -1 00000000 0 0 0",    // a metric below 0
             "eth0 00000000 010200C0 0003 0 0 4294967296 00000000",  // a metric too large
             "eth0 00000000 010200C0 0003 0 0 0 00FF00FF 0 0 0",     // a mask with a gap
         })
        EXPECT_TRUE(parseIpv4Routes(v4(row)).empty()) << row;
}

const std::string kNothing(32, '0');
const std::string kNetwork = "20010db8000100000000000000000000";

std::string v6(const std::string& destination, const char* prefix, const std::string& gateway,
               const char* metric, const char* flags, const char* interface) {
    return destination + " " + prefix + " " + kNothing + " 00 " + gateway + " " + metric +
           " 00000001 00000000 " + flags + " " + interface + "\n";
}

TEST(RouteTable, readsIpv6) {
    const auto routes = parseIpv6Routes(
        v6(kNetwork, "40", kNothing, "00000100", "00000001", "    eth0") +
        v6(kNothing, "00", "fe800000000000000000000000000001", "00000400", "00000003", "eth0") +
        v6(kNetwork, "30", kNothing, "00000400", "00200201", "lo"));
    ASSERT_EQ(routes.size(), 3U);
    EXPECT_EQ(routes[0].destination.text(), "2001:db8:1::");
    EXPECT_EQ(routes[0].prefixLength, 64);
    EXPECT_FALSE(routes[0].gateway.has_value());
    EXPECT_EQ(routes[0].interfaceName, "eth0");
    EXPECT_EQ(routes[0].metric, 256U);
    EXPECT_EQ(routes[1].destination.text(), "::");
    EXPECT_EQ(routes[1].gateway->text(), "fe80::1");
    EXPECT_EQ(routes[1].metric, 1024U);
    EXPECT_EQ(routes[2].prefixLength, 48);
    EXPECT_FALSE(routes[2].interfaceName.has_value());
}

TEST(RouteTable, listsIpv6RoutesThatRefuseThoughTheyAreNeverUp) {
    const auto routes = parseIpv6Routes(v6(kNetwork, "30", kNothing, "00000400", "00200200", "lo"));
    ASSERT_EQ(routes.size(), 1U);
    EXPECT_EQ(routes[0].destination.text(), "2001:db8:1::");
    EXPECT_FALSE(routes[0].interfaceName.has_value());
}

TEST(RouteTable, leavesOutWhatTheKernelKeepsForItself) {
    const std::string multicast = "ff" + std::string(30, '0');
    EXPECT_TRUE(parseIpv6Routes(v6(kNetwork, "80", kNothing, "00000000", "80200001", "lo") +
                                v6(kNetwork, "80", kNothing, "00000000", "80100001", "eth0") +
                                v6(kNetwork, "80", kNothing, "00000000", "00100001", "eth0") +
                                v6(kNetwork, "80", kNothing, "00000000", "01000001", "eth0") +
                                v6(multicast, "08", kNothing, "00000100", "00000001", "eth0") +
                                v6(kNothing, "00", kNothing, "ffffffff", "00200200", "lo") +
                                v6(kNothing, "00", kNothing, "ffffffff", "00200201", "lo"))
                    .empty());
}

TEST(RouteTable, dropsIpv6LinesThatMakeNoSense) {
    EXPECT_TRUE(parseIpv6Routes("\n \nnothing\n").empty());
    EXPECT_TRUE(
        parseIpv6Routes(v6(kNetwork, "81", kNothing, "00000000", "00000001", "eth0")).empty());
    EXPECT_TRUE(
        parseIpv6Routes(v6("20010db8", "40", kNothing, "00000000", "00000001", "eth0")).empty());
    EXPECT_TRUE(parseIpv6Routes(
                    v6(kNetwork.substr(2) + "xy", "40", kNothing, "00000000", "00000001", "eth0"))
                    .empty());
    EXPECT_TRUE(
        parseIpv6Routes(v6(kNetwork, "40", kNothing, "100000000", "00000001", "eth0")).empty());
}

}  // namespace
}  // namespace cimomd
