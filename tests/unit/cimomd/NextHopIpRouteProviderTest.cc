#include "providers/network/NextHopIpRouteProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"

namespace cimomd {
namespace {

TEST(NextHopIpRouteProvider, tellsEqualRoutesApart) {
    // The same route for two types of service looks like this.
    const std::string row = "eth0\t00000000\t010200C0\t0003\t0\t0\t0\t00000000\t0\t0\t0\n";
    RecordedTree tree;
    tree.file("proc/net/route", "Iface\n" + row + row);
    const auto instances = all(NextHopIpRouteProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "InstanceID"),
              "Velmira:0.0.0.0/0 via 192.0.2.1 dev eth0 metric 0");
    EXPECT_EQ(textOf(instances[1], "InstanceID"),
              "Velmira:0.0.0.0/0 via 192.0.2.1 dev eth0 metric 0 #2");
}

TEST(NextHopIpRouteProvider, keepsItsOrderWhateverTheKernelsIs) {
    const std::string wide = "eth0\t0000000A\t00000000\t0001\t0\t0\t0\t000000FF\t0\t0\t0\n";
    const std::string narrow = "eth0\t0000000A\t00000000\t0001\t0\t0\t0\t0000FFFF\t0\t0\t0\n";
    RecordedTree tree;
    for (const std::string& table : {wide + narrow, narrow + wide}) {
        tree.file("proc/net/route", table);
        const auto instances = all(NextHopIpRouteProvider(tree.paths()).enumerate());
        ASSERT_EQ(instances.size(), 2U);
        EXPECT_EQ(textOf(instances[0], "PrefixLength"), "8");
        EXPECT_EQ(textOf(instances[1], "PrefixLength"), "16");
    }
}

TEST(NextHopIpRouteProvider, doesWithOneVersion) {
    RecordedTree tree;
    EXPECT_EQ(NextHopIpRouteProvider(tree.paths()).enumerate()->absence(), Absence::Absent);
    const std::string nothing(32, '0');
    tree.file("proc/net/ipv6_route", nothing + " 00 " + nothing + " 00 " + nothing +
                                         " 00000400 00000001 00000000 00000001     eth0\n");
    const auto instances = all(NextHopIpRouteProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "AddressType"), "2");
    EXPECT_EQ(textOf(instances[0], "TypeOfRoute"), "4");
    EXPECT_EQ(textOf(instances[0], "RouteMetric"), "1024");
    EXPECT_EQ(textOf(instances[0], "MetricText"), "1024");
    EXPECT_EQ(NextHopIpRouteProvider(tree.paths()).enumerate()->absence(), std::nullopt);
}

// The column of metrics had a 0 for one that takes more than 16 bits.
TEST(NextHopIpRouteProvider, tellsLongMetricsAsText) {
    RecordedTree tree;
    tree.file("proc/net/route",
              "Iface\neth0\t0000000A\t00000000\t0001\t0\t0\t4294967295\t000000FF\t0\t0\t0\n");
    const auto instances = all(NextHopIpRouteProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "RouteMetric"), "null");
    EXPECT_EQ(textOf(instances[0], "MetricText"), "4294967295");
}

// Where one table could not be read, its routes were missing without a word.
TEST(NextHopIpRouteProvider, saysWhenATableCannotBeRead) {
    RecordedTree tree;
    tree.file("proc/net/route",
              "Iface\neth0\t0000000A\t00000000\t0001\t0\t0\t0\t000000FF\t0\t0\t0\n")
        .directory("proc/net/ipv6_route");
    const auto stream = NextHopIpRouteProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_TRUE(stream->next(provided));
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Unreadable);
    std::filesystem::remove(tree.root / "proc/net/route");
    EXPECT_EQ(NextHopIpRouteProvider(tree.paths()).enumerate()->absence(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
