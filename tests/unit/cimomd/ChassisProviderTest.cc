#include "providers/computer/ChassisProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kChassis = 3;

std::vector<Chassis> chassisIn(const std::vector<SmbiosFields>& structures) {
    return chassisOf({{3, 2}, parseSmbiosStructures(smbiosTableOf(structures))});
}

std::string ofType(std::uint8_t type, const char* property) {
    Chassis chassis;
    chassis.type = type;
    return textOf(ChassisProvider::publish(chassis).instance, property);
}

TEST(Chassis, hasItsLockInTheTypesHighestBit) {
    const auto locked = chassisIn({SmbiosFields(kChassis, 9).byte(5, 0x80 | 7)}).at(0);
    EXPECT_EQ(locked.type, 7);
    EXPECT_EQ(locked.lockPresent, true);
    const auto open = chassisIn({SmbiosFields(kChassis, 9).byte(5, 7)}).at(0);
    EXPECT_EQ(open.type, 7);
    EXPECT_EQ(open.lockPresent, false);
}

// The number of the text stands behind the contained elements: here two of three bytes.
TEST(Chassis, hasItsSkuBehindItsElements) {
    const auto chassis =
        chassisIn({SmbiosFields(kChassis, 0x1C).byte(0x13, 2).byte(0x14, 3).text(0x1B, "SKU-7")});
    EXPECT_EQ(chassis.at(0).sku, "SKU-7");
    const auto beyond =
        chassisIn({SmbiosFields(kChassis, 0x16).byte(0x13, 255).byte(0x14, 255).text(0x15, "x")});
    EXPECT_EQ(beyond.at(0).sku, std::nullopt);
    EXPECT_EQ(beyond.at(0).sku.reason(), Absence::Absent);
}

TEST(Chassis, ofOldTablesHasLess) {
    const auto chassis =
        chassisIn({SmbiosFields(kChassis, 9).text(4, "Maker").text(7, "S-1")}).at(0);
    EXPECT_EQ(chassis.manufacturer, "Maker");
    EXPECT_EQ(chassis.serialNumber, "S-1");
    EXPECT_EQ(chassis.heightUnits, std::nullopt);
    EXPECT_EQ(chassis.powerCords, std::nullopt);
    EXPECT_EQ(chassis.sku, std::nullopt);
    const auto tiny = chassisIn({SmbiosFields(kChassis, 4)}).at(0);
    EXPECT_EQ(tiny.type, std::nullopt);
    EXPECT_EQ(tiny.lockPresent, std::nullopt);
}

TEST(Chassis, mayBeSeveral) {
    RecordedTree tree;
    recordSmbios(tree,
                 {SmbiosFields(kChassis, 9).byte(5, 29), SmbiosFields(kChassis, 9).byte(5, 28)});
    const ChassisProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "Tag"), "Chassis 0");
    EXPECT_EQ(textOf(instances[0], "ChassisTypeDescription"), "Blade Enclosure");
    EXPECT_EQ(textOf(instances[1], "Tag"), "Chassis 1");
    EXPECT_EQ(textOf(instances[1], "ChassisTypeDescription"), "Blade");
}

TEST(Chassis, isTakenFromTheKernelWithoutTables) {
    RecordedTree tree;
    tree.file("sys/class/dmi/id/chassis_type", "11\n")
        .file("sys/class/dmi/id/chassis_vendor", "Maker\n")
        .file("sys/class/dmi/id/chassis_asset_tag", "No Asset Tag\n");
    const auto found = readChassis(tree.paths());
    ASSERT_TRUE(found.has_value());
    ASSERT_EQ(found->size(), 1U);
    EXPECT_EQ(found->at(0).type, 11);
    EXPECT_EQ(found->at(0).manufacturer, "Maker");
    EXPECT_EQ(found->at(0).lockPresent.reason(), Absence::Absent);
    EXPECT_EQ(found->at(0).assetTag.reason(), Absence::Filtered);
    tree.file("sys/class/dmi/id/chassis_type", "300\n");
    EXPECT_EQ(readChassis(tree.paths())->at(0).type.reason(), Absence::Filtered);
}

TEST(ChassisProvider, knowsTheTypes) {
    struct Case {
        std::uint8_t type;
        const char* package;
        const char* types;
        const char* description;
    };
    for (const Case& expected : std::vector<Case>{{0, "null", "null", "null"},
                                                  {1, "1", "1 ", "Other"},
                                                  {2, "0", "2 ", "null"},
                                                  {3, "3", "3 ", "Desktop"},
                                                  {9, "9", "9 ", "Laptop"},
                                                  {23, "23", "23 ", "Rack Mount Chassis"},
                                                  {25, "25", "25 ", "Multi-system Chassis"},
                                                  {26, "26", "1 ", "Compact PCI"},
                                                  {32, "32", "1 ", "Detachable"},
                                                  {33, "1", "1 ", "IoT Gateway"},
                                                  {36, "1", "1 ", "Stick PC"},
                                                  {37, "1", "1 ", "null"},
                                                  {127, "1", "1 ", "null"}}) {
        EXPECT_EQ(ofType(expected.type, "ChassisPackageType"), expected.package)
            << int{expected.type};
        EXPECT_EQ(ofType(expected.type, "ChassisTypes"), expected.types) << int{expected.type};
        EXPECT_EQ(ofType(expected.type, "ChassisTypeDescription"), expected.description)
            << int{expected.type};
    }
}

}  // namespace
}  // namespace cimomd
