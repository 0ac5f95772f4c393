// The network of the recorded machines.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/network/DnsSettingDataProvider.h"
#include "providers/network/EthernetPortProvider.h"
#include "providers/network/IpProtocolEndpointProvider.h"
#include "providers/network/LanEndpointProvider.h"
#include "providers/network/NextHopIpRouteProvider.h"
#include "providers/network/WiFiPortProvider.h"
#include "system/RecordedSystemCalls.h"

namespace cimomd {
namespace {

class NetworkMachine {
    SystemPaths paths;
    RecordedSystemCalls calls;

  public:
    explicit NetworkMachine(const char* name) : paths(machine(name)), calls(paths) {}

    const EthernetPortProvider ethernet{paths, calls};
    const WiFiPortProvider wifi{paths, calls};
    const LanEndpointProvider lan{paths, calls};
    const IpProtocolEndpointProvider addresses{paths, calls};
    const NextHopIpRouteProvider routes{paths};
    const DnsSettingDataProvider resolver{paths};
};

const std::vector<const char*> kPort{
    "DeviceID",          "PermanentAddress", "NetworkAddresses", "SpeedMbps",
    "FullDuplex",        "PortType",         "OtherPortType",    "EnabledState",
    "OperationalStatus", "DriverName",       "BusAddress",       "ActiveMaximumTransmissionUnit"};
const std::vector<const char*> kLan{"Name", "ProtocolIFType", "MACAddress", "MaxDataSize",
                                    "MTU",  "EnabledState"};
const std::vector<const char*> kAddress{"Name",          "ProtocolIFType",   "IPv4Address",
                                        "SubnetMask",    "IPv6Address",      "PrefixLength",
                                        "AddressOrigin", "OperationalStatus"};
const std::vector<const char*> kRoute{"DestinationAddress", "DestinationMask", "PrefixLength",
                                      "AddressType",        "GatewayAddress",  "InterfaceName",
                                      "RouteMetric"};
const std::vector<const char*> kResolver{"DNSServerAddresses", "DomainName", "SearchDomains"};

TEST(NetworkMachines, laptopPorts) {
    const NetworkMachine laptop("laptop");
    EXPECT_EQ(tableOf(laptop.ethernet, kPort),
              (Table{{"enp0s31f6", "54E1AD7C2091", "54E1AD7C2091 ", "null", "null", "null", "null",
                      "6", "10 ", "e1000e", "0000:00:1f.6", "1500"}}));
    // On the air with an address made up, the one burnt in is the driver's secret.
    EXPECT_EQ(tableOf(laptop.wifi, kPort),
              (Table{{"wlp0s20f3", "A46BB64012C8", "9E1BC405773A ", "null", "null", "null", "null",
                      "2", "2 ", "iwlwifi", "0000:00:14.3", "1500"}}));
    EXPECT_EQ(tableOf(laptop.wifi, {"LinkTechnology", "Name", "Speed"}),
              (Table{{"11", "wlp0s20f3", "null"}}));
    EXPECT_EQ(tableOf(laptop.lan, kLan),
              (Table{{"docker0", "209", "02427D1E55B0", "12000", "1500", "6"},
                     {"enp0s31f6", "6", "54E1AD7C2091", "12000", "1500", "6"},
                     {"wlp0s20f3", "71", "9E1BC405773A", "12000", "1500", "2"}}));
}

TEST(NetworkMachines, laptopAddresses) {
    const NetworkMachine laptop("laptop");
    const std::string stable = "2001:db8:4711:200:a66b:b6ff:fe40:12c8";
    const std::string temporary = "2001:db8:4711:200:3c5a:91ff:7e2b:1d04";
    const std::string link = "fe80::a66b:b6ff:fe40:12c8";
    EXPECT_EQ(
        tableOf(laptop.addresses, kAddress),
        (Table{
            {"docker0 172.17.0.1/16", "4096", "172.17.0.1", "255.255.0.0", "null", "null", "3",
             "2 "},
            {"lo 127.0.0.1/8", "4096", "127.0.0.1", "255.0.0.0", "null", "null", "2", "2 "},
            {"lo ::1/128", "4097", "null", "null", "::1", "128", "2", "2 "},
            {"wlp0s20f3 192.168.178.34/24", "4096", "192.168.178.34", "255.255.255.0", "null",
             "null", "4", "2 "},
            {"wlp0s20f3 " + temporary + "/64", "4097", "null", "null", temporary, "64", "9", "2 "},
            {"wlp0s20f3 " + stable + "/64", "4097", "null", "null", stable, "64", "9", "2 "},
            {"wlp0s20f3 " + link + "/64", "4097", "null", "null", link, "64", "10", "2 "}}));
    EXPECT_EQ(tableOf(laptop.addresses, {"InterfaceName", "AddressWithPrefix"})[3],
              (Row{"wlp0s20f3", "192.168.178.34/24"}));
}

TEST(NetworkMachines, laptopRoutesAndResolver) {
    const NetworkMachine laptop("laptop");
    EXPECT_EQ(tableOf(laptop.routes, kRoute),
              (Table{{"0.0.0.0", "0.0.0.0", "0", "1", "192.168.178.1", "wlp0s20f3", "600"},
                     {"172.17.0.0", "255.255.0.0", "16", "1", "null", "docker0", "0"},
                     {"192.168.178.0", "255.255.255.0", "24", "1", "null", "wlp0s20f3", "600"},
                     {"::", "null", "0", "2", "fe80::cece:1eff:fe4b:1", "wlp0s20f3", "600"},
                     {"2001:db8:4711:200::", "null", "64", "2", "null", "wlp0s20f3", "600"},
                     {"fe80::", "null", "64", "2", "null", "wlp0s20f3", "1024"}}));
    EXPECT_EQ(tableOf(laptop.routes, {"InstanceID"})[0],
              Row{"Velmira:0.0.0.0/0 via 192.168.178.1 dev wlp0s20f3 metric 600"});
    EXPECT_EQ(tableOf(laptop.resolver, kResolver),
              (Table{{"192.168.178.1 fe80::cece:1eff:fe4b:1%wlp0s20f3 ", "home.example",
                      "home.example "}}));
}

TEST(NetworkMachines, serverPorts) {
    const NetworkMachine server("server");
    EXPECT_EQ(tableOf(server.ethernet, kPort),
              (Table{{"eno1", "B02628A13C40", "B02628A13C40 ", "1000", "TRUE", "53", "null", "2",
                      "2 ", "igb", "0000:04:00.0", "1500"},
                     {"eno2", "B02628A13C41", "B02628A13C41 ", "null", "null", "null", "null", "3",
                      "10 ", "igb", "0000:04:00.1", "1500"},
                     {"ens1f0np0", "0C42A15E90D2", "0C42A15E90D2 ", "25000", "TRUE", "1",
                      "Direct Attach Copper", "2", "2 ", "mlx5_core", "0000:5e:00.0", "9000"},
                     // A bond gives all its ports the address of the first.
                     {"ens1f1np1", "0C42A15E90D3", "0C42A15E90D2 ", "25000", "TRUE", "1", "Fibre",
                      "2", "2 ", "mlx5_core", "0000:5e:00.1", "9000"},
                     {"ens2f0", "A0369FB80110", "A0369FB80110 ", "10000", "TRUE", "55", "null", "2",
                      "2 ", "ixgbe", "0000:86:00.0", "1500"}}));
    EXPECT_EQ(tableOf(server.ethernet, {"Speed", "LinkTechnology"})[2], (Row{"25000000000", "2"}));
    EXPECT_TRUE(tableOf(server.wifi, kPort).empty());
    EXPECT_EQ(tableOf(server.lan, kLan),
              (Table{{"bond0", "161", "0C42A15E90D2", "72000", "9000", "2"},
                     {"bond0.100", "135", "0C42A15E90D2", "72000", "9000", "2"},
                     {"eno1", "6", "B02628A13C40", "12000", "1500", "2"},
                     {"eno2", "6", "B02628A13C41", "12000", "1500", "3"},
                     {"ens1f0np0", "6", "0C42A15E90D2", "72000", "9000", "2"},
                     {"ens1f1np1", "6", "0C42A15E90D2", "72000", "9000", "2"},
                     {"ens2f0", "6", "A0369FB80110", "12000", "1500", "2"}}));
}

TEST(NetworkMachines, serverAddresses) {
    const NetworkMachine server("server");
    const std::string link = "fe80::e42:a1ff:fe5e:90d2";
    EXPECT_EQ(
        tableOf(server.addresses, kAddress),
        (Table{{"bond0 " + link + "/64", "4097", "null", "null", link, "64", "10", "2 "},
               {"bond0.100 10.20.0.11/22", "4096", "10.20.0.11", "255.255.252.0", "null", "null",
                "3", "2 "},
               {"bond0.100 2001:db8:20:100::11/64", "4097", "null", "null", "2001:db8:20:100::11",
                "64", "3", "2 "},
               {"bond0.100 2001:db8:20:100::d:4f2/128", "4097", "null", "null",
                "2001:db8:20:100::d:4f2", "128", "7", "2 "},
               {"bond0.100 " + link + "/64", "4097", "null", "null", link, "64", "10", "2 "},
               {"eno1 169.254.3.7/16", "4096", "169.254.3.7", "255.255.0.0", "null", "null", "6",
                "2 "},
               {"lo 127.0.0.1/8", "4096", "127.0.0.1", "255.0.0.0", "null", "null", "2", "2 "},
               {"lo ::1/128", "4097", "null", "null", "::1", "128", "2", "2 "}}));
}

TEST(NetworkMachines, serverRoutesAndResolver) {
    const NetworkMachine server("server");
    EXPECT_EQ(tableOf(server.routes, kRoute),
              (Table{{"0.0.0.0", "0.0.0.0", "0", "1", "10.20.0.1", "bond0.100", "0"},
                     {"10.0.0.0", "255.0.0.0", "8", "1", "null", "null", "0"},
                     {"10.20.0.0", "255.255.252.0", "22", "1", "null", "bond0.100", "0"},
                     // The metric is 100000, more than the property can hold.
                     {"169.254.0.0", "255.255.0.0", "16", "1", "null", "eno1", "null"},
                     {"::", "null", "0", "2", "2001:db8:20:100::1", "bond0.100", "1024"},
                     {"2001:db8:20:100::", "null", "64", "2", "null", "bond0.100", "256"},
                     {"fe80::", "null", "64", "2", "null", "bond0", "256"},
                     {"fe80::", "null", "64", "2", "null", "bond0.100", "256"}}));
    EXPECT_EQ(tableOf(server.resolver, kResolver),
              (Table{{"10.20.0.2 10.20.0.3 2001:db8:20:100::53 ", "dc1.corp.example",
                      "dc1.corp.example corp.example "}}));
}

TEST(NetworkMachines, virtualMachinePorts) {
    const NetworkMachine guest("virtual");
    const Row eth0{"eth0", "525400123456", "525400123456 ", "null", "null", "null", "null",
                   "2",    "2 ",           "virtio_net",    "null", "1500"};
    const Table ports = tableOf(guest.ethernet, kPort);
    ASSERT_EQ(ports.size(), 3U);
    EXPECT_EQ(ports[0], eth0);
    EXPECT_EQ(ports[1][0], "eth2");
    // Its driver tells no state, but has a carrier.
    EXPECT_EQ(ports[2], (Row{"eth10", "525400123460", "525400123460 ", "null", "null", "null",
                             "null", "2", "2 ", "virtio_net", "null", "1500"}));
    EXPECT_TRUE(tableOf(guest.wifi, kPort).empty());
    EXPECT_EQ(tableOf(guest.lan, {"Name"}), (Table{{"eth0"}, {"eth2"}, {"eth10"}}));
}

TEST(NetworkMachines, virtualMachineAddressesRoutesAndResolver) {
    const NetworkMachine guest("virtual");
    EXPECT_EQ(
        tableOf(guest.addresses, kAddress),
        (Table{
            {"eth0 10.0.2.15/24", "4096", "10.0.2.15", "255.255.255.0", "null", "null", "4", "2 "},
            {"eth2 192.0.2.10/32", "4096", "192.0.2.10", "255.255.255.255", "null", "null", "3",
             "2 "},
            {"eth2 192.0.2.10 peer 192.0.2.1/32", "4096", "192.0.2.10", "255.255.255.255", "null",
             "null", "3", "2 "},
            // Another computer has the same link-local address.
            {"eth10 fe80::5054:ff:fe12:3460/64", "4097", "null", "null", "fe80::5054:ff:fe12:3460",
             "64", "10", "6 "},
            {"eth10 fec0::5054:ff:fe12:3460/64", "4097", "null", "null", "fec0::5054:ff:fe12:3460",
             "64", "9", "2 "},
            {"lo 127.0.0.1/8", "4096", "127.0.0.1", "255.0.0.0", "null", "null", "2", "2 "}}));
    EXPECT_EQ(tableOf(guest.routes, kRoute),
              (Table{{"0.0.0.0", "0.0.0.0", "0", "1", "10.0.2.2", "eth0", "100"},
                     {"10.0.2.0", "255.255.255.0", "24", "1", "null", "eth0", "100"},
                     {"10.0.2.2", "255.255.255.255", "32", "1", "null", "eth0", "100"},
                     {"192.0.2.1", "255.255.255.255", "32", "1", "null", "eth2", "0"}}));
    EXPECT_EQ(tableOf(guest.resolver, kResolver), (Table{{"10.0.2.3 ", "null", "null"}}));
}

TEST(NetworkMachines, armBoard) {
    const NetworkMachine board("arm");
    EXPECT_EQ(tableOf(board.ethernet, kPort),
              (Table{{"eth0", "DCA6320B1CE4", "DCA6320B1CE4 ", "100", "FALSE", "52", "null", "2",
                      "2 ", "bcmgenet", "null", "1500"}}));
    EXPECT_EQ(tableOf(board.wifi, kPort),
              (Table{{"wlan0", "DCA6320B1CE5", "DCA6320B1CE5 ", "null", "null", "null", "null", "2",
                      "15 ", "brcmfmac", "null", "1500"}}));
    EXPECT_EQ(tableOf(board.addresses, {"Name", "AddressOrigin"}),
              (Table{{"eth0 192.168.1.77/24", "4"}, {"lo 127.0.0.1/8", "2"}}));
    // The kernel runs without version 6.
    EXPECT_EQ(tableOf(board.routes, kRoute),
              (Table{{"0.0.0.0", "0.0.0.0", "0", "1", "192.168.1.254", "eth0", "202"},
                     {"192.168.1.0", "255.255.255.0", "24", "1", "null", "eth0", "202"}}));
    EXPECT_EQ(tableOf(board.resolver, kResolver),
              (Table{{"192.168.1.254 ", "lan.example", "lan.example "}}));
}

TEST(NetworkMachines, serveWhatTheSchemaDeclares) {
    const NetworkMachine laptop("laptop");
    for (const Provider* provider : std::initializer_list<const Provider*>{
             &laptop.ethernet, &laptop.wifi, &laptop.lan, &laptop.addresses, &laptop.routes,
             &laptop.resolver})
        expectServesItsClass(*provider);
    expectServesItsClass(NetworkMachine("server").routes);
    expectServesItsClass(NetworkMachine("virtual").addresses);
}

}  // namespace
}  // namespace cimomd
