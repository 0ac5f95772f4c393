#include "repository/Inheritance.h"

#include <fmt/format.h>

#include <string>
#include <utility>

#include "repository/QualifierInheritance.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMClass;
using Pegasus::CIMConstClass;
using Pegasus::CIMConstProperty;
using Pegasus::CIMConstQualifier;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::CIMQualifier;
using Pegasus::Uint32;

/// Gives `target` the qualifiers of `super` that go to subclasses and that `declared` does not
/// repeat. Element is a class or a property.
template <typename Element, typename ConstElement>
void inheritQualifiers(Element& super, const ConstElement* declared, Element& target) {
    for (Uint32 i = 0; i < super.getQualifierCount(); ++i) {
        const CIMQualifier qualifier = super.getQualifier(i);
        const bool repeated = declared != nullptr && declared->findQualifier(qualifier.getName()) !=
                                                         Pegasus::PEG_NOT_FOUND;
        if (!repeated && goesToSubclasses(qualifier))
            target.addQualifier(propagated(qualifier));
    }
}

template <typename Element>
void takeQualifiers(const Element& super, Element& declared, Element& target) {
    for (Uint32 i = 0; i < declared.getQualifierCount(); ++i) {
        const CIMQualifier qualifier = declared.getQualifier(i);
        const Uint32 before = super.findQualifier(qualifier.getName());
        target.addQualifier(before == Pegasus::PEG_NOT_FOUND
                                ? qualifier
                                : overriding(super.getQualifier(before), qualifier));
    }
}

CIMProperty bareProperty(const CIMConstProperty& property, const CIMName& origin,
                         bool isPropagated) {
    return CIMProperty(property.getName(), property.getValue(), property.getArraySize(),
                       property.getReferenceClassName(), origin, isPropagated);
}

CIMProperty inheritedProperty(CIMProperty super) {
    if (super.getPropagated())
        return super;
    CIMProperty out = bareProperty(super, super.getClassOrigin(), true);
    inheritQualifiers<CIMProperty, CIMConstProperty>(super, nullptr, out);
    return out;
}

CIMProperty overridingProperty(CIMProperty super, CIMProperty declared) {
    CIMProperty out = bareProperty(declared, super.getClassOrigin(), false);
    if (declared.getValue().isNull())
        out.setValue(super.getValue());
    inheritQualifiers<CIMProperty, CIMConstProperty>(super, &declared, out);
    takeQualifiers(super, declared, out);
    return out;
}

bool keepsType(const CIMConstProperty& super, const CIMConstProperty& declared) {
    const bool isSizeKept =
        super.getArraySize() == 0 || super.getArraySize() == declared.getArraySize();
    return super.getType() == declared.getType() && super.isArray() == declared.isArray() &&
           isSizeKept;
}

std::string typeText(const CIMConstProperty& property) {
    const std::string size =
        property.getArraySize() == 0 ? "" : std::to_string(property.getArraySize());
    return fmt::format("{}{}", Pegasus::cimTypeToString(property.getType()),
                       property.isArray() ? "[" + size + "]" : "");
}

template <typename Element>
void checkQualifiers(const Element& super, const Element& declared, RepositoryErrors& errors) {
    for (Uint32 i = 0; i < declared.getQualifierCount(); ++i) {
        const CIMConstQualifier qualifier = declared.getQualifier(i);
        const Uint32 index = super.findQualifier(qualifier.getName());
        if (index != Pegasus::PEG_NOT_FOUND)
            checkOverride(super.getQualifier(index), qualifier, errors);
    }
}

void checkProperty(const CIMConstProperty& super, const CIMConstProperty& declared,
                   RepositoryErrors& errors) {
    const std::size_t first = errors.size();
    if (!keepsType(super, declared)) {
        RepositoryError error;
        error.found =
            fmt::format("{} {}", typeText(declared), utf8Of(declared.getName().getString()));
        error.expected = fmt::format("the inherited type {}", typeText(super));
        errors.push_back(std::move(error));
    }
    checkQualifiers(super, declared, errors);
    for (std::size_t i = first; i < errors.size(); ++i)
        errors[i].property = declared.getName();
}

void checkTerminal(const CIMConstClass& super, RepositoryErrors& errors) {
    static const CIMName kTerminal("Terminal");
    const Uint32 index = super.findQualifier(kTerminal);
    if (index == Pegasus::PEG_NOT_FOUND || !isTrue(super.getQualifier(index)))
        return;
    RepositoryError error;
    error.atSuperClass = true;
    error.found =
        fmt::format("superclass {}, which is terminal", utf8Of(super.getClassName().getString()));
    error.expected = "a class that may have subclasses";
    errors.push_back(std::move(error));
}

}  // namespace

CIMClass asTopClass(CIMClass declared) {
    for (Uint32 i = 0; i < declared.getPropertyCount(); ++i)
        declared.getProperty(i).setClassOrigin(declared.getClassName());
    return declared;
}

CIMClass inherit(CIMClass super, CIMClass declared) {
    CIMClass out(declared.getClassName(), super.getClassName());
    inheritQualifiers<CIMClass, CIMConstClass>(super, &declared, out);
    takeQualifiers(super, declared, out);
    for (Uint32 i = 0; i < super.getPropertyCount(); ++i) {
        const CIMProperty property = super.getProperty(i);
        const Uint32 index = declared.findProperty(property.getName());
        if (index == Pegasus::PEG_NOT_FOUND)
            out.addProperty(inheritedProperty(property));
        else
            out.addProperty(overridingProperty(property, declared.getProperty(index)));
    }
    for (Uint32 i = 0; i < declared.getPropertyCount(); ++i) {
        CIMProperty property = declared.getProperty(i);
        if (super.findProperty(property.getName()) != Pegasus::PEG_NOT_FOUND)
            continue;
        property.setClassOrigin(declared.getClassName());
        out.addProperty(property);
    }
    return out;
}

RepositoryErrors checkOverrides(const CIMConstClass& super, const CIMConstClass& declared) {
    RepositoryErrors errors;
    checkTerminal(super, errors);
    checkQualifiers(super, declared, errors);
    for (Uint32 i = 0; i < declared.getPropertyCount(); ++i) {
        const CIMConstProperty property = declared.getProperty(i);
        const Uint32 index = super.findProperty(property.getName());
        if (index != Pegasus::PEG_NOT_FOUND)
            checkProperty(super.getProperty(index), property, errors);
    }
    return errors;
}

}  // namespace cimomd
