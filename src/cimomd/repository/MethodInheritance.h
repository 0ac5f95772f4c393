#pragma once

// What a class gets from the methods of its superclass (DSP0004).

#include "repository/MethodDeclaration.h"
#include "repository/RepositoryError.h"

namespace cimomd {

/// All methods of the class `className`: those of its superclass, `super`, marked as propagated,
/// then its own. An override takes the place and the origin of what it overrides, and its
/// qualifiers by their flavors.
MethodList inheritMethods(const MethodList& super, std::vector<MethodDeclaration> declared,
                          const Pegasus::CIMName& className);

/// Appends to `errors` where `declared` changes the return type of a method of `super`, the type of
/// a parameter that both have (in methods with the qualifier Override), or the value of a qualifier
/// of either whose flavor is DisableOverride. What is new in `declared` always fits.
void checkMethodOverrides(const MethodList& super, const std::vector<MethodDeclaration>& declared,
                          RepositoryErrors& errors);

}  // namespace cimomd
