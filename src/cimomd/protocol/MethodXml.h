#pragma once

// Writes the declarations of methods as CIM-XML (DSP0201): METHOD with its parameters.

#include <string>

#include "model/ObjectXml.h"
#include "repository/MethodDeclaration.h"

namespace cimomd {

/// Those of the methods that the options leave in. A property list says nothing about methods.
void appendMethods(std::string& xml, const MethodList& methods,
                   const Pegasus::ObjectXmlOptions& options);

}  // namespace cimomd
