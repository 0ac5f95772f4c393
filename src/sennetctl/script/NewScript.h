#pragma once

// The texts of a first inventory script and its resource properties.

#include <string>
#include <vector>

#include "script/AnsweredClass.h"

namespace sennetctl {

struct NewScript {
    std::string script;
    std::string properties;
    /// Properties that are not listed, and why: "CIM_Fan.Speed: reason".
    std::vector<std::string> leftOut;
};

/// Lists the properties that have a value in some instance, or all where a class has no instances;
/// but none that no file can show, or that only repeats the name of the class.
/// @param stem  the name of the script, without .script.inv
NewScript composeScript(const std::string& stem, const std::string& title,
                        const std::string& nameSpace, const std::vector<AnsweredClass>& classes);

/// "MaxClockSpeed" as "Max Clock Speed", "DeviceID" as "Device ID".
std::string readableName(const std::string& name);

}  // namespace sennetctl
