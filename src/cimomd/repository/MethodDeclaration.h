#pragma once

// The methods of a class as they are declared (DSP0004). Nobody calls them here; clients read them.

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMType.h>

#include <memory>
#include <vector>

namespace cimomd {

struct ParameterDeclaration {
    Pegasus::CIMName name;
    Pegasus::CIMType type = Pegasus::CIMTYPE_STRING;
    /// The class of a reference, else null.
    Pegasus::CIMName referenceClass;
    bool isArray = false;
    /// 0 for an array of any size.
    Pegasus::Uint32 arraySize = 0;
    std::vector<Pegasus::CIMConstQualifier> qualifiers;
};

struct MethodDeclaration {
    Pegasus::CIMName name;
    Pegasus::CIMType returnType = Pegasus::CIMTYPE_UINT32;
    /// The class that declared the method first.
    Pegasus::CIMName classOrigin;
    /// Whether the class has the method only from its superclass.
    bool isPropagated = false;
    std::vector<Pegasus::CIMConstQualifier> qualifiers;
    std::vector<ParameterDeclaration> parameters;
};

/// Subclasses share what they inherit.
using MethodList = std::vector<std::shared_ptr<const MethodDeclaration>>;

}  // namespace cimomd
