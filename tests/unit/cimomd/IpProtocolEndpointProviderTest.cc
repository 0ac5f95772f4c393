#include "providers/network/IpProtocolEndpointProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "system/RecordedSystemCalls.h"

namespace cimomd {
namespace {

std::string originOf(const std::string& recordedLine) {
    const auto addresses = parseRecordedAddresses(recordedLine);
    if (addresses.size() != 1)
        return "no address";
    return textOf(IpProtocolEndpointProvider::publish("node7", addresses[0]).instance,
                  "AddressOrigin");
}

// IFA_PROTO of the kernel: 1 loopback, 2 router announcement, 3 link-local, others of programs.
TEST(IpProtocolEndpointProvider, takesTheOriginThatTheKernelTells) {
    EXPECT_EQ(originOf("eth0 2001:db8::1 - 64 0x0 forever 2"), "9");
    EXPECT_EQ(originOf("eth0 2001:db8::1 - 128 0x0 3600 2"), "9");
    EXPECT_EQ(originOf("eth0 fe80::1 - 64 0x80 forever 3"), "10");
    EXPECT_EQ(originOf("lo ::1 - 128 0x80 forever 1"), "2");
    EXPECT_EQ(originOf("eth0 192.0.2.1 - 24 0x0 3600 0"), "4");
    EXPECT_EQ(originOf("eth0 192.0.2.1 - 24 0x80 forever 16"), "3");
}

TEST(IpProtocolEndpointProvider, concludesTheOrigin) {
    EXPECT_EQ(originOf("eth0 192.0.2.1 - 24 0x80 forever"), "3");
    EXPECT_EQ(originOf("eth0 192.0.2.1 - 24 0x0 3600"), "4");
    EXPECT_EQ(originOf("eth0 192.0.2.1 - 32 0x0 3600"), "4");
    EXPECT_EQ(originOf("eth0 169.254.1.1 - 16 0x0 3600"), "6");
    EXPECT_EQ(originOf("eth0 2001:db8::1 - 128 0x200 3600"), "7");
    EXPECT_EQ(originOf("eth0 2001:db8::1 - 128 0x80 forever"), "3");
    EXPECT_EQ(originOf("eth0 2001:db8::1 - 64 0x100 3600"), "9");
    EXPECT_EQ(originOf("eth0 fe80::1 - 64 0x80 forever"), "10");
    EXPECT_EQ(originOf("lo 127.0.0.1 - 8 0x80 forever"), "2");
    EXPECT_EQ(originOf("lo ::1 - 128 0x80 forever"), "2");
}

TEST(IpProtocolEndpointProvider, tellsAddressesThatAreNotReadyYet) {
    const auto addresses = parseRecordedAddresses("eth0 2001:db8::1 - 64 0xc0 forever");
    const auto instance = IpProtocolEndpointProvider::publish("node7", addresses.at(0)).instance;
    EXPECT_EQ(textOf(instance, "OperationalStatus"), "8 ");
    EXPECT_EQ(textOf(instance, "EnabledState"), "5");
    EXPECT_EQ(textOf(instance, "SystemName"), "node7");
}

TEST(IpProtocolEndpointProvider, saysThatAddressesAreNotKnown) {
    RecordedTree tree;
    const RecordedSystemCalls calls(tree.paths());
    const IpProtocolEndpointProvider provider(tree.paths(), calls);
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Absent);
    EXPECT_TRUE(all(provider.enumerate()).empty());
}

}  // namespace
}  // namespace cimomd
