// What the copies of a CIMInstance share.
#pragma once

#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <memory>

#include "ObjectBody.h"

namespace Pegasus {

class InstanceBody : public ObjectBody {
  public:
    using ObjectBody::ObjectBody;

    Boolean isClass() const override { return false; }
    std::unique_ptr<ObjectBody> clone() const override {
        auto copy = std::make_unique<InstanceBody>(*this);
        copy->path = path.clone();
        return copy;
    }

    CIMObjectPath path;
};

/// A handle on `body`, which it takes.
CIMInstance makeInstance(std::unique_ptr<InstanceBody> body);
CIMInstance makeInstance(const CIMName& className, BodyRef<PackedProperties> properties);

}  // namespace Pegasus
