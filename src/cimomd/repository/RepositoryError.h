#pragma once

// Why a declaration does not fit into a repository.

#include <Pegasus/Common/CIMName.h>

#include <string>

namespace cimomd {

/// Thrown by ClassRepository; names the part of the declaration that is at fault.
struct RepositoryError {
    /// Null when the class itself is at fault.
    Pegasus::CIMName property;
    /// Null when no qualifier is at fault.
    Pegasus::CIMName qualifier;
    std::string found;
    std::string expected;
    /// The fault is in the name of the superclass.
    bool atSuperClass = false;
};

}  // namespace cimomd
