#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>

#include <utility>

#include "Handle.h"
#include "InstanceBody.h"

namespace Pegasus {

namespace {

constexpr const char* kHandleClass = "CIMInstance";

}  // namespace

CIMConstInstance::CIMConstInstance(const CIMName& className)
    : body(new InstanceBody(requireName(className, kHandleClass))) {}

CIMConstInstance::CIMConstInstance(const CIMObject& object) {
    if (!object.isInstance())
        throw TypeMismatchException("The object is the class " + object.getClassName().getString() +
                                    ", not an instance");
    body = BodyRef<InstanceBody>(object.body.get());
}

CIMConstInstance::CIMConstInstance(InstanceBody* newBody) : body(newBody) {}

InstanceBody& CIMConstInstance::access() const {
    return requireBody(body, kHandleClass);
}

const CIMName& CIMConstInstance::getClassName() const {
    return access().className;
}

const CIMObjectPath& CIMConstInstance::getPath() const {
    return access().path;
}

Uint32 CIMConstInstance::findQualifier(const CIMName& name) const {
    return access().qualifiers.find(name);
}

CIMConstQualifier CIMConstInstance::getQualifier(Uint32 index) const {
    return access().qualifiers.at(index);
}

Uint32 CIMConstInstance::getQualifierCount() const {
    return access().qualifiers.size();
}

Uint32 CIMConstInstance::findProperty(const CIMName& name) const {
    return access().properties.find(name);
}

CIMConstProperty CIMConstInstance::getProperty(Uint32 index) const {
    return access().properties.at(index);
}

Uint32 CIMConstInstance::getPropertyCount() const {
    return access().properties.size();
}

CIMInstance CIMConstInstance::clone() const {
    return CIMInstance(static_cast<InstanceBody*>(access().clone().release()));
}

CIMInstance makeInstance(std::unique_ptr<InstanceBody> body) {
    return CIMInstance(body.release());
}

CIMInstance makeInstance(const CIMName& className, BodyRef<PackedProperties> properties) {
    auto body = std::make_unique<InstanceBody>(className);
    body->properties = PropertyStore(std::move(properties));
    return makeInstance(std::move(body));
}

void CIMInstance::setPath(CIMObjectPath path) {
    access().path = std::move(path);
}

CIMInstance& CIMInstance::addQualifier(CIMQualifier qualifier) {
    access().addQualifier(std::move(qualifier));
    return *this;
}

CIMInstance& CIMInstance::addProperty(CIMProperty property) {
    access().addProperty(std::move(property));
    return *this;
}

CIMQualifier CIMInstance::getQualifier(Uint32 index) {
    return access().qualifiers.at(index);
}

CIMProperty CIMInstance::getProperty(Uint32 index) {
    return access().properties.changeable(index);
}

}  // namespace Pegasus
