#include "system/network/LinkSettings.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(LinkSettings, readsRecordedLines) {
    const auto links = parseRecordedLinks(
        "eth0 52:54:00:12:34:56 0\n"
        "eth1 - 3\n"
        "wlan0 dc:a6:32:0b:1c:e5 -\n"
        "eth2 - 255\n"
        "eth3 too many fields\n"
        "eth4 -\n");
    ASSERT_EQ(links.size(), 4U);
    EXPECT_EQ(links.at("eth0").permanentAddress, "52:54:00:12:34:56");
    EXPECT_EQ(links.at("eth0").connector, PortConnector::TwistedPair);
    EXPECT_EQ(links.at("eth1").permanentAddress, std::nullopt);
    EXPECT_EQ(links.at("eth1").connector, PortConnector::Fibre);
    EXPECT_EQ(links.at("wlan0").connector, std::nullopt);
    EXPECT_EQ(links.at("eth2").connector, std::nullopt);
}

TEST(LinkSettings, knowsTheConnectorsOfEthtool) {
    EXPECT_EQ(connectorOf(1), PortConnector::Aui);
    EXPECT_EQ(connectorOf(2), PortConnector::Mii);
    EXPECT_EQ(connectorOf(4), PortConnector::Bnc);
    EXPECT_EQ(connectorOf(5), PortConnector::DirectAttach);
    // None, other, and what a later kernel may add.
    for (const unsigned port : {0xEFU, 0xFFU, 6U})
        EXPECT_FALSE(connectorOf(port).has_value()) << port;
}

TEST(LinkSettings, writesHardwareAddresses) {
    EXPECT_EQ(hardwareAddressText({"\x52\x54\x00\x12\xAB\xFF", 6}), "52:54:00:12:ab:ff");
    EXPECT_EQ(hardwareAddressText(std::string(6, '\0')), std::nullopt);
    EXPECT_EQ(hardwareAddressText(""), std::nullopt);
}

}  // namespace
}  // namespace cimomd
