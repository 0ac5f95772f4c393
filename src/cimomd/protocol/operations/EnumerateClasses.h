#pragma once

// The subclasses of a class, or the top classes of a namespace.

#include "protocol/Operation.h"

namespace cimomd {

/// Without ClassName the classes without a superclass; with DeepInheritance all their descendants.
class EnumerateClasses : public Operation {
  public:
    const char* name() const override { return "EnumerateClasses"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
