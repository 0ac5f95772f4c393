#pragma once

// Which properties identify the instances of a class (DSP0004: the qualifier Key).

#include <Pegasus/Common/CIMClass.h>

#include <vector>

namespace cimomd {

/// In the order of the class; empty for a class without keys.
std::vector<Pegasus::CIMName> keyPropertiesOf(const Pegasus::CIMConstClass& cimClass);

}  // namespace cimomd
