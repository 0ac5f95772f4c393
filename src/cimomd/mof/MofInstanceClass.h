#pragma once

// What the instances of one class have in common: their properties with the defaults.

#include <Pegasus/Common/CIMClass.h>

#include <map>
#include <optional>
#include <vector>

#include "repository/NameOrder.h"

namespace cimomd {

class MofInstanceClass {
  public:
    explicit MofInstanceClass(const Pegasus::CIMConstClass& cimClass);

    /// All properties of the class without qualifiers; instances share those they do not change.
    const std::vector<Pegasus::CIMProperty>& defaults() const { return properties; }
    /// Positions in defaults(), in ascending order.
    const std::vector<std::size_t>& keys() const { return keyPositions; }
    std::optional<std::size_t> find(const Pegasus::CIMName& property) const;

  private:
    std::vector<Pegasus::CIMProperty> properties;
    std::vector<std::size_t> keyPositions;
    std::map<Pegasus::CIMName, std::size_t, NameOrder> positions;
};

/// A property of an instance with `value`, in all else as `original`.
Pegasus::CIMProperty withValue(const Pegasus::CIMConstProperty& original,
                               const Pegasus::CIMValue& value);

}  // namespace cimomd
