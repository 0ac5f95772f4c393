#pragma once

// The texts of a first inventory script and its resource properties.

#include <Velm/Properties.h>

#include <string>
#include <vector>

#include "script/AnsweredClass.h"

namespace sennetctl {

/// What a new script is made of.
struct NewScriptPlan {
    std::string fileName;  ///< of the script
    std::string title;
    std::string shownTitle;  ///< short enough for every product
    std::string nameSpace;
    std::vector<AnsweredClass> classes;
    Velm::Properties texts;  ///< those that there are already
};

struct NewScript {
    std::string script;
    std::string properties;
    /// Properties that are not listed, and why: "CIM_Fan.Speed: reason".
    std::vector<std::string> leftOut;
    /// Keys that the texts have already, and that `properties` lacks therefore.
    std::vector<std::string> present;
};

/// Lists the properties that have a value in some instance, or all where a class has no instances;
/// but none that no file can show as it is, or that only repeats the name of the class. Classes
/// with instances come first. Throws CannotRun when nothing of a class is left.
NewScript composeScript(const NewScriptPlan& plan);

}  // namespace sennetctl
