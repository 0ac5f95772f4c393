#pragma once

// Finds the provider of a class.

#include <Pegasus/Common/CIMName.h>

#include <map>
#include <string>

#include "providers/ProviderList.h"

namespace cimomd {

/// Providers serve one namespace: a class of the same name elsewhere is another class.
class ProviderIndex {
  public:
    /// `providers` must outlive the index and stay as they are.
    ProviderIndex(const ProviderList& providers, const Pegasus::CIMNamespaceName& servedNamespace);

    /// Null when the class has none. The case of names does not matter.
    const Provider* find(const Pegasus::CIMNamespaceName& nameSpace,
                         const Pegasus::CIMName& className) const;

  private:
    Pegasus::CIMNamespaceName served;
    std::map<std::string, const Provider*> byClass;
};

}  // namespace cimomd
