#include "mof/MofQualifiers.h"

#include <fmt/format.h>

#include <utility>

#include "mof/MofToken.h"
#include "mof/MofValue.h"
#include "repository/QualifierInheritance.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMName;
using Pegasus::CIMQualifier;
using Pegasus::CIMValue;

/// Schemas give a single value to qualifiers that take an array, and the reverse; nothing is in
/// doubt then.
MofLiteral fitted(const MofLiteral& literal, const MofType& type) {
    MofLiteral out = literal;
    const bool isNull = std::holds_alternative<MofNull>(
        literal.elements.empty() ? MofScalar(MofNull()) : literal.elements.front().value);
    if (literal.elements.size() == 1 && !isNull)
        out.isArray = type.isArray;
    return out;
}

CIMValue valueOf(const MofQualifier& use, const QualifierDeclaration& declaration,
                 const MofContext& context) {
    MofType type;
    type.type = declaration.defaultValue.getType();
    type.isArray = declaration.defaultValue.isArray();
    if (use.value)
        return cimValueOf(fitted(*use.value, type), type, context.file());
    if (type.type == Pegasus::CIMTYPE_BOOLEAN && !type.isArray)
        return CIMValue(true);
    return declaration.defaultValue;
}

const QualifierDeclaration* declarationOf(const CIMName& name, const MofContext& context) {
    const QualifierDeclaration* declaration =
        context.repository.findQualifier(context.nameSpace, name);
    if (declaration == nullptr)
        declaration = context.repository.findQualifier(context.qualifierNamespace, name);
    if (declaration == nullptr && context.furtherQualifiers != nullptr)
        declaration = context.furtherQualifiers->findQualifier(context.qualifierNamespace, name);
    return declaration;
}

CIMQualifier qualifierOf(const MofQualifier& use, QualifierScopes scopes, std::string_view element,
                         const MofContext& context) {
    const QualifierDeclaration* declaration = declarationOf(nameOf(use.name), context);
    if (declaration == nullptr)
        throw MofError(context.file(), use.name.position, quotedText(use.name.text),
                       "a declared qualifier");
    if ((declaration->scopes & scopes) == 0)
        throw MofError(context.file(), use.name.position, quotedText(use.name.text),
                       fmt::format("a qualifier for {}", element));
    Pegasus::CIMFlavor flavor = declaration->flavor;
    for (const MofFlavor& word : use.flavors)
        applyFlavor(word.word, flavor);
    return CIMQualifier(declaration->name, valueOf(use, *declaration, context), flavor);
}

QualifierDeclaration declarationFrom(const MofQualifierDeclaration& declaration,
                                     const std::string& file) {
    QualifierDeclaration out;
    out.name = nameOf(declaration.name);
    out.defaultValue = declaration.defaultValue
                           ? cimValueOf(fitted(*declaration.defaultValue, declaration.type),
                                        declaration.type, file)
                           : nullOf(declaration.type);
    out.scopes = declaration.scopes;
    for (const MofFlavor& flavor : declaration.flavors)
        applyFlavor(flavor.word, out.flavor);
    return out;
}

/// The same once more says nothing new.
void addOnce(const CIMQualifier& qualifier, const MofQualifier& use, const MofContext& context,
             std::vector<CIMQualifier>& out) {
    for (const CIMQualifier& before : out) {
        if (!before.getName().equal(qualifier.getName()))
            continue;
        if (!haveSameValue(before, qualifier))
            throw MofError(context.file(), use.name.position, quotedText(use.name.text),
                           "each qualifier once, or with the same value");
        return;
    }
    out.push_back(qualifier);
}

}  // namespace

void declareQualifier(const MofQualifierDeclaration& declaration, const MofContext& context) {
    try {
        if (declaration.type.type == Pegasus::CIMTYPE_REFERENCE)
            throw MofError(context.file(), declaration.type.referenceClass.position,
                           "a reference type", "a type of values");
        for (const RepositoryError& error : context.repository.addQualifier(
                 context.nameSpace, declarationFrom(declaration, context.file())))
            context.report(declaration.name.position, error.found, error.expected);
    } catch (const MofError& error) {
        context.log.add(context.file(), error);
    }
}

std::vector<CIMQualifier> qualifiersOf(const std::vector<MofQualifier>& uses,
                                       QualifierScopes scopes, std::string_view element,
                                       const MofContext& context) {
    std::vector<CIMQualifier> out;
    for (const MofQualifier& use : uses) {
        try {
            addOnce(qualifierOf(use, scopes, element, context), use, context, out);
        } catch (const MofError& error) {
            context.log.add(context.file(), error);
        }
    }
    return out;
}

}  // namespace cimomd
