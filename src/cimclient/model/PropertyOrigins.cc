#include "PropertyOrigins.h"

#include <Pegasus/Common/Exception.h>

#include <utility>
#include <vector>

#include "InstanceBody.h"

namespace Pegasus {

void PropertyOrigins::set(CIMInstance& instance) {
    if (PackedProperties* const packed = instance.access().properties.packed()) {
        if (packed->getShape() != latest) {
            latestWithOrigins = withOrigins(*packed->getShape());
            latest = packed->getShape();
        }
        packed->setShape(latestWithOrigins);
        return;
    }
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        CIMProperty property = instance.getProperty(i);
        const CIMConstProperty declared = inClass(property.getName());
        property.setClassOrigin(declared.getClassOrigin());
        property.setPropagated(declared.getPropagated());
    }
}

CIMConstProperty PropertyOrigins::inClass(const CIMName& name) const {
    const Uint32 index = cimClass.findProperty(name);
    if (index == PEG_NOT_FOUND)
        throw Exception("the class has no property " + name.getString());
    return cimClass.getProperty(index);
}

std::shared_ptr<const InstanceShape> PropertyOrigins::withOrigins(
    const InstanceShape& shape) const {
    std::vector<PropertyDeclaration> declarations;
    for (Uint32 i = 0; i < shape.size(); ++i) {
        const CIMConstProperty declared = inClass(shape.at(i).name);
        declarations.push_back(shape.at(i));
        declarations.back().classOrigin = declared.getClassOrigin();
        declarations.back().propagated = declared.getPropagated();
    }
    return std::make_shared<const InstanceShape>(std::move(declarations));
}

}  // namespace Pegasus
