#pragma once

// Who this machine is: its host name, and what firmware and device tree say about the maker.

#include <string>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

/// Texts of the firmware that are placeholders, or may only be read by root, are missing.
struct SystemIdentity {
    Fact<std::string> manufacturer;
    Fact<std::string> model;
    Fact<std::string> version;
    Fact<std::string> serialNumber;
    Fact<std::string> uuid;
    Fact<std::string> machineId;
};

SystemIdentity readSystemIdentity(const SystemPaths& paths);

/// The host name; "localhost" when the kernel tells none, since every key needs one.
std::string readHostName(const SystemPaths& paths);

}  // namespace cimomd
