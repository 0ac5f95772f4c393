#pragma once

// From a decoded operation (DSP0200) to its answer: checks it, then asks the repository or the
// providers. Knows nothing of HTTP. May be called from several threads at once.

#include <memory>

#include "protocol/Answer.h"
#include "protocol/InstancesAnswer.h"
#include "providers/ProviderList.h"
#include "repository/ClassRepository.h"
#include "xml/CimRequest.h"

namespace cimomd {

class Dispatcher {
  public:
    /// Both must outlive the dispatcher and its answers, and stay as they are.
    Dispatcher(const ClassRepository& classRepository, const ProviderList& providerList)
        : repository(classRepository), providers(providerList) {}

    /// Raises Pegasus::CIMException: 7 for an operation that is not served, 3 for an unknown
    /// namespace, 4 for missing or wrong parameters, 6 (GetClass) or 5 (EnumerateInstances) for an
    /// unknown class. The answer may raise too, when it is read.
    std::unique_ptr<Answer> dispatch(const Pegasus::CimRequest& request) const;

  private:
    std::unique_ptr<Answer> getClass(const Pegasus::CimRequest& request) const;
    std::unique_ptr<Answer> enumerateInstances(const Pegasus::CimRequest& request) const;
    std::vector<ProvidedClass> providedClasses(const Pegasus::CIMNamespaceName& nameSpace,
                                               const Pegasus::CIMName& className) const;

    const ClassRepository& repository;
    const ProviderList& providers;
};

}  // namespace cimomd
