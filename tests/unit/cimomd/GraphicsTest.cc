#include "system/devices/Graphics.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

std::string smallestEdid() {
    std::string bytes(128, '\0');
    bytes.replace(1, 6, "\xFF\xFF\xFF\xFF\xFF\xFF");
    // Six times 255 and 6 are 6 times 256.
    bytes.back() = 6;
    return bytes;
}

TEST(Graphics, findsConnectorsWithAMonitor) {
    RecordedTree tree;
    tree.file("drm/card0-DP-1/status", "connected\n")
        .file("drm/card0-DP-2/status", "disconnected\n")
        .file("drm/card0-VGA-1/status", "unknown\n")
        .file("drm/card0-VGA-2/status", "unknown\n")
        .file("drm/card0-VGA-2/edid", smallestEdid())
        .file("drm/card10-DP-1/status", "connected\n")
        .file("drm/card2-DP-1/status", "connected\n")
        .file("drm/card0/status", "connected\n")
        .file("drm/renderD128/status", "connected\n")
        .file("drm/cardx-DP-1/status", "connected\n")
        .file("drm/version", "drm 1.1.0 20060810\n");
    const auto monitors = readMonitors(tree.root / "drm");
    ASSERT_EQ(monitors->size(), 4U);
    EXPECT_EQ((*monitors)[0].connector, "card0-DP-1");
    EXPECT_EQ((*monitors)[1].connector, "card0-VGA-2");
    EXPECT_EQ((*monitors)[2].connector, "card2-DP-1");
    EXPECT_EQ((*monitors)[3].connector, "card10-DP-1");
}

TEST(Graphics, saysWhyAMonitorTellsNothing) {
    RecordedTree tree;
    for (const char* connector : {"drm/card0-A-1", "drm/card0-B-1", "drm/card0-C-1"})
        tree.file(std::string(connector) + "/status", "connected\n");
    tree.file("drm/card0-B-1/edid", "").file("drm/card0-C-1/edid", std::string(128, 'x'));
    const auto monitors = readMonitors(tree.root / "drm");
    ASSERT_EQ(monitors->size(), 3U);
    for (const Monitor& monitor : *monitors)
        EXPECT_FALSE(monitor.edid);
    EXPECT_EQ((*monitors)[0].edid.reason(), Absence::Absent);
    EXPECT_EQ((*monitors)[1].edid.reason(), Absence::Absent);
    EXPECT_EQ((*monitors)[2].edid.reason(), Absence::Unreadable);
}

TEST(Graphics, knowsWhetherAPictureIsSent) {
    RecordedTree tree;
    const auto enabled = [&tree](const char* text) {
        tree.file("drm/card0-A-1/status", "connected\n").file("drm/card0-A-1/enabled", text);
        return readMonitors(tree.root / "drm")->at(0).isEnabled;
    };
    EXPECT_EQ(enabled("enabled\n"), true);
    EXPECT_EQ(enabled("disabled\n"), false);
    EXPECT_FALSE(enabled("perhaps\n"));
}

TEST(Graphics, takesCardsOfTheDeviceTreeOnly) {
    RecordedTree tree;
    tree.file("drm/card1/device/uevent", "OF_COMPATIBLE_0=brcm,bcm2711-vc5\nDRIVER=vc4-drm\n")
        .file("drm/card0/device/uevent", "DRIVER=i915\nPCI_SLOT_NAME=0000:00:02.0\n")
        .file("drm/card2/device/uevent", "OF_COMPATIBLE_0=\n")
        .file("drm/card3-DP-1/device/uevent", "OF_COMPATIBLE_0=x,y\n")
        .directory("drm/card4");
    const auto cards = readBuiltInGraphics(tree.root / "drm");
    ASSERT_EQ(cards->size(), 1U);
    EXPECT_EQ((*cards)[0].card, "card1");
    EXPECT_EQ((*cards)[0].driver, "vc4-drm");
    EXPECT_EQ((*cards)[0].compatible, "brcm,bcm2711-vc5");
}

TEST(Graphics, saysThatThereIsNone) {
    RecordedTree tree;
    EXPECT_EQ(readMonitors(tree.root / "drm").reason(), Absence::Absent);
    EXPECT_EQ(readBuiltInGraphics(tree.root / "drm").reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
