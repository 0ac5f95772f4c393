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

/// The script's title as the files show it.
std::string shownTitle(const ScriptModel& model, const Velm::Properties& texts);

/// Appends whether a title breaks the MIF file that it is written to.
void checkTitleText(const ScriptModel& model, const std::string& title,
                    std::vector<Finding>& findings);

}  // namespace sennetctl
