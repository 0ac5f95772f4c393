#include "InstancePacker.h"

#include <Pegasus/Common/CIMObjectPath.h>

#include "InstanceBody.h"

namespace Pegasus {

CIMConstInstance InstancePacker::packed(const CIMConstInstance& instance) {
    if (instance.getQualifierCount() != 0)
        return instance;
    packing.start();
    taken.clear();
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        if (!take(instance.getProperty(i)))
            return instance;
    }
    CIMInstance out = makeInstance(instance.getClassName(), packing.finish(shapeOfTaken()));
    out.setPath(instance.getPath());
    return out;
}

Boolean InstancePacker::take(const CIMConstProperty& property) {
    if (!canBePacked(property) || !packing.hasRoom() || !packing.add(property.getValue()))
        return false;
    taken.push_back(declarationOf(property));
    return true;
}

std::shared_ptr<const InstanceShape> InstancePacker::shapeOfTaken() {
    if (!latest || !latest->isOf(taken))
        latest = std::make_shared<const InstanceShape>(taken);
    return latest;
}

}  // namespace Pegasus
