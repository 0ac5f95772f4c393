#pragma once

// Checks what an inventory script says as a whole, without a server.

#include <Velm/Properties.h>

#include <vector>

#include "report/Finding.h"
#include "script/ScriptModel.h"

namespace sennetctl {

/// Appends what is wrong with names and slots, and fills the properties of the slots.
void checkScript(ScriptModel& model, std::vector<Finding>& findings);

/// Appends which title and columns of the script have no readable name in the resource properties.
void checkTranslations(const ScriptModel& model, const Velm::Properties& texts,
                       std::vector<Finding>& findings);

}  // namespace sennetctl
