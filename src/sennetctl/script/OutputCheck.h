#pragma once

// Whether sennet can write where velm.properties tells it to.

#include <string>
#include <string_view>
#include <vector>

#include "report/Finding.h"

namespace sennetctl {

/// Appends a finding for each directory of output files that the octets of the configuration name
/// for some product, and that sennet could neither use nor make as the user of this process.
/// Relative paths are passed over, which are told as such.
void checkOutputDirectories(const std::string& file, std::string_view octets,
                            std::vector<Finding>& findings);

}  // namespace sennetctl
