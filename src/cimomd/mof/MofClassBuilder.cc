#include "mof/MofClassBuilder.h"

#include <set>
#include <utility>

#include "mof/MofQualifiers.h"
#include "mof/MofToken.h"
#include "mof/MofValue.h"
#include "repository/QualifierInheritance.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMClass;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::CIMValue;

/// A subclass of an association, or of an indication, is one without saying so.
QualifierScopes inheritedScopes(const MofClass& declaration, const MofContext& context) {
    if (!declaration.superClass)
        return 0;
    const auto* super =
        context.repository.findClass(context.nameSpace, nameOf(*declaration.superClass));
    // Without the superclass, whose absence is told by itself, the class may be either.
    if (super == nullptr)
        return kScopeAssociation | kScopeIndication;
    QualifierScopes scopes = super->isAssociation() ? kScopeAssociation : 0;
    const Pegasus::Uint32 indication = super->findQualifier(CIMName("Indication"));
    if (indication != Pegasus::PEG_NOT_FOUND && isTrue(super->getQualifier(indication)))
        scopes |= kScopeIndication;
    return scopes;
}

bool isSetTo(const MofQualifier& qualifier, std::string_view name) {
    if (!equalsIgnoringCase(qualifier.name.text, name))
        return false;
    if (!qualifier.value || qualifier.value->elements.empty())
        return true;
    const bool* value = std::get_if<bool>(&qualifier.value->elements.front().value);
    return value == nullptr || *value;
}

QualifierScopes scopesOf(const MofClass& declaration, const MofContext& context) {
    QualifierScopes scopes = kScopeClass | inheritedScopes(declaration, context);
    for (const MofQualifier& qualifier : declaration.qualifiers) {
        if (isSetTo(qualifier, "association"))
            scopes |= kScopeAssociation;
        if (isSetTo(qualifier, "indication"))
            scopes |= kScopeIndication;
    }
    return scopes;
}

CIMValue defaultOf(const MofProperty& declaration, const MofContext& context) {
    try {
        if (declaration.defaultValue)
            return cimValueOf(*declaration.defaultValue, declaration.type, context.file());
    } catch (const MofError& error) {
        context.log.add(context.file(), error);
    }
    return nullOf(declaration.type);
}

CIMProperty propertyOf(const MofProperty& declaration, const MofContext& context) {
    const MofType& type = declaration.type;
    const bool isReference = type.type == Pegasus::CIMTYPE_REFERENCE;
    CIMProperty out(nameOf(declaration.name), defaultOf(declaration, context), type.arraySize,
                    nameOf(type.referenceClass));
    // A reference is a property too.
    const QualifierScopes scopes = isReference ? kScopeReference | kScopeProperty : kScopeProperty;
    for (const auto& qualifier : qualifiersOf(declaration.qualifiers, scopes,
                                              isReference ? "a reference" : "a property", context))
        out.addQualifier(qualifier);
    return out;
}

std::vector<Pegasus::CIMConstQualifier> constQualifiersOf(const std::vector<MofQualifier>& uses,
                                                          QualifierScopes scopes,
                                                          std::string_view element,
                                                          const MofContext& context) {
    const auto qualifiers = qualifiersOf(uses, scopes, element, context);
    return {qualifiers.begin(), qualifiers.end()};
}

ParameterDeclaration parameterOf(const MofParameter& declaration, const MofContext& context) {
    ParameterDeclaration out;
    out.name = nameOf(declaration.name);
    out.type = declaration.type.type;
    out.referenceClass = nameOf(declaration.type.referenceClass);
    out.isArray = declaration.type.isArray;
    out.arraySize = declaration.type.arraySize;
    out.qualifiers =
        constQualifiersOf(declaration.qualifiers, kScopeParameter, "a parameter", context);
    return out;
}

/// Whether the name is new; says so in the log when it is not.
bool isNew(std::set<CIMName, NameOrder>& names, const MofName& name, const MofContext& context,
           std::string_view expected) {
    if (names.insert(nameOf(name)).second)
        return true;
    context.report(name.position, quotedText(name.text), expected);
    return false;
}

MethodDeclaration methodOf(const MofMethod& declaration, const MofContext& context) {
    MethodDeclaration out;
    out.name = nameOf(declaration.name);
    out.returnType = declaration.returnType.type;
    out.qualifiers = constQualifiersOf(declaration.qualifiers, kScopeMethod, "a method", context);
    std::set<CIMName, NameOrder> names;
    for (const MofParameter& parameter : declaration.parameters) {
        if (isNew(names, parameter.name, context, "each parameter once"))
            out.parameters.push_back(parameterOf(parameter, context));
    }
    return out;
}

template <typename Features>
const typename Features::value_type* findNamed(const Features& features, const CIMName& name) {
    for (const auto& feature : features) {
        if (!name.isNull() && nameOf(feature.name).equal(name))
            return &feature;
    }
    return nullptr;
}

MofPosition positionIn(const MofName& element, const std::vector<MofQualifier>& qualifiers,
                       const CIMName& qualifier) {
    const MofQualifier* found = findNamed(qualifiers, qualifier);
    return found == nullptr ? element.position : found->name.position;
}

}  // namespace

BuiltClass buildClass(const MofClass& declaration, const MofContext& context) {
    BuiltClass out{CIMClass(nameOf(declaration.name),
                            declaration.superClass ? nameOf(*declaration.superClass) : CIMName()),
                   {}};
    for (const auto& qualifier :
         qualifiersOf(declaration.qualifiers, scopesOf(declaration, context), "a class", context))
        out.cimClass.addQualifier(qualifier);
    std::set<CIMName, NameOrder> properties;
    for (const MofProperty& property : declaration.properties) {
        if (isNew(properties, property.name, context, "each property once"))
            out.cimClass.addProperty(propertyOf(property, context));
    }
    std::set<CIMName, NameOrder> methods;
    for (const MofMethod& method : declaration.methods) {
        if (isNew(methods, method.name, context, "each method once"))
            out.methods.push_back(methodOf(method, context));
    }
    return out;
}

MofPosition positionOf(const RepositoryError& error, const MofClass& declaration) {
    if (error.atSuperClass && declaration.superClass)
        return declaration.superClass->position;
    if (const MofProperty* property = findNamed(declaration.properties, error.property))
        return positionIn(property->name, property->qualifiers, error.qualifier);
    if (const MofMethod* method = findNamed(declaration.methods, error.method)) {
        if (const MofParameter* parameter = findNamed(method->parameters, error.parameter))
            return positionIn(parameter->name, parameter->qualifiers, error.qualifier);
        return positionIn(method->name, method->qualifiers, error.qualifier);
    }
    return positionIn(declaration.name, declaration.qualifiers, error.qualifier);
}

}  // namespace cimomd
