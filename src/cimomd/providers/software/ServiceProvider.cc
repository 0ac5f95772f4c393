#include "providers/software/ServiceProvider.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;

constexpr std::size_t kStateLength = 64;

/// What systemd's active states mean; one that is not loaded does nothing.
struct Activity {
    std::string_view state;
    bool isStarted;
    Uint16 operationalStatus;
    Uint16 enabledState;
};
constexpr std::array<Activity, 8> kActivities{{
    {"active", true, kOperationalOk, kEnabled},
    {"reloading", true, kOperationalOk, kEnabled},
    {"refreshing", true, kOperationalOk, kEnabled},
    {"activating", false, kOperationalStarting, kStarting},
    {"deactivating", true, kOperationalStopping, kShuttingDown},
    {"inactive", false, kOperationalStopped, kDisabled},
    {"failed", false, kOperationalError, kDisabled},
    {"maintenance", false, kOperationalInService, kDisabled},
}};

Fact<Activity> activityOf(const ServiceUnit& unit) {
    const std::string state = unit.activeState.value_or("inactive");
    const auto* known = std::find_if(kActivities.begin(), kActivities.end(),
                                     [&](const Activity& entry) { return entry.state == state; });
    return known == kActivities.end() ? Fact<Activity>(Absence::Unreadable)
                                      : Fact<Activity>(*known);
}

/// CIM_EnabledLogicalElement.EnabledDefault of the state of a unit's file.
std::optional<Uint16> enabledDefaultOf(const std::string& fileState) {
    if (fileState == "enabled" || fileState == "enabled-runtime")
        return kEnabled;
    if (fileState == "disabled" || fileState == "masked" || fileState == "masked-runtime" ||
        fileState == "linked" || fileState == "linked-runtime")
        return kDisabled;
    if (fileState == "static" || fileState == "indirect" || fileState == "generated" ||
        fileState == "transient")
        return kStateNotApplicable;
    return std::nullopt;
}

/// A masked service cannot be started at all, and others decide over a static one.
std::optional<std::string> startModeOf(const std::string& fileState) {
    const std::optional<Uint16> enabledDefault = enabledDefaultOf(fileState);
    if (enabledDefault == kEnabled)
        return "Automatic";
    const bool isMasked = fileState.starts_with("masked");
    return enabledDefault == kDisabled && !isMasked ? std::optional<std::string>("Manual")
                                                    : std::nullopt;
}

}  // namespace

std::unique_ptr<InstanceStream> ServiceProvider::enumerate() const {
    Fact<std::vector<ServiceUnit>> units = readServiceUnits(paths.systemBus());
    if (!units)
        return std::make_unique<EmptyStream>(units.reason());
    return std::make_unique<RecordStream<ServiceUnit>>(
        std::move(*units), [hostName = readHostName(paths)](const ServiceUnit& unit) {
            return publish(hostName, unit);
        });
}

ProvidedInstance ServiceProvider::publish(const std::string& hostName, const ServiceUnit& unit) {
    const Fact<Activity> activity = activityOf(unit);
    InstanceBuilder builder(kClassName);
    builder.label(unit.description.value_or(unit.name))
        .values<Uint16>("OperationalStatus", activity.then([](const Activity& known) {
            return std::optional(std::vector{known.operationalStatus});
        }))
        .value<Uint16>("EnabledState", activity.then([](const Activity& known) {
            return std::optional(known.enabledState);
        }))
        .serviceKeys(hostName, unit.name)
        .text("StartMode", unit.fileState.then(startModeOf, Absence::Absent))
        .value<Pegasus::Boolean>("Started", activity.then([](const Activity& known) {
            return std::optional(known.isStarted);
        }))
        .value<Uint16>("EnabledDefault", unit.fileState.then(enabledDefaultOf))
        .text("UnitFileState", unit.fileState, kStateLength)
        .text("ActiveState", unit.activeState, kStateLength)
        .text("SubState", unit.subState, kStateLength);
    return builder.take();
}

}  // namespace cimomd
