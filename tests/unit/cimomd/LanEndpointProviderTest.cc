#include "providers/network/LanEndpointProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"

namespace cimomd {
namespace {

Pegasus::CIMInstance endpointOf(const NetworkInterface& interface) {
    return LanEndpointProvider::publish("node7", interface).instance;
}

TEST(LanEndpointProvider, tellsTheTypeOfInterface) {
    struct Case {
        std::uint64_t linkType;
        Fact<std::string> kind;
        bool hasDevice;
        const char* type;
    };
    for (const Case& expected : std::vector<Case>{{1, Absence::Absent, true, "6"},
                                                  {1, Absence::Absent, false, "53"},
                                                  {1, std::string("vxlan"), false, "53"},
                                                  {1, std::string("vlan"), false, "135"},
                                                  {1, std::string("bond"), false, "161"},
                                                  {1, std::string("bridge"), false, "209"},
                                                  {1, std::string("wlan"), true, "71"},
                                                  {32, Absence::Absent, true, "199"},
                                                  {24, Absence::Absent, true, "1"}}) {
        NetworkInterface interface;
        interface.linkType = expected.linkType;
        interface.kind = expected.kind;
        interface.hasDevice = expected.hasDevice;
        EXPECT_EQ(textOf(endpointOf(interface), "ProtocolIFType"), expected.type);
    }
    EXPECT_EQ(textOf(endpointOf({}), "ProtocolIFType"), "null");
}

TEST(LanEndpointProvider, dropsWhatDoesNotFit) {
    NetworkInterface interface;
    interface.address = std::string("80:00:02:08:fe:80:00:00:00:00:00:00:f4:52:14:03:00:7b:cb:a1");
    interface.mtuBytes = std::uint64_t{536870912};
    EXPECT_EQ(textOf(endpointOf(interface), "MACAddress"), "null");
    EXPECT_EQ(textOf(endpointOf(interface), "MaxDataSize"), "null");
    EXPECT_EQ(textOf(endpointOf(interface), "MTU"), "536870912");
    interface.mtuBytes = std::uint64_t{1} << 61U;
    EXPECT_EQ(textOf(endpointOf(interface), "MaxDataSize"), "null");
    EXPECT_EQ(textOf(endpointOf(interface), "MTU"), "null");
}

TEST(LanEndpointProvider, takesInterfacesWithAnAddress) {
    RecordedTree tree;
    EXPECT_EQ(LanEndpointProvider(tree.paths(), FixedSystemCalls()).enumerate()->absence(),
              Absence::Absent);
    tree.file("sys/class/net/lo/address", "00:00:00:00:00:00\n")
        .file("sys/class/net/tun0/type", "65534\n")
        .file("sys/class/net/br0/address", "52:54:00:12:34:56\n");
    const auto instances = all(LanEndpointProvider(tree.paths(), FixedSystemCalls()).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "Name"), "br0");
    EXPECT_EQ(textOf(instances[0], "CreationClassName"), "Velmira_LANEndpoint");
}

}  // namespace
}  // namespace cimomd
