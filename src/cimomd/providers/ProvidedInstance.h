#pragma once

// An instance as a provider gives it, with what is not in it and why.

#include <Pegasus/Common/CIMInstance.h>

#include <string>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

/// A property that is null, or says that it is unknown.
struct MissingValue {
    /// Static text.
    const char* property = "";
    Absence reason = Absence::Absent;
};

struct ProvidedInstance {
    /// Without a path.
    Pegasus::CIMInstance instance;
    /// What tells the instance from others of its class: the key that is its own, in UTF-8.
    std::string identity;
    std::vector<MissingValue> missing;
};

}  // namespace cimomd
