// What the copies of a CIMClass share.
#pragma once

#include <Pegasus/Common/CIMName.h>

#include <memory>
#include <utility>

#include "ObjectBody.h"

namespace Pegasus {

class ClassBody : public ObjectBody {
  public:
    ClassBody(CIMName className, CIMName superClassName)
        : ObjectBody(std::move(className)), superClassName(std::move(superClassName)) {}

    Boolean isClass() const override { return true; }
    std::unique_ptr<ObjectBody> clone() const override {
        return std::make_unique<ClassBody>(*this);
    }

    CIMName superClassName;
};

}  // namespace Pegasus
