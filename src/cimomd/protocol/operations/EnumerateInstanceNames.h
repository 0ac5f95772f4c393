#pragma once

// The paths of what EnumerateInstances gives.

#include "protocol/Operation.h"

namespace cimomd {

class EnumerateInstanceNames : public Operation {
  public:
    const char* name() const override { return "EnumerateInstanceNames"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
