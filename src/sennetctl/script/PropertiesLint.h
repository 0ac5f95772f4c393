#pragma once

// Checks the key/value files of sennet: velm.properties and sennet.properties.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "report/Finding.h"
#include "script/Places.h"

namespace sennetctl {

/// Appends what is wrong with the configuration file. That there is none is wrong only when
/// VELM_CONFIG names it.
void checkConfiguration(const Places& places, std::vector<Finding>& findings);

/// Appends what is wrong with the resource properties, first of all that they cannot be read;
/// returns their octets where they can.
std::optional<std::string> checkResources(const Places& places, std::vector<Finding>& findings);

/// The same for a file's octets.
void checkConfigurationText(const std::string& file, std::string_view octets,
                            std::vector<Finding>& findings);
void checkResourcesText(const std::string& file, std::string_view octets,
                        std::vector<Finding>& findings);

}  // namespace sennetctl
