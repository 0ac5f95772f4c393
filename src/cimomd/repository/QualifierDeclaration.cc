#include "repository/QualifierDeclaration.h"

namespace cimomd {
namespace {

using Pegasus::CIMFlavor;
using Pegasus::CIMValue;

bool areSame(const CIMValue& a, const CIMValue& b) {
    return a.getType() == b.getType() && a.isArray() == b.isArray() && a.isNull() == b.isNull() &&
           a.toString() == b.toString();
}

bool areSame(const CIMFlavor& a, const CIMFlavor& b) {
    for (const CIMFlavor::Bit bit :
         {CIMFlavor::OVERRIDABLE, CIMFlavor::TOSUBCLASS, CIMFlavor::TRANSLATABLE}) {
        if (a.has(bit) != b.has(bit))
            return false;
    }
    return true;
}

}  // namespace

bool QualifierDeclaration::isSameAs(const QualifierDeclaration& other) const {
    return name.equal(other.name) && scopes == other.scopes && areSame(flavor, other.flavor) &&
           areSame(defaultValue, other.defaultValue);
}

}  // namespace cimomd
