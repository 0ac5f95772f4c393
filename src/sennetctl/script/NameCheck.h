#pragma once

// What the products make of a script's title and of its columns' names.

#include <Velm/Properties.h>

#include <string>
#include <vector>

#include "report/Finding.h"
#include "script/AnsweredClass.h"

namespace sennetctl {

/// Appends which names collide, and which are cut, for which product.
void checkNames(const ScriptModel& model, const std::vector<AnsweredClass>& classes,
                const Velm::Properties& texts, std::vector<Finding>& findings);

/// The script's title, which follows from the file's name where the script gives none.
std::string ownTitle(const ScriptModel& model);

/// The title as the files show it.
std::string shownTitle(const ScriptModel& model, const Velm::Properties& texts);

}  // namespace sennetctl
