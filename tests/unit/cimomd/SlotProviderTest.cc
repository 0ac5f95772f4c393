#include "providers/computer/SlotProvider.h"

#include <gtest/gtest.h>

#include <map>

#include "InstanceText.h"
#include "SmbiosBytes.h"
#include "providers/computer/SlotKind.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kSlot = 9;

Slot slotIn(const SmbiosFields& structure) {
    return slotsOf({{2, 6}, parseSmbiosStructures(smbiosTableOf({structure}))}).at(0);
}

TEST(SlotKind, hasALayout) {
    const std::map<std::uint8_t, int> expected{
        {0x00, 0},  {0x01, 1},  {0x02, 0},  {0x03, 7},  {0x06, 16}, {0x0E, 16}, {0x12, 17},
        {0x0F, 7},  {0xA4, 7},  {0xA5, 18}, {0xA6, 19}, {0xA7, 20}, {0xA8, 21}, {0xA9, 22},
        {0xAA, 23}, {0xAB, 18}, {0xB0, 23}, {0xB1, 18}, {0xB5, 22}, {0xB6, 23}, {0xB7, 7},
        {0xB8, 18}, {0xBD, 23}, {0xBE, 18}, {0xC3, 23}, {0xC4, 18}, {0xC5, 7},  {0xFF, 7}};
    for (const auto& [type, layout] : expected)
        EXPECT_EQ(connectorLayoutOf(type), layout) << int{type};
}

TEST(SlotKind, hasAName) {
    const std::map<std::uint8_t, const char*> expected{{0x03, "ISA"},
                                                       {0x06, "PCI"},
                                                       {0x13, "AGP 8x"},
                                                       {0x17, "M.2 socket 3"},
                                                       {0x1E, "MXM 3.0 type B"},
                                                       {0x24, "U.2 PCI Express 4"},
                                                       {0x28, "OCP NIC"},
                                                       {0xA5, "PCI Express 1"},
                                                       {0xAA, "PCI Express 1 x16"},
                                                       {0xAC, "PCI Express 2 x1"},
                                                       {0xB4, "PCI Express 3 x4"},
                                                       {0xB9, "PCI Express 4 x1"},
                                                       {0xC3, "PCI Express 5 x16"},
                                                       {0xC4, "PCI Express 6"}};
    for (const auto& [type, name] : expected)
        EXPECT_EQ(slotTypeName(type), name) << int{type};
    for (const std::uint8_t nameless : {0x00, 0x01, 0x02, 0x29, 0xA4, 0xB7, 0xC5, 0xFF})
        EXPECT_EQ(slotTypeName(nameless), std::nullopt) << int{nameless};
}

TEST(SlotKind, hasBitsOrLanes) {
    const std::map<std::uint8_t, int> bits{{3, 8}, {4, 16}, {5, 32}, {6, 64}, {7, 128}};
    const std::map<std::uint8_t, int> lanes{{8, 1},   {9, 2},   {10, 4}, {11, 8},
                                            {12, 12}, {13, 16}, {14, 32}};
    for (unsigned width = 0; width < 256; ++width) {
        const auto number = static_cast<std::uint8_t>(width);
        EXPECT_EQ(dataBitsOf(number).has_value(), bits.count(number) == 1) << width;
        EXPECT_EQ(lanesOf(number).has_value(), lanes.count(number) == 1) << width;
    }
    for (const auto& [width, expected] : bits)
        EXPECT_EQ(dataBitsOf(width), expected);
    for (const auto& [width, expected] : lanes)
        EXPECT_EQ(lanesOf(width), expected);
}

TEST(Slot, hasItsFields) {
    const Slot slot = slotIn(SmbiosFields(kSlot, 0x11)
                                 .text(4, "J6B2")
                                 .byte(5, 0xAA)
                                 .byte(6, 0x0D)
                                 .byte(7, 4)
                                 .word(9, 5)
                                 .byte(0x0C, 0x02)
                                 .word(0x0D, 1)
                                 .byte(0x0F, 0xA0)
                                 .byte(0x10, 0x0B));
    EXPECT_EQ(slot.designation, "J6B2");
    EXPECT_EQ(slot.number, 5);
    EXPECT_EQ(slot.inUse, true);
    EXPECT_EQ(slot.supportsHotPlug, true);
    EXPECT_EQ(slot.pciAddress, "0001:a0:01.3");
}

TEST(Slot, hasNoAddressWhenItsBitsAreAllSet) {
    const auto address = [](std::uint16_t segment, std::uint8_t bus, std::uint8_t function) {
        return slotIn(SmbiosFields(kSlot, 0x11)
                          .word(0x0D, segment)
                          .byte(0x0F, bus)
                          .byte(0x10, function))
            .pciAddress;
    };
    EXPECT_EQ(address(0xFFFF, 0xFF, 0xFF), std::nullopt);
    EXPECT_EQ(address(0, 0xFF, 0xFF), std::nullopt);
    EXPECT_EQ(address(0, 0xFF, 0), "0000:ff:00.0");
}

// Version 2.0 ends with the first characteristics, 2.1 with the second.
TEST(Slot, ofOldTablesHasLess) {
    const Slot oldest = slotIn(SmbiosFields(kSlot, 0x0C).byte(7, 3));
    EXPECT_EQ(oldest.inUse, false);
    EXPECT_EQ(oldest.supportsHotPlug, std::nullopt);
    EXPECT_EQ(slotIn(SmbiosFields(kSlot, 0x0D)).supportsHotPlug, false);
    EXPECT_EQ(slotIn(SmbiosFields(kSlot, 0x0D)).pciAddress.reason(), Absence::Absent);
    EXPECT_EQ(slotIn(SmbiosFields(kSlot, 4)).number, std::nullopt);
}

TEST(Slot, doesNotKnowWhetherItIsUsed) {
    for (const std::uint8_t usage : {0, 1, 2, 5, 200})
        EXPECT_EQ(slotIn(SmbiosFields(kSlot, 0x0D).byte(7, usage)).inUse, std::nullopt);
}

TEST(SlotProvider, givesBitsOfParallelBuses) {
    Slot slot;
    slot.type = std::uint8_t{6};
    slot.dataBusWidth = std::uint8_t{5};
    const auto instance = SlotProvider::publish(slot).instance;
    EXPECT_EQ(textOf(instance, "MaxDataWidth"), "32");
    EXPECT_EQ(textOf(instance, "MaxLinkWidth"), "null");
    EXPECT_EQ(textOf(instance, "SlotType"), "PCI");
    EXPECT_EQ(textOf(instance, "ElementName"), "Slot 0");
}

}  // namespace
}  // namespace cimomd
