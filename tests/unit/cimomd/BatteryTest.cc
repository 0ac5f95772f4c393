#include "system/devices/Battery.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "WatchedSystemCalls.h"

namespace cimomd {
namespace {

class BatteryTest : public testing::Test {
  public:
    BatteryTest() { tree.file("power/BAT0/type", "Battery\n"); }

    BatteryTest& says(const std::string& name, const std::string& text) {
        tree.file("power/BAT0/" + name, text + "\n");
        return *this;
    }
    Battery read() { return readBatteries(tree.root / "power", calls)->at(0); }

    RecordedTree tree;
    WatchedSystemCalls calls;
};

TEST_F(BatteryTest, takesEnergyAsItIs) {
    says("energy_full_design", "57020999").says("energy_full", "51350000");
    says("charge_full", "1").says("voltage_now", "1");
    const Battery battery = read();
    EXPECT_EQ(battery.designMilliwattHours, 57020U);
    EXPECT_EQ(battery.fullMilliwattHours, 51350U);
}

TEST_F(BatteryTest, reckonsEnergyFromChargeAndDesignedVoltage) {
    // 5.2 Ah at 11.4 V are 59.28 Wh.
    says("charge_full_design", "5200000").says("charge_full", "5000000");
    says("voltage_min_design", "11400000").says("voltage_now", "12600000");
    const Battery battery = read();
    EXPECT_EQ(battery.designMilliwattHours, 59280U);
    EXPECT_EQ(battery.fullMilliwattHours, 57000U);
    EXPECT_EQ(battery.designMillivolts, 11400U);
}

TEST_F(BatteryTest, takesThePresentVoltageWhereNoneIsDesigned) {
    says("charge_full", "5000000").says("voltage_now", "12000000");
    EXPECT_EQ(read().fullMilliwattHours, 60000U);
    EXPECT_FALSE(read().designMillivolts);
}

TEST_F(BatteryTest, hasNoEnergyFromAChargeWithoutVoltage) {
    says("charge_full", "5000000");
    EXPECT_FALSE(read().fullMilliwattHours);
}

TEST_F(BatteryTest, filtersAmountsThatCannotBeTrue) {
    says("energy_full_design", "0").says("energy_full", "18446744073709551615");
    says("capacity", "101").says("cycle_count", "0").says("voltage_min_design", "0");
    const Battery battery = read();
    EXPECT_FALSE(battery.designMilliwattHours || battery.fullMilliwattHours);
    EXPECT_FALSE(battery.remainingPercent || battery.chargeCycles || battery.designMillivolts);
    EXPECT_EQ(battery.designMilliwattHours.reason(), Absence::Filtered);
}

TEST_F(BatteryTest, takesNoNumberThatASignedOneCannotHold) {
    says("energy_full", "2147483648000").says("energy_full_design", "2147483647999");
    says("cycle_count", "2147483648");
    const Battery battery = read();
    EXPECT_EQ(battery.designMilliwattHours, 2147483647U);
    EXPECT_EQ(battery.fullMilliwattHours.reason(), Absence::Filtered);
    EXPECT_FALSE(battery.fullMilliwattHours || battery.chargeCycles);
}

TEST_F(BatteryTest, doesNotOverflow) {
    says("charge_full_design", "18446744073709551615").says("charge_full", "4294967295");
    says("voltage_min_design", "4294967295");
    const Battery battery = read();
    EXPECT_FALSE(battery.designMilliwattHours);
    // (2^32 - 1)^2 / 10^9 is above 2^32.
    EXPECT_FALSE(battery.fullMilliwattHours);
}

TEST_F(BatteryTest, readsWhatTheKernelSays) {
    says("capacity", "0").says("status", "Not charging").says("technology", "Li-ion");
    says("serial_number", " 00000").says("model_name", "DELL 7CWN6").says("manufacturer", "BYD");
    const Battery battery = read();
    EXPECT_EQ(battery.remainingPercent, std::uint16_t{0});
    EXPECT_EQ(battery.status, "Not charging");
    EXPECT_EQ(battery.technology, "Li-ion");
    EXPECT_EQ(battery.model, "DELL 7CWN6");
    EXPECT_FALSE(battery.serialNumber);
}

// The controller of a battery may hang.
TEST_F(BatteryTest, isListedWhenItDoesNotAnswer) {
    says("present", "1").says("cycle_count", "7");
    calls.silent = tree.root / "power/BAT0/present";
    const Battery battery = read();
    EXPECT_EQ(battery.name, "BAT0");
    EXPECT_EQ(battery.chargeCycles, 7U);
    EXPECT_TRUE(calls.wasAskedFor("BAT0/cycle_count"));
    EXPECT_EQ(calls.sources, std::set{TextSource::Batteries});
    calls.silent = tree.root / "power/BAT0/cycle_count";
    EXPECT_FALSE(read().chargeCycles);
    EXPECT_EQ(read().chargeCycles.reason(), Absence::TimedOut);
}

TEST_F(BatteryTest, leavesOutWhatDoesNotFeedTheComputer) {
    tree.file("power/AC/type", "Mains\n")
        .file("power/mouse/type", "Battery\n")
        .file("power/mouse/scope", "Device\n")
        .file("power/BAT1/type", "Battery\n")
        .file("power/BAT1/present", "0\n")
        .file("power/BAT10/type", "Battery\n")
        .file("power/BAT10/scope", "System\n")
        .file("power/BAT2/type", "Battery\n")
        .file("power/BAT2/present", "1\n")
        .directory("power/silent");
    const auto batteries = readBatteries(tree.root / "power", calls);
    ASSERT_EQ(batteries->size(), 3U);
    EXPECT_EQ((*batteries)[0].name, "BAT0");
    EXPECT_EQ((*batteries)[1].name, "BAT2");
    EXPECT_EQ((*batteries)[2].name, "BAT10");
}

TEST_F(BatteryTest, saysThatTheKernelKnowsNoPower) {
    EXPECT_EQ(readBatteries(tree.root / "none", calls).reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
