// Makes packed instances of one class.
#pragma once

#include <Pegasus/Common/CIMInstance.h>

#include <memory>
#include <vector>

#include "InstanceShape.h"
#include "PackedProperties.h"

namespace Pegasus {

class InstancePacker {
  public:
    /// An instance with the same path and properties, packed; `instance` itself when it has
    /// anything that cannot be packed.
    CIMConstInstance packed(const CIMConstInstance& instance);

  private:
    Boolean take(const CIMConstProperty& property);
    std::shared_ptr<const InstanceShape> shapeOfTaken();

    PropertyPacker packing;
    std::vector<PropertyDeclaration> taken;
    std::shared_ptr<const InstanceShape> latest;
};

}  // namespace Pegasus
