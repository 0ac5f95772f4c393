#include "providers/storage/VolumeStatus.h"

#include <optional>
#include <string>

#include "providers/EnumeratedValues.h"
#include "providers/storage/StorageValues.h"

namespace cimomd {
namespace {

// CIM_StorageExtent.ExtentStatus
constexpr std::uint16_t kBroken = 3;
constexpr std::uint16_t kDynamicReconfiguration = 5;
constexpr std::uint16_t kExposed = 6;
constexpr std::uint16_t kRebuild = 11;
constexpr std::uint16_t kRecalculate = 12;
constexpr std::uint16_t kVerifyInProgress = 14;

bool isStopped(const RaidState& raid) {
    return raid.arrayState == std::string("clear") || raid.arrayState == std::string("inactive");
}

bool isBroken(const RaidState& raid) {
    return raid.arrayState == std::string("broken");
}

bool isDegraded(const RaidState& raid) {
    return raid.missingDisks.value_or(0) > 0;
}

/// What an array does to itself; nothing while it rests.
std::optional<std::uint16_t> activityOf(const RaidState& raid) {
    const std::string action = raid.syncAction.value_or("idle");
    if (action == "recover")
        return kRebuild;
    if (action == "resync")
        return kRecalculate;
    if (action == "reshape")
        return kDynamicReconfiguration;
    if (action == "check" || action == "repair")
        return kVerifyInProgress;
    return std::nullopt;
}

std::uint16_t raidStatusOf(const RaidState& raid) {
    if (!raid.arrayState)
        return kOperationalUnknown;
    if (isBroken(raid))
        return kOperationalError;
    if (isStopped(raid))
        return kOperationalStopped;
    return isDegraded(raid) ? kOperationalDegraded : kOperationalOk;
}

}  // namespace

std::uint16_t volumeStatusOf(const Volume& volume) {
    if (volume.isRaid)
        return raidStatusOf(volume.raid);
    if (!volume.isSuspended)
        return kOperationalUnknown;
    return *volume.isSuspended ? kOperationalDormant : kOperationalOk;
}

Fact<std::uint16_t> volumeEnabledStateOf(const Volume& volume) {
    if (volume.isRaid)
        return volume.raid.arrayState.then([&volume](const std::string&) {
            return std::optional(isStopped(volume.raid) ? kDisabled : kEnabled);
        });
    return volume.isSuspended.then(
        [](bool suspended) { return std::optional(suspended ? kQuiesce : kEnabled); });
}

std::vector<std::uint16_t> extentStatusOf(const Volume& volume) {
    std::vector<std::uint16_t> statuses;
    if (isBroken(volume.raid))
        statuses.push_back(kBroken);
    if (isDegraded(volume.raid))
        statuses.push_back(kExposed);
    if (const auto activity = activityOf(volume.raid))
        statuses.push_back(*activity);
    if (statuses.empty())
        statuses.push_back(kExtentStatusNone);
    return statuses;
}

}  // namespace cimomd
