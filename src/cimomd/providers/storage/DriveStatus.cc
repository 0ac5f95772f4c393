#include "providers/storage/DriveStatus.h"

#include "providers/EnumeratedValues.h"

namespace cimomd {
namespace {

// SCSI and NVMe drivers have words of their own.
bool isWorking(const std::string& state) {
    return state == "running" || state == "live";
}

bool isOffline(const std::string& state) {
    return state == "offline" || state == "transport-offline" || state == "dead";
}

}  // namespace

std::uint16_t driveStatusOf(const Fact<std::string>& state) {
    if (!state)
        return kOperationalUnknown;
    if (isWorking(*state))
        return kOperationalOk;
    return isOffline(*state) ? kOperationalError : kOperationalOther;
}

Fact<std::uint16_t> driveEnabledStateOf(const Fact<std::string>& state) {
    return state.then([](const std::string& word) {
        return std::optional(isOffline(word) ? kEnabledButOffline : kEnabled);
    });
}

}  // namespace cimomd
