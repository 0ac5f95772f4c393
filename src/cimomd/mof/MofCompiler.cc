#include "mof/MofCompiler.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <algorithm>
#include <utility>

#include "files/BoundedFile.h"
#include "mof/MofParser.h"
#include "mof/MofValue.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMClass;
using Pegasus::CIMFlavor;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::CIMQualifier;
using Pegasus::CIMValue;

CIMName nameOf(const MofName& name) {
    return CIMName(cimString(name.text));
}

std::string_view describe(FileStatus status) {
    switch (status) {
        case FileStatus::Absent:
            return "no such file";
        case FileStatus::TooLong:
            return "a file that is too long";
        default:
            return "a file that cannot be read";
    }
}

QualifierScopes scopeOf(const MofClass& declaration) {
    QualifierScopes scope = kScopeClass;
    for (const MofQualifier& qualifier : declaration.qualifiers) {
        if (equalsIgnoringCase(qualifier.name.text, "association"))
            scope |= kScopeAssociation;
        if (equalsIgnoringCase(qualifier.name.text, "indication"))
            scope |= kScopeIndication;
    }
    return scope;
}

std::string_view describe(QualifierScopes scope) {
    if (scope == kScopeProperty)
        return "a property";
    if (scope == kScopeReference)
        return "a reference";
    return "a class";
}

/// The part of `declaration` that `error` speaks of.
MofPosition positionOf(const RepositoryError& error, const MofClass& declaration) {
    if (error.atSuperClass && declaration.superClass)
        return declaration.superClass->position;
    const std::vector<MofQualifier>* qualifiers = &declaration.qualifiers;
    MofPosition position = declaration.name.position;
    for (const MofProperty& property : declaration.properties) {
        if (error.property == nameOf(property.name)) {
            qualifiers = &property.qualifiers;
            position = property.name.position;
        }
    }
    for (const MofQualifier& qualifier : *qualifiers) {
        if (error.qualifier == nameOf(qualifier.name))
            return qualifier.name.position;
    }
    return position;
}

}  // namespace

MofCompiler::MofCompiler(ClassRepository& repository, Pegasus::CIMNamespaceName defaultNamespace)
    : target(repository), firstNamespace(std::move(defaultNamespace)) {}

void MofCompiler::compileFile(const std::filesystem::path& path) {
    const FileContent content = readBoundedFile(path, kMaxFileBytes);
    if (content.status != FileStatus::Read)
        throw MofError(path.string(), MofPosition(), describe(content.status), "a MOF file");
    compileText(content.bytes, path);
}

void MofCompiler::compileText(std::string_view text, const std::filesystem::path& file) {
    draft = target;
    nameSpace = firstNamespace;
    fileCount = 1;
    compile(text, Unit{file, 0});
    target = std::exchange(draft, ClassRepository());
}

void MofCompiler::compile(std::string_view text, const Unit& unit) {
    draft.addNamespace(nameSpace);
    const std::string file = unit.path.string();
    MofParser parser(text, file);
    for (const MofDeclaration& declaration : parser.parse())
        std::visit([&](const auto& alternative) { declare(alternative, unit); }, declaration);
}

void MofCompiler::declare(const MofQualifierDeclaration& declaration, const Unit& unit) {
    const std::string file = unit.path.string();
    QualifierDeclaration out;
    out.name = nameOf(declaration.name);
    out.defaultValue = declaration.defaultValue
                           ? cimValueOf(*declaration.defaultValue, declaration.type, file)
                           : nullOf(declaration.type);
    out.scopes = declaration.scopes;
    for (const MofFlavor& flavor : declaration.flavors)
        applyFlavor(flavor.word, out.flavor);
    for (const RepositoryError& error : draft.addQualifier(nameSpace, std::move(out)))
        throw MofError(file, declaration.name.position, error.found, error.expected);
}

void MofCompiler::declare(const MofClass& declaration, const Unit& unit) {
    const std::string file = unit.path.string();
    for (const RepositoryError& error : draft.addClass(nameSpace, classOf(declaration, file)))
        throw MofError(file, positionOf(error, declaration), error.found, error.expected);
}

void MofCompiler::declare(const MofInclude& include, const Unit& unit) {
    const std::string file = unit.path.string();
    if (unit.depth + 1 > kMaxIncludeDepth)
        throw MofError(file, include.file.position, "an include inside too many others",
                       fmt::format("at most {} levels", kMaxIncludeDepth));
    if (++fileCount > kMaxFiles)
        throw MofError(file, include.file.position, "too many included files",
                       fmt::format("at most {}", kMaxFiles));
    const Unit included{unit.path.parent_path() / include.file.text, unit.depth + 1};
    const FileContent content = readBoundedFile(included.path, kMaxFileBytes);
    if (content.status != FileStatus::Read)
        throw MofError(file, include.file.position,
                       fmt::format("{} ({})", describe(content.status), include.file.text),
                       "the name of a MOF file");
    compile(content.bytes, included);
}

void MofCompiler::declare(const MofNamespace& pragma, const Unit& unit) {
    try {
        nameSpace = Pegasus::CIMNamespaceName(cimString(pragma.name.text));
    } catch (const Pegasus::Exception&) {
        throw MofError(unit.path.string(), pragma.name.position,
                       fmt::format("\"{}\"", pragma.name.text), "a namespace such as root/cimv2");
    }
    draft.addNamespace(nameSpace);
}

CIMClass MofCompiler::classOf(const MofClass& declaration, const std::string& file) const {
    CIMClass out(nameOf(declaration.name),
                 declaration.superClass ? nameOf(*declaration.superClass) : CIMName());
    const QualifierScopes scope = scopeOf(declaration);
    for (const MofQualifier& use : declaration.qualifiers) {
        if (out.findQualifier(nameOf(use.name)) != Pegasus::PEG_NOT_FOUND)
            throw MofError(file, use.name.position, use.name.text, "each qualifier once");
        out.addQualifier(qualifierOf(use, scope, file));
    }
    for (const MofProperty& property : declaration.properties) {
        if (out.findProperty(nameOf(property.name)) != Pegasus::PEG_NOT_FOUND)
            throw MofError(file, property.name.position, property.name.text, "each property once");
        out.addProperty(propertyOf(property, file));
    }
    return out;
}

CIMProperty MofCompiler::propertyOf(const MofProperty& declaration, const std::string& file) const {
    const MofType& type = declaration.type;
    const bool isReference = type.type == Pegasus::CIMTYPE_REFERENCE;
    CIMProperty out(
        nameOf(declaration.name),
        declaration.defaultValue ? cimValueOf(*declaration.defaultValue, type, file) : nullOf(type),
        type.arraySize, isReference ? CIMName(cimString(type.referenceClass)) : CIMName());
    for (const MofQualifier& use : declaration.qualifiers) {
        if (out.findQualifier(nameOf(use.name)) != Pegasus::PEG_NOT_FOUND)
            throw MofError(file, use.name.position, use.name.text, "each qualifier once");
        out.addQualifier(qualifierOf(use, isReference ? kScopeReference : kScopeProperty, file));
    }
    return out;
}

CIMQualifier MofCompiler::qualifierOf(const MofQualifier& use, QualifierScopes scope,
                                      const std::string& file) const {
    const QualifierDeclaration* declaration = draft.findQualifier(nameSpace, nameOf(use.name));
    if (declaration == nullptr)
        throw MofError(file, use.name.position, use.name.text, "a declared qualifier");
    if ((declaration->scopes & scope) == 0)
        throw MofError(file, use.name.position, use.name.text,
                       fmt::format("a qualifier for {}", describe(scope)));
    MofType type;
    type.type = declaration->defaultValue.getType();
    type.isArray = declaration->defaultValue.isArray();
    CIMValue value = declaration->defaultValue;
    if (use.value)
        value = cimValueOf(*use.value, type, file);
    else if (type.type == Pegasus::CIMTYPE_BOOLEAN && !type.isArray)
        value = CIMValue(true);
    CIMFlavor flavor = declaration->flavor;
    for (const MofFlavor& word : use.flavors)
        applyFlavor(word.word, flavor);
    return CIMQualifier(declaration->name, value, flavor);
}

}  // namespace cimomd
