#pragma once

// Whether the service sennet@.service can write where velm.properties tells sennet to. It is root
// without most of root's privileges, so that an attempt of root says nothing about it.

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "report/Finding.h"
#include "script/ServiceRules.h"

namespace sennetctl {

/// What is known of the service of a product; see askServiceRules.
using ServiceRulesOf = std::function<std::optional<ServiceRules>(const char* product)>;

/// Appends a finding for each absolute path of an output directory in the octets of the
/// configuration that a service cannot write into: a warning where its timer is enabled, else a
/// note. Services are asked for only where a directory is none that every service can write.
void checkServiceOutput(const std::string& file, std::string_view octets,
                        const ServiceRulesOf& rulesOf, std::vector<Finding>& findings);

}  // namespace sennetctl
