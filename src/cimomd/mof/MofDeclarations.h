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
    MofName referenceClass;
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

struct MofParameter {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    MofType type;
};

struct MofMethod {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    MofType returnType;
    std::vector<MofParameter> parameters;
};

struct MofClass {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    std::optional<MofName> superClass;
    std::vector<MofProperty> properties;
    std::vector<MofMethod> methods;
    /// False when a mistake made the parser leave something out.
    bool isComplete = true;
};

/// What an instance declaration gives one property.
struct MofPropertyValue {
    std::vector<MofQualifier> qualifiers;
    MofName name;
    MofLiteral value;
};

struct MofInstance {
    std::vector<MofQualifier> qualifiers;
    MofName className;
    /// Without the dollar sign.
    std::optional<MofName> alias;
    std::vector<MofPropertyValue> values;
    /// False when a mistake made the parser leave something out.
    bool isComplete = true;
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

using MofDeclaration =
    std::variant<MofQualifierDeclaration, MofClass, MofInstance, MofInclude, MofNamespace>;

}  // namespace cimomd
