#pragma once

// The names of what EnumerateClasses gives.

#include "protocol/Operation.h"

namespace cimomd {

class EnumerateClassNames : public Operation {
  public:
    const char* name() const override { return "EnumerateClassNames"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
