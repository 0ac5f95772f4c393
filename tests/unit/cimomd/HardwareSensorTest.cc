#include "system/devices/HardwareSensor.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "WatchedSystemCalls.h"

namespace cimomd {
namespace {

using Kind = HardwareSensor::Kind;

TEST(HardwareSensor, knowsTheFilesThatHoldReadings) {
    const auto kindOf = [](const char* name) {
        const auto channel = parseSensorFile(name);
        return channel ? std::optional(channel->kind) : std::nullopt;
    };
    EXPECT_EQ(kindOf("temp1_input"), Kind::Temperature);
    EXPECT_EQ(kindOf("fan12_input"), Kind::Fan);
    EXPECT_EQ(kindOf("in0_input"), Kind::Voltage);
    EXPECT_EQ(kindOf("curr1_input"), Kind::Current);
    EXPECT_EQ(kindOf("power1_input"), Kind::Power);
    EXPECT_EQ(kindOf("humidity1_input"), Kind::Humidity);
    for (const char* name : {"", "_input", "temp_input", "temp1", "temp1_max", "tempx_input",
                             "1_input", "energy1_input", "intrusion0_input", "temp-1_input"})
        EXPECT_EQ(kindOf(name), std::nullopt) << name;
}

std::vector<std::string> idsIn(const RecordedTree& tree) {
    std::vector<std::string> ids;
    const auto sensors = readHardwareSensors(tree.root / "hwmon", FixedSystemCalls());
    for (const HardwareSensor& sensor : *sensors)
        ids.push_back(sensor.id);
    return ids;
}

void chip(RecordedTree& tree, const std::string& number, const std::string& name,
          const std::string& device) {
    tree.file("hwmon/" + number + "/name", name + "\n");
    tree.file("hwmon/" + number + "/temp1_input", "1000\n");
    if (!device.empty())
        std::filesystem::create_symlink("../../" + device, tree.root / "hwmon" / number / "device");
}

TEST(HardwareSensor, keepsItsIdWhenTheKernelNumbersChipsAnew) {
    RecordedTree before;
    chip(before, "hwmon0", "coretemp", "coretemp.0");
    chip(before, "hwmon1", "nvme", "nvme0");
    RecordedTree after;
    chip(after, "hwmon0", "nvme", "nvme0");
    chip(after, "hwmon7", "coretemp", "coretemp.0");
    EXPECT_EQ(idsIn(before),
              (std::vector<std::string>{"coretemp@coretemp.0/temp1", "nvme@nvme0/temp1"}));
    EXPECT_EQ(idsIn(after), idsIn(before));
}

TEST(HardwareSensor, tellsChipsOfOneNameApart) {
    RecordedTree tree;
    chip(tree, "hwmon10", "jc42", "");
    chip(tree, "hwmon9", "jc42", "");
    chip(tree, "hwmon2", "coretemp", "coretemp.10");
    chip(tree, "hwmon3", "coretemp", "coretemp.2");
    EXPECT_EQ(idsIn(tree),
              (std::vector<std::string>{"coretemp@coretemp.2/temp1", "coretemp@coretemp.10/temp1",
                                        "jc42/temp1", "jc42#2/temp1"}));
}

TEST(HardwareSensor, ordersTheChannelsOfAChip) {
    RecordedTree tree;
    tree.file("hwmon/hwmon0/name", "x\n");
    for (const char* channel : {"in10", "in2", "fan1", "temp2", "temp11", "power1", "curr1"})
        tree.file(std::string("hwmon/hwmon0/") + channel + "_input", "1\n");
    EXPECT_EQ(idsIn(tree), (std::vector<std::string>{"x/temp2", "x/temp11", "x/fan1", "x/in2",
                                                     "x/in10", "x/curr1", "x/power1"}));
}

TEST(HardwareSensor, namesAChipWithoutANameByItsNumber) {
    RecordedTree tree;
    tree.file("hwmon/hwmon3/temp1_input", "1000\n");
    EXPECT_EQ(idsIn(tree), std::vector<std::string>{"hwmon3/temp1"});
}

Fact<std::int64_t> readingOf(const char* file, std::string_view text) {
    RecordedTree tree;
    tree.file(std::string("hwmon/hwmon0/") + file, text);
    return readHardwareSensors(tree.root / "hwmon", FixedSystemCalls())->at(0).reading;
}

TEST(HardwareSensor, filtersTemperaturesThatCannotBe) {
    EXPECT_EQ(readingOf("temp1_input", "-40000\n"), std::int64_t{-40000});
    EXPECT_EQ(readingOf("temp1_input", "0\n"), std::int64_t{0});
    EXPECT_FALSE(readingOf("temp1_input", "-273150\n"));
    EXPECT_FALSE(readingOf("temp1_input", "65261850\n"));
    EXPECT_EQ(readingOf("temp1_input", "65261850\n").reason(), Absence::Filtered);
    EXPECT_EQ(readingOf("in1_input", "-300000\n"), std::int64_t{-300000});
}

TEST(HardwareSensor, hasNoReadingFromGarbage) {
    for (const char* text : {"", "\n", "N/A\n", "1.5\n", "99999999999999999999\n", "\xFF\xFE"})
        EXPECT_FALSE(readingOf("fan1_input", text)) << text;
}

TEST(HardwareSensor, readsLimitsAndMarks) {
    RecordedTree tree;
    tree.file("hwmon/hwmon0/fan1_input", "900\n")
        .file("hwmon/hwmon0/fan1_min", "300\n")
        .file("hwmon/hwmon0/fan1_max", "2000\n")
        .file("hwmon/hwmon0/fan1_target", "950\n")
        .file("hwmon/hwmon0/fan1_fault", "1\n")
        .file("hwmon/hwmon0/fan1_alarm", "0\n")
        .file("hwmon/hwmon0/fan1_label", "CPU fan\n")
        .file("hwmon/hwmon0/pwm1", "128\n")
        .file("hwmon/hwmon0/fan2_input", "0\n")
        .file("hwmon/hwmon0/fan2_fault", "2\n")
        .file("hwmon/hwmon0/temp2_input", "0\n")
        .file("hwmon/hwmon0/temp2_lcrit", "-10000\n")
        .file("hwmon/hwmon0/temp2_crit", "90000\n")
        .file("hwmon/hwmon0/temp2_emergency", "100000\n")
        .file("hwmon/hwmon0/pwm2", "128\n");
    const auto sensors = readHardwareSensors(tree.root / "hwmon", FixedSystemCalls());
    ASSERT_EQ(sensors->size(), 3U);
    const HardwareSensor& temperature = (*sensors)[0];
    EXPECT_EQ(temperature.lowerCritical, std::int64_t{-10000});
    EXPECT_EQ(temperature.upperCritical, std::int64_t{90000});
    EXPECT_EQ(temperature.emergency, std::int64_t{100000});
    EXPECT_FALSE(temperature.hasSpeedControl);
    EXPECT_FALSE(temperature.min || temperature.max || temperature.fault || temperature.label);
    const HardwareSensor& fan = (*sensors)[1];
    EXPECT_EQ(fan.label, "CPU fan");
    EXPECT_EQ(fan.min, std::int64_t{300});
    EXPECT_EQ(fan.max, std::int64_t{2000});
    EXPECT_EQ(fan.targetRpm, std::uint64_t{950});
    EXPECT_EQ(fan.fault, true);
    EXPECT_EQ(fan.alarm, false);
    EXPECT_TRUE(fan.hasSpeedControl);
    EXPECT_TRUE((*sensors)[2].hasSpeedControl);
    EXPECT_FALSE((*sensors)[2].fault);
}

// Sensors are slow, and a chip that hangs held the whole answer up.
TEST(HardwareSensor, asksInTimeForWhatIsThereOnly) {
    RecordedTree tree;
    tree.file("hwmon/hwmon0/name", "x\n")
        .file("hwmon/hwmon0/fan1_input", "900\n")
        .file("hwmon/hwmon0/fan1_alarm", "1\n")
        .file("hwmon/hwmon0/temp1_input", "1000\n");
    WatchedSystemCalls calls;
    calls.silent = tree.root / "hwmon/hwmon0/temp1_input";
    const auto sensors = readHardwareSensors(tree.root / "hwmon", calls);
    ASSERT_EQ(sensors->size(), 2U);
    EXPECT_FALSE((*sensors)[0].reading);
    EXPECT_EQ((*sensors)[0].reading.reason(), Absence::TimedOut);
    EXPECT_EQ((*sensors)[1].reading, std::int64_t{900});
    EXPECT_EQ((*sensors)[1].min.reason(), Absence::Absent);
    EXPECT_EQ(calls.asked.size(), 3U);
    EXPECT_EQ(calls.sources, std::set{TextSource::Sensors});
}

TEST(HardwareSensor, asksFansAloneForFans) {
    RecordedTree tree;
    tree.file("hwmon/hwmon0/name", "x\n")
        .file("hwmon/hwmon0/fan1_input", "900\n")
        .file("hwmon/hwmon0/temp1_input", "1000\n");
    WatchedSystemCalls calls;
    const auto fans = readFans(tree.root / "hwmon", calls);
    ASSERT_EQ(fans->size(), 1U);
    EXPECT_EQ((*fans)[0].id, "x/fan1");
    EXPECT_EQ((*fans)[0].reading, std::int64_t{900});
    EXPECT_TRUE(calls.wasAskedFor("fan1_input"));
    EXPECT_FALSE(calls.wasAskedFor("temp1_input"));
}

TEST(HardwareSensor, saysThatThereIsNoneToAsk) {
    RecordedTree tree;
    EXPECT_EQ(readHardwareSensors(tree.root / "hwmon", FixedSystemCalls()).reason(),
              Absence::Absent);
}

}  // namespace
}  // namespace cimomd
