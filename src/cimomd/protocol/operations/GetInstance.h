#pragma once

// One instance, found by the class it was created of and by all its keys.

#include "protocol/Operation.h"

namespace cimomd {

/// LocalOnly and IncludeQualifiers have no effect, as in EnumerateInstances.
class GetInstance : public Operation {
  public:
    const char* name() const override { return "GetInstance"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
