#include "providers/devices/BatteryProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"

namespace cimomd {
namespace {

std::string published(const Battery& battery, const char* property) {
    return textOf(BatteryProvider::publish("node7", battery).instance, property);
}

TEST(BatteryProvider, tellsTheStatusFromTheKernelsWords) {
    struct Case {
        const char* status;
        const char* level;
        const char* expected;
    };
    for (const Case& words :
         {Case{"Full", "Full", "3"}, Case{"Full", "Normal", "3"},
          Case{"Discharging", "Normal", "11"}, Case{"Discharging", "High", "11"},
          Case{"Discharging", "Low", "4"}, Case{"Discharging", "Critical", "5"},
          Case{"Not charging", "Full", "3"}, Case{"Not charging", "Normal", "11"},
          Case{"Charging", "Normal", "6"}, Case{"Charging", "High", "7"},
          Case{"Charging", "Full", "7"}, Case{"Charging", "Low", "8"},
          Case{"Charging", "Critical", "9"}, Case{"Unknown", "Normal", "2"},
          Case{"anything", "Normal", "2"}}) {
        Battery battery;
        battery.status = words.status;
        battery.level = words.level;
        EXPECT_EQ(published(battery, "BatteryStatus"), words.expected)
            << words.status << ", " << words.level;
    }
    Battery silent;
    EXPECT_EQ(published(silent, "BatteryStatus"), "2");
    silent.status = "Charging";
    EXPECT_EQ(published(silent, "BatteryStatus"), "6");
}

TEST(BatteryProvider, tellsTheChemistryFromTheKernelsWords) {
    const std::vector<std::pair<const char*, const char*>> words{
        {"Li-ion", "6"}, {"Li-poly", "8"}, {"NiMH", "5"},   {"NiCd", "4"},
        {"LiFe", "1"},   {"LiMn", "1"},    {"Unknown", "2"}};
    for (const auto& [technology, expected] : words) {
        Battery battery;
        battery.technology = technology;
        EXPECT_EQ(published(battery, "Chemistry"), expected) << technology;
    }
    EXPECT_EQ(published(Battery(), "Chemistry"), "2");
}

TEST(BatteryProvider, keepsTheReasonOfWhatIsMissing) {
    Battery battery;
    battery.serialNumber = Absence::Filtered;
    battery.status = Absence::Unreadable;
    for (const MissingValue& value : BatteryProvider::publish("node7", battery).missing) {
        const std::string property = value.property;
        EXPECT_EQ(value.reason, property == "SerialNumber"    ? Absence::Filtered
                                : property == "BatteryStatus" ? Absence::Unreadable
                                                              : Absence::Absent)
            << property;
    }
}

TEST(BatteryProvider, hasNothingOnAMachineThatIsPluggedIn) {
    RecordedTree tree;
    tree.directory("sys/class/power_supply");
    const auto stream = BatteryProvider(tree.paths(), FixedSystemCalls()).enumerate();
    EXPECT_EQ(stream->absence(), std::nullopt);
    EXPECT_TRUE(all(BatteryProvider(tree.paths(), FixedSystemCalls()).enumerate()).empty());
}

}  // namespace
}  // namespace cimomd
