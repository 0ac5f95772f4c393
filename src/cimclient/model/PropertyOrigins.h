// Tells instances which of its ancestors a class has its properties from.
#pragma once

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>

#include <memory>
#include <utility>

#include "InstanceShape.h"

namespace Pegasus {

class PropertyOrigins {
  public:
    explicit PropertyOrigins(CIMConstClass instancesClass) : cimClass(std::move(instancesClass)) {}

    /// Gives the properties of `instance` class origin and propagation as the class has them.
    /// Raises Exception for a property that the class does not have.
    void set(CIMInstance& instance);

  private:
    CIMConstProperty inClass(const CIMName& name) const;
    std::shared_ptr<const InstanceShape> withOrigins(const InstanceShape& shape) const;

    CIMConstClass cimClass;
    /// Instances one after the other mostly have the same shape.
    std::shared_ptr<const InstanceShape> latest;
    std::shared_ptr<const InstanceShape> latestWithOrigins;
};

}  // namespace Pegasus
