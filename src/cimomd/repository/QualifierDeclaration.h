#pragma once

// What a namespace knows about one qualifier: its type, its default and where it may stand.

#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMValue.h>

#include "repository/QualifierScope.h"

namespace cimomd {

struct QualifierDeclaration {
    Pegasus::CIMName name;
    /// The type of the qualifier is that of this value, which may be null.
    Pegasus::CIMValue defaultValue;
    QualifierScopes scopes = kScopeAny;
    Pegasus::CIMFlavor flavor;

    /// Whether both say the same; only the case of the name may differ.
    bool isSameAs(const QualifierDeclaration& other) const;
};

}  // namespace cimomd
