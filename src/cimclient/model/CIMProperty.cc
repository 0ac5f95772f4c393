#include <Pegasus/Common/CIMProperty.h>

#include <memory>
#include <utility>

#include "Handle.h"
#include "PropertyBody.h"

namespace Pegasus {

namespace {

constexpr const char* kHandleClass = "CIMProperty";

String describeType(CIMType type, Boolean isArray) {
    return String(cimTypeToString(type)) + (isArray ? "[]" : "");
}

}  // namespace

CIMConstProperty::CIMConstProperty(CIMName name, CIMValue value, Uint32 arraySize,
                                   CIMName referenceClass, CIMName classOrigin,
                                   Boolean propagated) {
    requireName(name, kHandleClass);
    auto fresh = std::make_unique<PropertyBody>(std::move(name), std::move(value));
    fresh->arraySize = arraySize;
    fresh->referenceClass = std::move(referenceClass);
    fresh->classOrigin = std::move(classOrigin);
    fresh->propagated = propagated;
    body = BodyRef<PropertyBody>(fresh.release());
}

CIMConstProperty::CIMConstProperty(PropertyBody* newBody) : body(newBody) {}

PropertyBody& CIMConstProperty::access() const {
    return requireBody(body, kHandleClass);
}

const CIMName& CIMConstProperty::getName() const {
    return access().name;
}

const CIMValue& CIMConstProperty::getValue() const {
    return access().value;
}

CIMType CIMConstProperty::getType() const {
    return access().value.getType();
}

Boolean CIMConstProperty::isArray() const {
    return access().value.isArray();
}

Uint32 CIMConstProperty::getArraySize() const {
    return access().arraySize;
}

const CIMName& CIMConstProperty::getReferenceClassName() const {
    return access().referenceClass;
}

const CIMName& CIMConstProperty::getClassOrigin() const {
    return access().classOrigin;
}

Boolean CIMConstProperty::getPropagated() const {
    return access().propagated;
}

Uint32 CIMConstProperty::findQualifier(const CIMName& name) const {
    return access().qualifiers.find(name);
}

CIMConstQualifier CIMConstProperty::getQualifier(Uint32 index) const {
    return access().qualifiers.at(index);
}

Uint32 CIMConstProperty::getQualifierCount() const {
    return access().qualifiers.size();
}

CIMProperty CIMConstProperty::clone() const {
    return CIMProperty(new PropertyBody(access()));
}

void CIMProperty::setValue(CIMValue value) {
    PropertyBody& property = access();
    if (value.getType() != getType() || value.isArray() != isArray())
        throw TypeMismatchException("Property " + property.name.getString() + " is of type " +
                                    describeType(getType(), isArray()) +
                                    " and cannot have a value of type " +
                                    describeType(value.getType(), value.isArray()));
    property.value = std::move(value);
}

void CIMProperty::setClassOrigin(const CIMName& className) {
    access().classOrigin = className;
}

void CIMProperty::setPropagated(Boolean propagated) {
    access().propagated = propagated;
}

CIMProperty& CIMProperty::addQualifier(CIMQualifier qualifier) {
    PropertyBody& property = access();
    property.qualifiers.add(std::move(qualifier), "qualifier", property.name);
    return *this;
}

CIMQualifier CIMProperty::getQualifier(Uint32 index) {
    return access().qualifiers.at(index);
}

}  // namespace Pegasus
