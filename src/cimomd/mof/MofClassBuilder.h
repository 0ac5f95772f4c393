#pragma once

// Turns a class as MOF writes it into a CIM class with its methods.

#include <Pegasus/Common/CIMClass.h>

#include <vector>

#include "mof/MofContext.h"

namespace cimomd {

struct BuiltClass {
    Pegasus::CIMClass cimClass;
    std::vector<MethodDeclaration> methods;
};

/// The class without inherited elements. Mistakes go to the log; what has one is left out.
BuiltClass buildClass(const MofClass& declaration, const MofContext& context);

/// The part of `declaration` that `error` speaks of.
MofPosition positionOf(const RepositoryError& error, const MofClass& declaration);

}  // namespace cimomd
