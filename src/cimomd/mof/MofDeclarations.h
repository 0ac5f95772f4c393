#pragma once

// What a MOF file declares (DSP0004), as it is written: nothing here is looked up or checked
// against other declarations.

#include <Pegasus/Common/CIMType.h>

#include <cstdint>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "mof/MofFlavor.h"
#include "mof/MofLiteral.h"
#include "mof/MofPosition.h"
#include "repository/QualifierScope.h"

namespace cimomd {

struct MofName {
    std::string text;
    MofPosition position;
};

/// A type with its array bounds. `arraySize` is 0 for an array of any size.
struct MofType {
    Pegasus::CIMType type = Pegasus::CIMTYPE_STRING;
    /// The class of a reference, else empty.
    std::string referenceClass;
    bool isArray = false;
    std::uint32_t arraySize = 0;
};

struct MofQualifier {
    MofName name;
    std::optional<MofLiteral> value;
    std::vector<MofFlavor> flavors;
};

struct MofProperty {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    MofType type;
    std::optional<MofLiteral> defaultValue;
};

struct MofClass {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    std::optional<MofName> superClass;
    std::vector<MofProperty> properties;
};

struct MofQualifierDeclaration {
    MofName name;
    MofType type;
    std::optional<MofLiteral> defaultValue;
    QualifierScopes scopes = 0;
    std::vector<MofFlavor> flavors;
};

/// #pragma include ("file"): the file's declarations stand here.
struct MofInclude {
    MofName file;
};

/// #pragma namespace ("name"): what follows belongs there.
struct MofNamespace {
    MofName name;
};

using MofDeclaration = std::variant<MofQualifierDeclaration, MofClass, MofInclude, MofNamespace>;

}  // namespace cimomd
