#pragma once

// Why a declaration does not fit into a repository.

#include <Pegasus/Common/CIMName.h>

#include <string>
#include <vector>

namespace cimomd {

/// Names the part of the declaration that is at fault.
struct RepositoryError {
    /// At most one of the two is set; none when the class, instance or qualifier itself is at
    /// fault.
    Pegasus::CIMName property;
    Pegasus::CIMName method;
    /// Null unless a parameter of `method` is at fault.
    Pegasus::CIMName parameter;
    /// Null when no qualifier of the part is at fault.
    Pegasus::CIMName qualifier;
    std::string found;
    std::string expected;
    /// The fault is in the name of the superclass.
    bool atSuperClass = false;
};

using RepositoryErrors = std::vector<RepositoryError>;

}  // namespace cimomd
