#include "providers/network/EthernetPortProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "system/RecordedSystemCalls.h"

namespace cimomd {
namespace {

class EthernetPortProviderTest : public testing::Test {
  protected:
    RecordedTree tree;
    RecordedSystemCalls calls{tree.paths()};
};

TEST_F(EthernetPortProviderTest, publishesPorts) {
    const auto port = [this](const std::string& name, const char* state, const char* flags) {
        const std::string base = "sys/class/net/" + name;
        tree.file(base + "/type", "1\n")
            .file(base + "/operstate", state)
            .file(base + "/flags", flags)
            .directory(base + "/device");
    };
    port("enp1s0", "up\n", "0x1003\n");
    tree.file("sys/class/net/enp1s0/address", "52:54:00:ab:cd:ef\n")
        .file("sys/class/net/enp1s0/addr_assign_type", "0\n")
        .file("sys/class/net/enp1s0/mtu", "1500\n")
        .file("sys/class/net/enp1s0/speed", "10000\n")
        .file("sys/class/net/enp1s0/duplex", "full\n");
    port("enp2s0", "down\n", "0x1003\n");
    tree.file("sys/class/net/enp2s0/address", "52:54:00:ab:cd:f0\n")
        .file("sys/class/net/enp2s0/addr_assign_type", "3\n")
        .file("sys/class/net/enp2s0/speed", "-1\n");
    port("enp3s0", "down\n", "0x1002\n");
    tree.file("sys/class/net/lo/type", "772\n");
    const auto instances = all(EthernetPortProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 3U);
    EXPECT_EQ(textOf(instances[0], "DeviceID"), "enp1s0");
    EXPECT_EQ(textOf(instances[0], "PermanentAddress"), "525400ABCDEF");
    EXPECT_EQ(textOf(instances[0], "NetworkAddresses"), "525400ABCDEF ");
    EXPECT_EQ(textOf(instances[0], "Speed"), "10000000000");
    EXPECT_EQ(textOf(instances[0], "SpeedMbps"), "10000");
    EXPECT_EQ(textOf(instances[0], "FullDuplex"), "TRUE");
    EXPECT_EQ(textOf(instances[0], "LinkTechnology"), "2");
    EXPECT_EQ(textOf(instances[0], "ActiveMaximumTransmissionUnit"), "1500");
    EXPECT_EQ(textOf(instances[0], "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(instances[0], "EnabledState"), "2");
    EXPECT_EQ(textOf(instances[1], "PermanentAddress"), "null");
    EXPECT_EQ(textOf(instances[1], "NetworkAddresses"), "525400ABCDF0 ");
    EXPECT_EQ(textOf(instances[1], "Speed"), "null");
    EXPECT_EQ(textOf(instances[1], "SpeedMbps"), "null");
    EXPECT_EQ(textOf(instances[1], "FullDuplex"), "null");
    EXPECT_EQ(textOf(instances[1], "OperationalStatus"), "10 ");
    EXPECT_EQ(textOf(instances[1], "EnabledState"), "6");
    EXPECT_EQ(textOf(instances[2], "EnabledState"), "3");
}

TEST_F(EthernetPortProviderTest, saysThatAMachineShowsNoInterfaces) {
    const auto stream = EthernetPortProvider(tree.paths(), calls).enumerate();
    EXPECT_EQ(stream->absence(), Absence::Absent);
    EXPECT_TRUE(all(EthernetPortProvider(tree.paths(), calls).enumerate()).empty());
    tree.directory("sys/class/net");
    EXPECT_EQ(EthernetPortProvider(tree.paths(), calls).enumerate()->absence(), std::nullopt);
    EXPECT_TRUE(all(EthernetPortProvider(tree.paths(), calls).enumerate()).empty());
}

/// The port of that connector, at that speed.
Pegasus::CIMInstance portOf(const Fact<PortConnector>& connector,
                            const Fact<std::uint64_t>& speedMbps) {
    NetworkInterface interface;
    interface.name = "eth0";
    interface.speedMbps = speedMbps;
    return EthernetPortProvider::publish("node7", interface, {Absence::NeedsRoot, connector})
        .instance;
}

TEST_F(EthernetPortProviderTest, tellsTheKindOfPort) {
    struct Case {
        Fact<PortConnector> connector;
        Fact<std::uint64_t> speedMbps;
        const char* type;
        const char* otherType;
    };
    for (const Case& expected :
         std::vector<Case>{{PortConnector::TwistedPair, 10U, "50", "null"},
                           {PortConnector::TwistedPair, 100U, "52", "null"},
                           {PortConnector::TwistedPair, 1000U, "53", "null"},
                           {PortConnector::TwistedPair, 2500U, "54", "null"},
                           {PortConnector::TwistedPair, 10000U, "55", "null"},
                           {PortConnector::TwistedPair, 5000U, "1", "Twisted Pair"},
                           {PortConnector::TwistedPair, Absence::Absent, "null", "null"},
                           {PortConnector::Fibre, Absence::Absent, "1", "Fibre"},
                           {PortConnector::DirectAttach, 25000U, "1", "Direct Attach Copper"},
                           {PortConnector::Aui, 10U, "1", "AUI"},
                           {PortConnector::Mii, 100U, "1", "MII"},
                           {PortConnector::Bnc, 10U, "1", "BNC"},
                           {Absence::NeedsRoot, 1000U, "null", "null"}}) {
        const Pegasus::CIMInstance port = portOf(expected.connector, expected.speedMbps);
        EXPECT_EQ(textOf(port, "PortType"), expected.type) << expected.otherType;
        EXPECT_EQ(textOf(port, "OtherPortType"), expected.otherType) << expected.type;
    }
}

TEST_F(EthernetPortProviderTest, keepsTheReasonOfAMissingAddress) {
    NetworkInterface interface;
    interface.name = "eth0";
    interface.address = std::string("52:54:00:00:00:01");
    interface.addressIsPermanent = false;
    const auto provided =
        EthernetPortProvider::publish("node7", interface, {Absence::NeedsRoot, Absence::Absent});
    EXPECT_EQ(textOf(provided.instance, "PermanentAddress"), "null");
    EXPECT_EQ(textOf(provided.instance, "NetworkAddresses"), "525400000001 ");
    const auto missing = std::find_if(provided.missing.begin(), provided.missing.end(),
                                      [](const MissingValue& value) {
                                          return value.property == std::string("PermanentAddress");
                                      });
    ASSERT_NE(missing, provided.missing.end());
    EXPECT_EQ(missing->reason, Absence::NeedsRoot);
}

}  // namespace
}  // namespace cimomd
