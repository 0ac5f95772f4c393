#pragma once

// One class of a script as the server has it.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>

#include <vector>

#include "script/ScriptModel.h"

namespace sennetctl {

struct AnsweredClass {
    const ScriptSlot* slot = nullptr;  // belongs to the model
    Pegasus::CIMClass definition;
    std::vector<Pegasus::CIMInstance> instances;
};

}  // namespace sennetctl
