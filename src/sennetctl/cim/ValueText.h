#pragma once

// CIM values for people and for programs.

#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMValue.h>

#include <string>

#include "SennetConverter/mif/ValueNames.h"
#include "report/Json.h"

namespace sennetctl {

/// Renders values; numbers of properties with Values (DSP0004) have names.
class ValueText {
  public:
    /// For people: elements of an array are joined by ", ", null is an empty text.
    /// @param declared  the property in the class, for its names; null for none
    std::string shown(const Pegasus::CIMValue& value, const Pegasus::CIMProperty* declared);

    /// As a JSON value; with names {"value": ..., "text": ...}. Null is null.
    Json json(const Pegasus::CIMValue& value, const Pegasus::CIMProperty* declared);

  private:
    Json names(const Pegasus::CIMValue& value, const Pegasus::CIMProperty* declared);

    Pegasus::ValueNamesCache cache;
};

}  // namespace sennetctl
