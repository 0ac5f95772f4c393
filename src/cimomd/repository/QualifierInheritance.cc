#include "repository/QualifierInheritance.h"

#include <Pegasus/Common/CIMValue.h>
#include <fmt/format.h>

#include <utility>

#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstQualifier;
using Pegasus::CIMFlavor;

bool sameValue(const CIMConstQualifier& a, const CIMConstQualifier& b) {
    return a.getValue().isNull() == b.getValue().isNull() &&
           a.getValue().toString() == b.getValue().toString();
}

}  // namespace

bool goesToSubclasses(const CIMConstQualifier& qualifier) {
    return qualifier.getFlavor().has(CIMFlavor::TOSUBCLASS);
}

void checkOverride(const CIMConstQualifier& inherited, const CIMConstQualifier& declared,
                   RepositoryErrors& errors) {
    const bool bound =
        goesToSubclasses(inherited) && !inherited.getFlavor().has(CIMFlavor::OVERRIDABLE);
    if (!bound || sameValue(inherited, declared))
        return;
    RepositoryError error;
    error.qualifier = declared.getName();
    error.found = fmt::format("qualifier {} with another value than the superclass gives it",
                              utf8Of(declared.getName().getString()));
    error.expected = fmt::format("its value to stay {}", utf8Of(inherited.getValue().toString()));
    errors.push_back(std::move(error));
}

}  // namespace cimomd
