#pragma once

// One class of a namespace.

#include "protocol/Operation.h"

namespace cimomd {

class GetClass : public Operation {
  public:
    const char* name() const override { return "GetClass"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
