#pragma once

// How this machine resolves names: resolv.conf(5).

#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

struct ResolverSettings {
    /// In the order in which they are asked. Filtered when the file only names the local stub of
    /// systemd-resolved, and that one's own servers are not known.
    Fact<std::vector<std::string>> servers;
    /// The domain that completes short names first.
    Fact<std::string> domain;
    /// All domains that complete short names.
    Fact<std::vector<std::string>> searchDomains;
};

/// Names of servers that are no addresses are dropped.
ResolverSettings parseResolverSettings(std::string_view text);

/// From etc/resolv.conf; where that names the stub, the servers behind it. Missing for the reason
/// that the file cannot be read.
Fact<ResolverSettings> readResolverSettings(const SystemPaths& paths);

}  // namespace cimomd
