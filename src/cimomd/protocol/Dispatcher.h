#pragma once

// From a decoded operation (DSP0200) to its answer. Knows nothing of HTTP. May be called from
// several threads at once.

#include <memory>
#include <vector>

#include "protocol/Operation.h"
#include "repository/CurrentRepository.h"
#include "xml/CimRequest.h"

namespace cimomd {

class Dispatcher {
  public:
    /// Both must outlive the dispatcher and its answers.
    Dispatcher(const CurrentRepository& currentClasses, const ProviderIndex& providerIndex);

    /// Raises Pegasus::CIMException: 7 for an operation that is not served (methods of classes
    /// among them), 3 for an unknown namespace, and what the operation raises. The answer may
    /// raise too, when it is read.
    std::unique_ptr<Answer> dispatch(const Pegasus::CimRequest& request) const;

  private:
    const Operation& operationFor(const Pegasus::CimRequest& request) const;

    const CurrentRepository& repository;
    const ProviderIndex& providers;
    std::vector<std::unique_ptr<const Operation>> operations;
};

}  // namespace cimomd
