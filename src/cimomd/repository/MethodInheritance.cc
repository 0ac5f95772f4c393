#include "repository/MethodInheritance.h"

#include <fmt/format.h>

#include <algorithm>
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
    out.insert(out.end(), declared.begin(), declared.end());
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

void checkQualifiers(const MethodDeclaration& super, const MethodDeclaration& declared,
                     RepositoryErrors& errors) {
    const std::size_t first = errors.size();
    for (const CIMConstQualifier& qualifier : declared.qualifiers) {
        const CIMConstQualifier* before = findQualifier(super.qualifiers, qualifier.getName());
        if (before != nullptr)
            checkOverride(*before, qualifier, errors);
    }
    for (std::size_t i = first; i < errors.size(); ++i)
        errors[i].method = declared.name;
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
        checkQualifiers(*before, method, errors);
        if (before->returnType == method.returnType)
            continue;
        RepositoryError error;
        error.method = method.name;
        error.found = fmt::format("{} {}()", Pegasus::cimTypeToString(method.returnType),
                                  utf8Of(method.name.getString()));
        error.expected = fmt::format("the inherited return type {}",
                                     Pegasus::cimTypeToString(before->returnType));
        errors.push_back(std::move(error));
    }
}

}  // namespace cimomd
