#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMObject.h>

#include <utility>

#include "ClassBody.h"
#include "Handle.h"

namespace Pegasus {

namespace {

constexpr const char* kHandleClass = "CIMClass";

Boolean isQualifiedTrue(const ClassBody& body, const CIMName& qualifierName) {
    const Uint32 position = body.qualifiers.find(qualifierName);
    if (position == PEG_NOT_FOUND)
        return false;
    const CIMValue& value = body.qualifiers.at(position).getValue();
    Boolean isTrue = false;
    if (value.getType() == CIMTYPE_BOOLEAN && !value.isArray())
        value.get(isTrue);
    return isTrue;
}

}  // namespace

CIMConstClass::CIMConstClass(const CIMName& className, const CIMName& superClassName)
    : body(new ClassBody(requireName(className, kHandleClass), superClassName)) {}

CIMConstClass::CIMConstClass(const CIMObject& object) {
    if (!object.isClass())
        throw TypeMismatchException("The object is an instance of " +
                                    object.getClassName().getString() + ", not a class");
    body = BodyRef<ClassBody>(object.body.get());
}

CIMConstClass::CIMConstClass(ClassBody* newBody) : body(newBody) {}

ClassBody& CIMConstClass::access() const {
    return requireBody(body, kHandleClass);
}

const CIMName& CIMConstClass::getClassName() const {
    return access().className;
}

const CIMName& CIMConstClass::getSuperClassName() const {
    return access().superClassName;
}

Boolean CIMConstClass::isAssociation() const {
    static const CIMName kAssociation("Association");
    return isQualifiedTrue(access(), kAssociation);
}

Boolean CIMConstClass::isAbstract() const {
    static const CIMName kAbstract("Abstract");
    return isQualifiedTrue(access(), kAbstract);
}

Uint32 CIMConstClass::findQualifier(const CIMName& name) const {
    return access().qualifiers.find(name);
}

CIMConstQualifier CIMConstClass::getQualifier(Uint32 index) const {
    return access().qualifiers.at(index);
}

Uint32 CIMConstClass::getQualifierCount() const {
    return access().qualifiers.size();
}

Uint32 CIMConstClass::findProperty(const CIMName& name) const {
    return access().properties.find(name);
}

CIMConstProperty CIMConstClass::getProperty(Uint32 index) const {
    return access().properties.at(index);
}

Uint32 CIMConstClass::getPropertyCount() const {
    return access().properties.size();
}

CIMClass CIMConstClass::clone() const {
    return CIMClass(new ClassBody(access()));
}

void CIMClass::setSuperClassName(const CIMName& name) {
    access().superClassName = name;
}

CIMClass& CIMClass::addQualifier(CIMQualifier qualifier) {
    access().addQualifier(std::move(qualifier));
    return *this;
}

CIMClass& CIMClass::addProperty(CIMProperty property) {
    access().addProperty(std::move(property));
    return *this;
}

CIMQualifier CIMClass::getQualifier(Uint32 index) {
    return access().qualifiers.at(index);
}

CIMProperty CIMClass::getProperty(Uint32 index) {
    return access().properties.changeable(index);
}

}  // namespace Pegasus
