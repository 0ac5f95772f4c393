#include "providers/devices/BatteryProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/devices/HardwareTitle.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

// CIM_Battery.BatteryStatus
constexpr Uint16 kStatusUnknown = 2;
constexpr Uint16 kFullyCharged = 3;
constexpr Uint16 kLow = 4;
constexpr Uint16 kCritical = 5;
constexpr Uint16 kCharging = 6;
constexpr Uint16 kChargingAndHigh = 7;
constexpr Uint16 kChargingAndLow = 8;
constexpr Uint16 kChargingAndCritical = 9;
constexpr Uint16 kPartiallyCharged = 11;

// CIM_Battery.Chemistry
constexpr Uint16 kChemistryOther = 1;
constexpr Uint16 kChemistryUnknown = 2;
constexpr Uint16 kNickelCadmium = 4;
constexpr Uint16 kNickelMetalHydride = 5;
constexpr Uint16 kLithiumIon = 6;
constexpr Uint16 kLithiumPolymer = 8;

Uint16 chargingStatus(const std::optional<std::string>& level) {
    if (level == "High" || level == "Full")
        return kChargingAndHigh;
    if (level == "Low")
        return kChargingAndLow;
    return level == "Critical" ? kChargingAndCritical : kCharging;
}

Uint16 idleStatus(const std::optional<std::string>& level) {
    if (level == "Full")
        return kFullyCharged;
    if (level == "Low")
        return kLow;
    return level == "Critical" ? kCritical : kPartiallyCharged;
}

Fact<Uint16> batteryStatusOf(const Battery& battery) {
    return battery.status.then([&](const std::string& status) -> std::optional<Uint16> {
        if (status == "Full")
            return kFullyCharged;
        if (status == "Charging")
            return chargingStatus(battery.level);
        if (status == "Discharging" || status == "Not charging")
            return idleStatus(battery.level);
        return kStatusUnknown;
    });
}

Fact<Uint16> chemistryOf(const Battery& battery) {
    return battery.technology.then([](const std::string& technology) {
        if (technology == "Li-ion")
            return kLithiumIon;
        if (technology == "Li-poly")
            return kLithiumPolymer;
        if (technology == "NiMH")
            return kNickelMetalHydride;
        if (technology == "NiCd")
            return kNickelCadmium;
        return technology == "Unknown" ? kChemistryUnknown : kChemistryOther;
    });
}

}  // namespace

std::unique_ptr<InstanceStream> BatteryProvider::enumerate() const {
    auto batteries = readBatteries(paths.powerSupplies(), calls);
    if (!batteries)
        return std::make_unique<EmptyStream>(batteries.reason());
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<Battery>>(
        *batteries, [hostName](const Battery& battery) { return publish(hostName, battery); });
}

ProvidedInstance BatteryProvider::publish(const std::string& hostName, const Battery& battery) {
    InstanceBuilder builder(kClassName);
    builder.label(titleOf(battery.manufacturer, battery.model, battery.name))
        .text("Name", battery.name)
        .values<Uint16>("OperationalStatus", Absence::Absent)
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .deviceKeys(hostName, battery.name)
        .enumerated("BatteryStatus", batteryStatusOf(battery), kStatusUnknown)
        .enumerated("Chemistry", chemistryOf(battery), kChemistryUnknown)
        .value<Uint32>("DesignCapacity", battery.designMilliwattHours)
        .value<Uint32>("FullChargeCapacity", battery.fullMilliwattHours)
        .value<Uint64>("DesignVoltage", battery.designMillivolts)
        .value<Uint16>("EstimatedChargeRemaining", battery.remainingPercent)
        .text("Manufacturer", battery.manufacturer)
        .text("Model", battery.model)
        .text("SerialNumber", battery.serialNumber)
        .value<Uint32>("CycleCount", battery.chargeCycles);
    return builder.take();
}

}  // namespace cimomd
