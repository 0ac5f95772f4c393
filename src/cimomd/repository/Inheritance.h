#pragma once

// What a class gets from its superclass (DSP0004): properties, and qualifiers by their flavors.

#include <Pegasus/Common/CIMClass.h>

#include "repository/RepositoryError.h"

namespace cimomd {

/// The effective form of a class without a superclass: every property originates in it.
Pegasus::CIMClass asTopClass(Pegasus::CIMClass declared);

/// The effective form of `declared`, whose superclass has the effective form `super`. The result
/// shares elements with both, none of the three may be changed afterwards. Inherited elements come
/// first, in the superclass's order; those that `declared` does not repeat are marked as
/// propagated. A property keeps the origin of the class that declared it first.
Pegasus::CIMClass inherit(Pegasus::CIMClass super, Pegasus::CIMClass declared);

/// Whether `super` is terminal, and where `declared` changes the type or the fixed size of a
/// property of `super`, or the value of a qualifier whose flavor is DisableOverride.
RepositoryErrors checkOverrides(const Pegasus::CIMConstClass& super,
                                const Pegasus::CIMConstClass& declared);

}  // namespace cimomd
