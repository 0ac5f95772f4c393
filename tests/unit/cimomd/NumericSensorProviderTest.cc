#include "providers/devices/NumericSensorProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"

namespace cimomd {
namespace {

using Kind = HardwareSensor::Kind;

HardwareSensor sensorOf(Kind kind, Fact<std::int64_t> reading) {
    HardwareSensor sensor;
    sensor.kind = kind;
    sensor.id = "chip/x1";
    sensor.chip = "chip";
    sensor.channel = "x1";
    sensor.reading = reading;
    return sensor;
}

Pegasus::CIMInstance published(const HardwareSensor& sensor) {
    return NumericSensorProvider::publish("node7", sensor).instance;
}

TEST(NumericSensorProvider, keepsReadingsWithinThirtyTwoBits) {
    const auto reading = [](Kind kind, std::int64_t value) {
        return textOf(published(sensorOf(kind, value)), "CurrentReading");
    };
    EXPECT_EQ(reading(Kind::Voltage, 2147483647), "2147483647");
    EXPECT_EQ(reading(Kind::Voltage, 2147483648), "null");
    EXPECT_EQ(reading(Kind::Voltage, -2147483648), "-2147483648");
    EXPECT_EQ(reading(Kind::Voltage, -2147483649), "null");
    EXPECT_EQ(reading(Kind::Voltage, -12000), "-12000");
    // 3000 W in millionths do not fit, in thousandths they do.
    EXPECT_EQ(reading(Kind::Power, 3000000000), "3000000");
}

TEST(NumericSensorProvider, writesReadingsForPeople) {
    const auto reading = [](Kind kind, std::int64_t value) {
        return textOf(published(sensorOf(kind, value)), "ReadingText");
    };
    EXPECT_EQ(reading(Kind::Temperature, -5200), "-5.2 C");
    EXPECT_EQ(reading(Kind::Fan, 1200), "1200 RPM");
    EXPECT_EQ(reading(Kind::Voltage, 1052), "1.052 V");
    EXPECT_EQ(reading(Kind::Current, 512), "0.512 A");
    EXPECT_EQ(reading(Kind::Power, 45100000), "45.1 W");
    EXPECT_EQ(reading(Kind::Humidity, 41000), "41.0 %");
    EXPECT_EQ(textOf(published(sensorOf(Kind::Humidity, 41000)), "SensorType"), "9");
    EXPECT_EQ(textOf(published(sensorOf(Kind::Humidity, 41000)), "BaseUnits"), "65");
}

TEST(NumericSensorProvider, saysWhatASensorWithoutAReadingIs) {
    const auto provided =
        NumericSensorProvider::publish("node7", sensorOf(Kind::Fan, Absence::Unreadable));
    EXPECT_EQ(textOf(provided.instance, "CurrentReading"), "null");
    EXPECT_EQ(textOf(provided.instance, "ReadingText"), "null");
    EXPECT_EQ(textOf(provided.instance, "OperationalStatus"), "null");
    EXPECT_EQ(textOf(provided.instance, "SensorType"), "5");
    for (const MissingValue& value : provided.missing) {
        const bool isOfTheReading =
            std::string_view(value.property).find("Threshold") == std::string_view::npos;
        EXPECT_EQ(value.reason, isOfTheReading ? Absence::Unreadable : Absence::Absent)
            << value.property;
    }
    auto broken = sensorOf(Kind::Fan, Absence::Unreadable);
    broken.fault = true;
    EXPECT_EQ(textOf(published(broken), "OperationalStatus"), "6 ");
}

}  // namespace
}  // namespace cimomd
