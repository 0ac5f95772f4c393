#pragma once

// Who this machine is: its host name, and what firmware and device tree say about the maker.

#include <optional>
#include <string>

#include "system/SystemPaths.h"

namespace cimomd {

/// Texts of the firmware that are placeholders, or may only be read by root, are nothing.
struct SystemIdentity {
    std::optional<std::string> manufacturer;
    std::optional<std::string> model;
    std::optional<std::string> version;
    std::optional<std::string> serialNumber;
    std::optional<std::string> uuid;
    std::optional<std::string> machineId;
};

SystemIdentity readSystemIdentity(const SystemPaths& paths);

/// The host name; "localhost" when the kernel tells none, since every key needs one.
std::string readHostName(const SystemPaths& paths);

}  // namespace cimomd
