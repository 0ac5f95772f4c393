#pragma once

// Fits values written in MOF to CIM types.

#include <Pegasus/Common/CIMValue.h>

#include <string_view>

#include "mof/MofDeclarations.h"

namespace cimomd {

/// `literal` as a value of `type`; the literal null gives a null value. Raises MofError, naming
/// `file`, at the element that does not fit: another kind of value, a number out of range, an
/// array in place of a scalar or the reverse, a null inside an array, more elements than the array
/// has.
Pegasus::CIMValue cimValueOf(const MofLiteral& literal, const MofType& type, std::string_view file);

/// A null value of `type`.
Pegasus::CIMValue nullOf(const MofType& type);

}  // namespace cimomd
