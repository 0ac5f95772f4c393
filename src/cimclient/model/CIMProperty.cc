#include <Pegasus/Common/CIMProperty.h>

#include <memory>
#include <utility>

#include "Handle.h"
#include "PackedProperties.h"
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
    body = BodyRef<SharedBody>(fresh.release());
}

CIMConstProperty::CIMConstProperty(PropertyBody* newBody) : body(newBody) {}

CIMConstProperty::CIMConstProperty(const BodyRef<PackedProperties>& properties, Uint32 index)
    : body(properties.get()), index(index) {}

PropertyBody& CIMConstProperty::access() const {
    return static_cast<PropertyBody&>(requireBody(body, kHandleClass));
}

const PackedProperties* CIMConstProperty::packed() const {
    return index == kNotPacked ? nullptr : static_cast<const PackedProperties*>(body.get());
}

CIMName CIMConstProperty::getName() const {
    return packed() ? packed()->declaration(index).name : access().name;
}

CIMValue CIMConstProperty::getValue() const {
    return packed() ? packed()->value(index) : access().value;
}

CIMType CIMConstProperty::getType() const {
    return packed() ? packed()->declaration(index).type : access().value.getType();
}

Boolean CIMConstProperty::isArray() const {
    return packed() ? packed()->declaration(index).isArray : access().value.isArray();
}

Uint32 CIMConstProperty::getArraySize() const {
    return packed() ? packed()->declaration(index).arraySize : access().arraySize;
}

CIMName CIMConstProperty::getReferenceClassName() const {
    return packed() ? CIMName() : access().referenceClass;
}

CIMName CIMConstProperty::getClassOrigin() const {
    return packed() ? packed()->declaration(index).classOrigin : access().classOrigin;
}

Boolean CIMConstProperty::getPropagated() const {
    return packed() ? packed()->declaration(index).propagated : access().propagated;
}

Uint32 CIMConstProperty::findQualifier(const CIMName& name) const {
    return packed() ? PEG_NOT_FOUND : access().qualifiers.find(name);
}

CIMConstQualifier CIMConstProperty::getQualifier(Uint32 position) const {
    if (packed())
        throw IndexOutOfBoundsException(position, 0);
    return access().qualifiers.at(position);
}

Uint32 CIMConstProperty::getQualifierCount() const {
    return packed() ? 0 : access().qualifiers.size();
}

CIMProperty CIMConstProperty::clone() const {
    return packed() ? packed()->at(index) : CIMProperty(new PropertyBody(access()));
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
