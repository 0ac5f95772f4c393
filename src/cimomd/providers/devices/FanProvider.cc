#include "providers/devices/FanProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Boolean;
using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

Fact<std::vector<Uint16>> statusOf(const HardwareSensor& fan) {
    if (fan.fault == true)
        return std::vector<Uint16>{kOperationalError};
    return fan.reading.then([&](std::int64_t speed) {
        // A fan at rest may be off on purpose, whatever its alarm says.
        if (speed == 0)
            return std::vector<Uint16>{kOperationalStopped};
        return std::vector<Uint16>{fan.alarm == true ? kOperationalDegraded : kOperationalOk};
    });
}

/// That a chip has no means to set the speed does not mean that nothing else has.
Fact<Boolean> variableSpeedOf(const HardwareSensor& fan) {
    return fan.hasSpeedControl ? Fact<Boolean>(true) : Fact<Boolean>(Absence::Absent);
}

}  // namespace

std::unique_ptr<InstanceStream> FanProvider::enumerate() const {
    const auto fans = readFans(paths.hardwareMonitors(), calls);
    if (!fans)
        return std::make_unique<EmptyStream>(fans.reason());
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<HardwareSensor>>(
        *fans, [hostName](const HardwareSensor& fan) { return publish(hostName, fan); });
}

ProvidedInstance FanProvider::publish(const std::string& hostName, const HardwareSensor& fan) {
    const std::string title = fan.chip + " " + fan.label.value_or(fan.channel);
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", statusOf(fan))
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .deviceKeys(hostName, fan.id)
        .value<Boolean>("ActiveCooling", true)
        .value<Boolean>("VariableSpeed", variableSpeedOf(fan))
        .value<Uint64>("DesiredSpeed", fan.targetRpm)
        .value<Uint32>("SpeedRPM", fan.reading.then(narrowedToCount<std::int64_t>));
    return builder.take();
}

}  // namespace cimomd
