#pragma once

// Which classes an enumeration of classes is about.

#include <vector>

#include "protocol/Model.h"
#include "xml/CimRequest.h"

namespace cimomd {

/// By the parameters ClassName (absent or null: the root above all top classes) and
/// DeepInheritance (false: direct subclasses only). The named class itself is not among them.
/// Raises Pegasus::CIMException with CIM_ERR_INVALID_CLASS for an unknown class.
std::vector<Pegasus::CIMName> selectClasses(const Pegasus::CimRequest& request, const Model& model);

}  // namespace cimomd
