#include "providers/devices/FanProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"

namespace cimomd {
namespace {

std::string statusAt(Fact<std::int64_t> speed, Fact<bool> fault, Fact<bool> alarm) {
    HardwareSensor fan;
    fan.kind = HardwareSensor::Kind::Fan;
    fan.reading = speed;
    fan.fault = fault;
    fan.alarm = alarm;
    return textOf(FanProvider::publish("node7", fan).instance, "OperationalStatus");
}

TEST(FanProvider, tellsTheStatus) {
    const Fact<bool> unknown;
    EXPECT_EQ(statusAt(900, unknown, unknown), "2 ");
    EXPECT_EQ(statusAt(900, false, false), "2 ");
    EXPECT_EQ(statusAt(200, false, true), "3 ");
    EXPECT_EQ(statusAt(0, unknown, true), "10 ");
    EXPECT_EQ(statusAt(0, true, true), "6 ");
    EXPECT_EQ(statusAt(Absence::Unreadable, true, unknown), "6 ");
    EXPECT_EQ(statusAt(Absence::Unreadable, unknown, unknown), "null");
}

TEST(FanProvider, hasNoSpeedFromAReadingThatIsNone) {
    HardwareSensor fan;
    fan.reading = -1;
    EXPECT_EQ(textOf(FanProvider::publish("node7", fan).instance, "SpeedRPM"), "null");
    fan.reading = std::int64_t{1} << 31;
    EXPECT_EQ(textOf(FanProvider::publish("node7", fan).instance, "SpeedRPM"), "null");
    fan.reading = 2147483647;
    EXPECT_EQ(textOf(FanProvider::publish("node7", fan).instance, "SpeedRPM"), "2147483647");
}

}  // namespace
}  // namespace cimomd
