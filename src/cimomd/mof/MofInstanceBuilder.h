#pragma once

// Turns an instance as MOF writes it into a CIM instance, whose aliases are still open.

#include <Pegasus/Common/CIMInstance.h>

#include <vector>

#include "mof/MofContext.h"
#include "mof/MofInstanceClass.h"

namespace cimomd {

/// A reference given as an alias.
struct MofAliasUse {
    /// The position of the property in the instance.
    Pegasus::Uint32 property = 0;
    MofName alias;
};

struct BuiltInstance {
    /// Without a path.
    Pegasus::CIMInstance instance;
    std::vector<MofAliasUse> aliasUses;
    /// False when a mistake made the builder leave a value out.
    bool isComplete = true;
};

/// All properties of the class, with their defaults where `declaration` gives no value. Mistakes go
/// to the log. A property that the class does not have is none when `isClassFaulty`.
BuiltInstance buildInstance(const MofInstance& declaration, const MofInstanceClass& instanceClass,
                            bool isClassFaulty, const MofContext& context);

}  // namespace cimomd
