#include "repository/QualifierInheritance.h"

#include <Pegasus/Common/CIMValue.h>
#include <fmt/format.h>

#include <utility>

#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstQualifier;
using Pegasus::CIMFlavor;

}  // namespace

bool haveSameValue(const CIMConstQualifier& a, const CIMConstQualifier& b) {
    return a.getValue().isNull() == b.getValue().isNull() &&
           a.getValue().toString() == b.getValue().toString();
}

bool goesToSubclasses(const CIMConstQualifier& qualifier) {
    return qualifier.getFlavor().has(CIMFlavor::TOSUBCLASS);
}

bool isTrue(const CIMConstQualifier& qualifier) {
    const Pegasus::CIMValue& value = qualifier.getValue();
    Pegasus::Boolean isTrue = false;
    if (value.getType() == Pegasus::CIMTYPE_BOOLEAN && !value.isArray() && !value.isNull())
        value.get(isTrue);
    return isTrue;
}

bool isBinding(const CIMConstQualifier& qualifier) {
    return goesToSubclasses(qualifier) && !qualifier.getFlavor().has(CIMFlavor::OVERRIDABLE);
}

void checkOverride(const CIMConstQualifier& inherited, const CIMConstQualifier& declared,
                   RepositoryErrors& errors) {
    if (!isBinding(inherited) || haveSameValue(inherited, declared))
        return;
    RepositoryError error;
    error.qualifier = declared.getName();
    error.found = fmt::format("qualifier {} with another value than the superclass gives it",
                              utf8Of(declared.getName().getString()));
    error.expected = fmt::format("its value to stay {}", utf8Of(inherited.getValue().toString()));
    errors.push_back(std::move(error));
}

}  // namespace cimomd
