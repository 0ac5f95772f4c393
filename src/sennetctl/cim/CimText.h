#pragma once

// Between the client library's strings and those of the commands.

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>

#include <string>

namespace sennetctl {

inline std::string textOf(const Pegasus::String& text) {
    return static_cast<const char*>(text.getCString());
}

inline std::string textOf(const Pegasus::CIMName& name) {
    return textOf(name.getString());
}

/// What went wrong; for a status that the server reported, with its number and name, such as
/// "CIM_ERR_NOT_FOUND (6): no class CIM_X".
std::string reasonOf(const Pegasus::Exception& failure);

}  // namespace sennetctl
