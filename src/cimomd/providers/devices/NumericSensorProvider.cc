#include "providers/devices/NumericSensorProvider.h"

#include <fmt/format.h>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Kind = HardwareSensor::Kind;
using Pegasus::Sint32;
using Pegasus::Uint16;

/// How the readings of one kind of sensor appear in CIM.
struct Measure {
    /// CIM_Sensor.SensorType
    Uint16 sensorType;
    /// CIM_NumericSensor.BaseUnits
    Uint16 baseUnits;
    /// The power of ten of the unit.
    Sint32 unitModifier;
    /// What the kernel's number is divided by.
    std::int64_t divisor;
    /// A reading for people: of this number of the unit, with this many digits after the point.
    double perUnit;
    int digits;
    const char* unit;
};

Measure measureOf(Kind kind) {
    switch (kind) {
        case Kind::Temperature:
            return {2, 2, -3, 1, 1000, 1, "C"};
        case Kind::Fan:
            return {5, 19, 0, 1, 1, 0, "RPM"};
        case Kind::Voltage:
            return {3, 5, -3, 1, 1000, 3, "V"};
        case Kind::Current:
            return {4, 6, -3, 1, 1000, 3, "A"};
        case Kind::Power:
            // Millionths of a watt would fill 32 bits at 2147 W.
            return {13, 7, -3, 1000, 1000, 1, "W"};
        case Kind::Humidity:
            return {9, 65, -3, 1, 1000, 1, "%"};
    }
    return {};
}

Fact<Sint32> scaled(const Fact<std::int64_t>& value, const Measure& measure) {
    return value.then(
        [&](std::int64_t number) { return narrowedTo<Sint32>(number / measure.divisor); });
}

Fact<std::string> readingText(const Fact<Sint32>& reading, const Measure& measure) {
    return reading.then([&](Sint32 number) {
        return fmt::format("{:.{}f} {}", number / measure.perUnit, measure.digits, measure.unit);
    });
}

Fact<std::vector<Uint16>> statusOf(const HardwareSensor& sensor) {
    if (sensor.fault == true)
        return std::vector<Uint16>{kOperationalError};
    return sensor.reading.then([](std::int64_t) { return std::vector<Uint16>{kOperationalOk}; });
}

}  // namespace

std::unique_ptr<InstanceStream> NumericSensorProvider::enumerate() const {
    auto sensors = readHardwareSensors(paths.hardwareMonitors(), calls);
    if (!sensors)
        return std::make_unique<EmptyStream>(sensors.reason());
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<HardwareSensor>>(
        *sensors, [hostName](const HardwareSensor& sensor) { return publish(hostName, sensor); });
}

ProvidedInstance NumericSensorProvider::publish(const std::string& hostName,
                                                const HardwareSensor& sensor) {
    const Measure measure = measureOf(sensor.kind);
    const Fact<Sint32> reading = scaled(sensor.reading, measure);
    const std::string title = sensor.chip + " " + sensor.label.value_or(sensor.channel);
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", statusOf(sensor))
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .deviceKeys(hostName, sensor.id)
        .value<Uint16>("SensorType", measure.sensorType)
        .value<Uint16>("BaseUnits", measure.baseUnits)
        .value<Sint32>("UnitModifier", measure.unitModifier)
        .value<Sint32>("CurrentReading", reading)
        .value<Sint32>("LowerThresholdNonCritical", scaled(sensor.min, measure))
        .value<Sint32>("UpperThresholdNonCritical", scaled(sensor.max, measure))
        .value<Sint32>("LowerThresholdCritical", scaled(sensor.lowerCritical, measure))
        .value<Sint32>("UpperThresholdCritical", scaled(sensor.upperCritical, measure))
        .value<Sint32>("UpperThresholdFatal", scaled(sensor.emergency, measure))
        .text("ReadingText", readingText(reading, measure));
    return builder.take();
}

}  // namespace cimomd
