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
}

}  // namespace
}  // namespace cimomd
