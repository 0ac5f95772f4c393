#pragma once

// What systemd lets the unit sennet@.service of a product write.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sennetctl {

struct ServiceRules {
    bool isScheduled = false;           ///< its timer is enabled
    bool isReadOnly = false;            ///< it sees all file systems read-only but for `writable`
    bool isOverriding = false;          ///< the modes of files do not hold for it
    std::vector<std::string> writable;  ///< absolute paths
};

/// Of the text that `systemctl show` prints of the properties of the service and then of its timer.
/// Nothing where there is no such service, or where it runs as another user than root.
std::optional<ServiceRules> parseServiceRules(std::string_view text);

/// Asks systemctl. Nothing also where systemd does not run.
/// @param product  without its slash, one of outputPlaces()
std::optional<ServiceRules> askServiceRules(const char* product);

}  // namespace sennetctl
