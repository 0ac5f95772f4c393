#include <Pegasus/Common/CIMQualifier.h>

#include "Handle.h"
#include "QualifierBody.h"

namespace Pegasus {

namespace {

constexpr const char* kHandleClass = "CIMQualifier";

}  // namespace

CIMConstQualifier::CIMConstQualifier(const CIMName& name, const CIMValue& value,
                                     const CIMFlavor& flavor, Boolean propagated)
    : body(new QualifierBody(requireName(name, kHandleClass), value, flavor, propagated)) {}

CIMConstQualifier::CIMConstQualifier(QualifierBody* newBody) : body(newBody) {}

QualifierBody& CIMConstQualifier::access() const {
    return requireBody(body, kHandleClass);
}

const CIMName& CIMConstQualifier::getName() const {
    return access().name;
}

CIMType CIMConstQualifier::getType() const {
    return access().value.getType();
}

Boolean CIMConstQualifier::isArray() const {
    return access().value.isArray();
}

const CIMValue& CIMConstQualifier::getValue() const {
    return access().value;
}

const CIMFlavor& CIMConstQualifier::getFlavor() const {
    return access().flavor;
}

Boolean CIMConstQualifier::getPropagated() const {
    return access().propagated;
}

CIMQualifier CIMConstQualifier::clone() const {
    const QualifierBody& original = access();
    return CIMQualifier(new QualifierBody(original.name, original.value.clone(), original.flavor,
                                          original.propagated));
}

void CIMQualifier::setValue(const CIMValue& value) {
    access().value = value;
}

void CIMQualifier::setFlavor(const CIMFlavor& flavor) {
    access().flavor = flavor;
}

void CIMQualifier::setPropagated(Boolean propagated) {
    access().propagated = propagated;
}

}  // namespace Pegasus
