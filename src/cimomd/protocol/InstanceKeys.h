#pragma once

// The keys by which a client names an instance.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <vector>

namespace cimomd {

class InstanceKeys {
  public:
    /// Checks the keys of `name` against the class: raises Pegasus::CIMException with
    /// CIM_ERR_INVALID_PARAMETER when one is missing, unknown or of another kind than its property.
    /// A single key without a name is that of a class with one key. References without a namespace
    /// lie in `nameSpace`.
    InstanceKeys(const Pegasus::CIMConstClass& cimClass, const Pegasus::CIMObjectPath& name,
                 const Pegasus::CIMNamespaceName& nameSpace);

    /// Whether the instance at `path` has these keys. Numbers compare as numbers, references as
    /// paths, and the order of keys does not matter.
    bool match(const Pegasus::CIMObjectPath& path) const;

  private:
    Pegasus::CIMKeyBinding absolute(const Pegasus::CIMKeyBinding& key) const;

    Pegasus::CIMNamespaceName nameSpace;
    std::vector<Pegasus::CIMKeyBinding> keys;
};

}  // namespace cimomd
