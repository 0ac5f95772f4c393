#pragma once

// What several operations demand of their requests.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMStatusCode.h>

#include <string>

#include "protocol/Model.h"
#include "xml/CimRequest.h"

namespace cimomd {

/// Raises Pegasus::CIMException; `description` may hold any bytes.
[[noreturn]] void failOperation(Pegasus::CIMStatusCode code, const std::string& description);

/// The parameter ClassName; fails with CIM_ERR_INVALID_PARAMETER when it is absent or null.
Pegasus::CIMName requiredClassName(const Pegasus::CimRequest& request);

/// The class in the request's namespace, valid as long as the model; fails with `ifUnknown`.
const Pegasus::CIMConstClass& requiredClass(const Model& model, const Pegasus::CimRequest& request,
                                            const Pegasus::CIMName& name,
                                            Pegasus::CIMStatusCode ifUnknown);

}  // namespace cimomd
