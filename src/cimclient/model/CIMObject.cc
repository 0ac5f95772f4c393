#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>

#include "ClassBody.h"
#include "Handle.h"
#include "InstanceBody.h"

namespace Pegasus {

namespace {

constexpr const char* kHandleClass = "CIMObject";

}  // namespace

CIMObject::CIMObject(const CIMClass& cimClass) : body(&cimClass.access()) {}

CIMObject::CIMObject(const CIMInstance& instance) : body(&instance.access()) {}

CIMObject::CIMObject(ObjectBody* newBody) : body(newBody) {}

ObjectBody& CIMObject::access() const {
    return requireBody(body, kHandleClass);
}

Boolean CIMObject::isClass() const {
    return access().isClass();
}

Boolean CIMObject::isInstance() const {
    return !access().isClass();
}

const CIMName& CIMObject::getClassName() const {
    return access().className;
}

Uint32 CIMObject::findProperty(const CIMName& name) const {
    return access().properties.find(name);
}

CIMConstProperty CIMObject::getProperty(Uint32 index) const {
    return access().properties.at(index);
}

Uint32 CIMObject::getPropertyCount() const {
    return access().properties.size();
}

CIMObject CIMObject::clone() const {
    return CIMObject(access().clone().release());
}

}  // namespace Pegasus
