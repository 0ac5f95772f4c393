#pragma once

// What is called like an inventory script and is none.

#include <string>
#include <vector>

#include "report/Finding.h"

namespace sennetctl {

/// Appends a finding for each entry of the directory that has the name of a script and that sennet
/// passes over, since it is no file or a link that leads to none. A directory that cannot be listed
/// has none.
void checkPassedOver(const std::string& directory, std::vector<Finding>& findings);

}  // namespace sennetctl
