#pragma once

// The services of systemd: those it has loaded and those that are installed.

#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/software/SystemBus.h"

namespace cimomd {

/// States are systemd's own words. A service that is not loaded has none but that of its file.
struct ServiceUnit {
    std::string name;
    Fact<std::string> description;
    Fact<std::string> activeState;
    Fact<std::string> subState;
    /// Whether the machine's start starts it, as the command systemctl prints it.
    Fact<std::string> fileState;
};

/// From the rows of ListUnits and ListUnitFiles, sorted by name. Left out are units that only
/// others speak of, second names of services, and templates, which are no services yet.
std::vector<ServiceUnit> serviceUnitsOf(const std::vector<SystemBus::Row>& units,
                                        const Fact<std::vector<SystemBus::Row>>& files);

/// Asks the service manager on the bus at `socketPath`, for two seconds at most.
Fact<std::vector<ServiceUnit>> readServiceUnits(const std::filesystem::path& socketPath);

}  // namespace cimomd
