#include "repository/MethodInheritance.h"

#include <fmt/format.h>

#include <algorithm>
#include <string>
#include <utility>

#include "repository/QualifierInheritance.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstQualifier;
using Pegasus::CIMName;
using QualifierList = std::vector<CIMConstQualifier>;

template <typename List>
auto findNamed(const List& list, const CIMName& name) {
    return std::find_if(list.begin(), list.end(),
                        [&](const auto& entry) { return entry.name.equal(name); });
}

const MethodDeclaration* findMethod(const MethodList& methods, const CIMName& name) {
    for (const auto& method : methods) {
        if (method->name.equal(name))
            return method.get();
    }
    return nullptr;
}

const CIMConstQualifier* findQualifier(const QualifierList& qualifiers, const CIMName& name) {
    for (const CIMConstQualifier& qualifier : qualifiers) {
        if (qualifier.getName().equal(name))
            return &qualifier;
    }
    return nullptr;
}

/// What `super` hands down, without what `declared` repeats, then `declared`.
QualifierList inheritQualifiers(const QualifierList& super, const QualifierList& declared) {
    QualifierList out;
    for (const CIMConstQualifier& qualifier : super) {
        if (goesToSubclasses(qualifier) && findQualifier(declared, qualifier.getName()) == nullptr)
            out.push_back(propagated(qualifier));
    }
    for (const CIMConstQualifier& qualifier : declared) {
        const CIMConstQualifier* before = findQualifier(super, qualifier.getName());
        out.push_back(before == nullptr ? qualifier : overriding(*before, qualifier));
    }
    return out;
}

std::shared_ptr<const MethodDeclaration> inherited(
    const std::shared_ptr<const MethodDeclaration>& super) {
    if (super->isPropagated)
        return super;
    auto out = std::make_shared<MethodDeclaration>(*super);
    out->isPropagated = true;
    out->qualifiers = inheritQualifiers(super->qualifiers, {});
    for (ParameterDeclaration& parameter : out->parameters)
        parameter.qualifiers = inheritQualifiers(parameter.qualifiers, {});
    return out;
}

std::shared_ptr<const MethodDeclaration> overriding(const MethodDeclaration& super,
                                                    MethodDeclaration declared) {
    declared.classOrigin = super.classOrigin;
    declared.qualifiers = inheritQualifiers(super.qualifiers, declared.qualifiers);
    for (ParameterDeclaration& parameter : declared.parameters) {
        const auto before = findNamed(super.parameters, parameter.name);
        if (before != super.parameters.end())
            parameter.qualifiers = inheritQualifiers(before->qualifiers, parameter.qualifiers);
    }
    return std::make_shared<const MethodDeclaration>(std::move(declared));
}

void checkQualifiers(const QualifierList& super, const QualifierList& declared,
                     RepositoryErrors& errors) {
    for (const CIMConstQualifier& qualifier : declared) {
        const CIMConstQualifier* before = findQualifier(super, qualifier.getName());
        if (before != nullptr)
            checkOverride(*before, qualifier, errors);
    }
}

std::string typeText(const ParameterDeclaration& parameter) {
    return fmt::format("{}{}", Pegasus::cimTypeToString(parameter.type),
                       parameter.isArray ? "[]" : "");
}

/// In and Out say how this one declaration is called.
QualifierList withoutDirection(const QualifierList& qualifiers) {
    static const CIMName kIn("In");
    static const CIMName kOut("Out");
    QualifierList out;
    for (const CIMConstQualifier& qualifier : qualifiers) {
        if (!qualifier.getName().equal(kIn) && !qualifier.getName().equal(kOut))
            out.push_back(qualifier);
    }
    return out;
}

void checkParameter(const ParameterDeclaration& super, const ParameterDeclaration& declared,
                    RepositoryErrors& errors) {
    const std::size_t first = errors.size();
    if (super.type != declared.type || super.isArray != declared.isArray) {
        RepositoryError error;
        error.found = fmt::format("{} {}", typeText(declared), utf8Of(declared.name.getString()));
        error.expected = fmt::format("the inherited type {}", typeText(super));
        errors.push_back(std::move(error));
    }
    checkQualifiers(super.qualifiers, withoutDirection(declared.qualifiers), errors);
    for (std::size_t i = first; i < errors.size(); ++i)
        errors[i].parameter = declared.name;
}

/// Schemas also use a name again for a method of its own, with other parameters: only what says
/// that it is an override has to fit.
void checkParameters(const MethodDeclaration& super, const MethodDeclaration& declared,
                     RepositoryErrors& errors) {
    static const CIMName kOverride("Override");
    if (findQualifier(declared.qualifiers, kOverride) == nullptr)
        return;
    for (const ParameterDeclaration& parameter : declared.parameters) {
        const auto before = findNamed(super.parameters, parameter.name);
        if (before != super.parameters.end())
            checkParameter(*before, parameter, errors);
    }
}

void checkReturnType(const MethodDeclaration& super, const MethodDeclaration& declared,
                     RepositoryErrors& errors) {
    if (super.returnType == declared.returnType)
        return;
    RepositoryError error;
    error.found = fmt::format("{} {}()", Pegasus::cimTypeToString(declared.returnType),
                              utf8Of(declared.name.getString()));
    error.expected =
        fmt::format("the inherited return type {}", Pegasus::cimTypeToString(super.returnType));
    errors.push_back(std::move(error));
}

}  // namespace

MethodList inheritMethods(const MethodList& super, std::vector<MethodDeclaration> declared,
                          const CIMName& className) {
    MethodList out;
    out.reserve(super.size() + declared.size());
    for (const auto& method : super) {
        const auto own = findNamed(declared, method->name);
        out.push_back(own == declared.end() ? inherited(method) : overriding(*method, *own));
    }
    for (MethodDeclaration& method : declared) {
        if (findMethod(super, method.name) != nullptr)
            continue;
        method.classOrigin = className;
        out.push_back(std::make_shared<const MethodDeclaration>(std::move(method)));
    }
    return out;
}

void checkMethodOverrides(const MethodList& super, const std::vector<MethodDeclaration>& declared,
                          RepositoryErrors& errors) {
    for (const MethodDeclaration& method : declared) {
        const MethodDeclaration* before = findMethod(super, method.name);
        if (before == nullptr)
            continue;
        const std::size_t first = errors.size();
        checkQualifiers(before->qualifiers, method.qualifiers, errors);
        checkReturnType(*before, method, errors);
        checkParameters(*before, method, errors);
        for (std::size_t i = first; i < errors.size(); ++i)
            errors[i].method = method.name;
    }
}

}  // namespace cimomd
