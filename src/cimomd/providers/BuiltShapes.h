#pragma once

// What the instances that a provider makes have in common, made once and not for each of them.

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMType.h>

#include <memory>
#include <unordered_map>
#include <vector>

#include "model/InstanceShape.h"

namespace cimomd {

struct BuiltProperty {
    /// Static text.
    const char* name;
    Pegasus::CIMType type;
    bool isArray;

    bool operator==(const BuiltProperty&) const = default;
};

struct BuiltShape {
    Pegasus::CIMName className;
    std::vector<BuiltProperty> properties;
    std::shared_ptr<const Pegasus::InstanceShape> shape;
};

class BuiltShapes {
  public:
    /// `className` is a static text. Valid until the next call. Raises std::logic_error when two
    /// properties have the same name.
    const BuiltShape& find(const char* className, const std::vector<BuiltProperty>& properties);

  private:
    /// The latest of each class.
    std::unordered_map<const char*, BuiltShape> shapes;
};

}  // namespace cimomd
