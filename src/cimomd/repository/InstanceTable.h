#pragma once

// The instances of one class that MOF files declared, found by their keys.

#include <Pegasus/Common/CIMInstance.h>

#include <map>
#include <string>
#include <vector>

#include "model/InstancePacker.h"

namespace cimomd {

class InstanceTable {
  public:
    /// `instance` has its path set. False, and adds nothing, when there is one with these keys.
    bool add(const Pegasus::CIMInstance& instance);

    /// In the order they were added in.
    const std::vector<Pegasus::CIMConstInstance>& all() const { return instances; }

    /// Null when none has these keys. `nameSpace` is what references in them are relative to.
    const Pegasus::CIMConstInstance* find(const Pegasus::CIMNamespaceName& nameSpace,
                                          const Pegasus::Array<Pegasus::CIMKeyBinding>& keys) const;

  private:
    Pegasus::InstancePacker packer;
    std::vector<Pegasus::CIMConstInstance> instances;
    std::map<std::string, std::size_t> indexByKeys;
};

}  // namespace cimomd
