#include "system/devices/HardwareNames.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

constexpr std::string_view kList =
    "# a comment\n"
    "\n"
    "1af4  Red Hat, Inc.\n"
    "\t1000  Virtio network device\n"
    "\t\t1af4 0001  Virtio network card\n"
    "\t\t01  a USB interface\n"
    "8086  Intel Corporation\n"
    "\t1000  82542 Gigabit Ethernet Controller\n"
    "\t1000  another name for it\n"
    "8086  another Intel\n"
    "C 02  Network controller\n"
    "\t00  Ethernet controller\n"
    "\t\t1af4 0001  not a subsystem\n"
    "HUT 01  Generic Desktop Controls\n"
    "\t000  Undefined\n";

Fact<std::string> nameIn(std::string_view list, const HardwareNames::Key& key) {
    HardwareNames names;
    names.want(key);
    names.read(std::string(list));
    return names.nameOf(key);
}

TEST(HardwareNames, findsWhatItWasAskedFor) {
    const auto network = HardwareNames::device(0x1AF4, 0x1000);
    EXPECT_EQ(nameIn(kList, HardwareNames::vendor(0x1AF4)), "Red Hat, Inc.");
    EXPECT_EQ(nameIn(kList, network), "Virtio network device");
    EXPECT_EQ(nameIn(kList, HardwareNames::subsystem(network, 0x1AF4, 1)), "Virtio network card");
    EXPECT_EQ(nameIn(kList, HardwareNames::baseClass(2)), "Network controller");
    EXPECT_EQ(nameIn(kList, HardwareNames::subclass(2, 0)), "Ethernet controller");
}

TEST(HardwareNames, keepsTheDevicesOfVendorsApart) {
    EXPECT_EQ(nameIn(kList, HardwareNames::device(0x8086, 0x1000)),
              "82542 Gigabit Ethernet Controller");
    EXPECT_EQ(nameIn(kList, HardwareNames::vendor(0x8086)), "Intel Corporation");
}

TEST(HardwareNames, hasNoNameForWhatTheListDoesNotHold) {
    for (const auto& key : {HardwareNames::vendor(0x1AF5), HardwareNames::device(0x1AF4, 0x1001),
                            HardwareNames::subsystem(HardwareNames::device(0x1AF4, 0x1000), 0, 1),
                            HardwareNames::baseClass(3), HardwareNames::subclass(2, 1)}) {
        const auto name = nameIn(kList, key);
        EXPECT_FALSE(name);
        EXPECT_EQ(name.reason(), Absence::Absent);
    }
}

TEST(HardwareNames, answersOnlyWhatItWasAsked) {
    HardwareNames names;
    names.want(HardwareNames::vendor(0x1AF4));
    names.read(std::string(kList));
    EXPECT_FALSE(names.nameOf(HardwareNames::vendor(0x8086)));
}

TEST(HardwareNames, skipsLinesItDoesNotUnderstand) {
    const auto vendor = HardwareNames::vendor(0x8086);
    for (const char* list : {"", "8086", "8086\n", "8086 \n", "808  x\n", "80861  x\n",
                             "\t8086  x\n", "x086  x\n", "C 8086  x\n"})
        EXPECT_FALSE(nameIn(list, vendor)) << list;
    EXPECT_EQ(nameIn("garbage \xFF\n8086  Intel", vendor), "Intel");
    EXPECT_EQ(nameIn("8086  Intel \r\n", vendor), "Intel");
}

TEST(HardwareNames, forgetsTheVendorAtALineOfAnotherKind) {
    const auto device = HardwareNames::device(0x8086, 0x1000);
    EXPECT_FALSE(nameIn("8086  Intel\nAT 0100  USB Undefined\n\t1000  no device\n", device));
    EXPECT_FALSE(nameIn("\t1000  no device\n", device));
    const auto subsystem = HardwareNames::subsystem(device, 1, 2);
    EXPECT_FALSE(nameIn("8086  Intel\n\t1000  x\n\t??\n\t\t0001 0002  y\n", subsystem));
}

TEST(HardwareNames, saysWhyThereIsNoList) {
    HardwareNames names;
    names.want(HardwareNames::vendor(0x8086));
    names.read(Absence::NeedsRoot);
    EXPECT_EQ(names.nameOf(HardwareNames::vendor(0x8086)).reason(), Absence::NeedsRoot);
}

TEST(HardwareNames, readsTheListFromEitherPlace) {
    RecordedTree tree;
    EXPECT_EQ(readHardwareList(tree.paths(), "usb.ids").reason(), Absence::Absent);
    tree.file("usr/share/hwdata/usb.ids", "second");
    EXPECT_EQ(readHardwareList(tree.paths(), "usb.ids"), "second");
    tree.file("usr/share/misc/usb.ids", "first");
    EXPECT_EQ(readHardwareList(tree.paths(), "usb.ids"), "first");
}

TEST(HardwareNames, refusesAnEndlessList) {
    RecordedTree tree;
    tree.file("usr/share/misc/pci.ids", std::string((std::size_t{16} << 20) + 1, '#'));
    EXPECT_EQ(readHardwareList(tree.paths(), "pci.ids").reason(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
