#pragma once

// How qualifiers go from a superclass to its subclasses (DSP0004, qualifier flavors).

#include <Pegasus/Common/CIMQualifier.h>

#include "repository/RepositoryError.h"

namespace cimomd {

/// The form of a superclass's qualifier in the subclass. Shares what is propagated already: that
/// keeps a schema of thousands of classes small. Qualifier is CIMQualifier or CIMConstQualifier.
template <typename Qualifier>
Qualifier propagated(const Qualifier& qualifier) {
    if (qualifier.getPropagated())
        return qualifier;
    Pegasus::CIMQualifier copy = qualifier.clone();
    copy.setPropagated(true);
    return copy;
}

bool goesToSubclasses(const Pegasus::CIMConstQualifier& qualifier);

/// Whether the value is the boolean true.
bool isTrue(const Pegasus::CIMConstQualifier& qualifier);

/// Whether subclasses have to keep the value of the qualifier.
bool isBinding(const Pegasus::CIMConstQualifier& qualifier);

bool haveSameValue(const Pegasus::CIMConstQualifier& a, const Pegasus::CIMConstQualifier& b);

/// `declared` as it stands in the subclass, in the place of `inherited`. A qualifier that may not
/// be overridden keeps its flavor as well: no step on the way down sets it free.
template <typename Qualifier>
Qualifier overriding(const Pegasus::CIMConstQualifier& inherited, const Qualifier& declared) {
    if (!isBinding(inherited))
        return declared;
    return Pegasus::CIMQualifier(declared.getName(), declared.getValue(), inherited.getFlavor());
}

/// Appends to `errors` when `inherited` may not be overridden and `declared`, the qualifier of the
/// same name, has another value.
void checkOverride(const Pegasus::CIMConstQualifier& inherited,
                   const Pegasus::CIMConstQualifier& declared, RepositoryErrors& errors);

}  // namespace cimomd
