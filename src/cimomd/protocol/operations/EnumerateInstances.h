#pragma once

// The instances of a class and of all its subclasses.

#include "protocol/Operation.h"

namespace cimomd {

/// Two parameters that DSP0200 has deprecated are checked but have no effect: LocalOnly, since its
/// default would hide what most clients ask for, and IncludeQualifiers, since clients have the
/// qualifiers from the class. One class whose provider fails makes the operation fail: an answer
/// cannot tell that it is partial.
class EnumerateInstances : public Operation {
  public:
    const char* name() const override { return "EnumerateInstances"; }
    std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                  const Model& model) const override;
};

}  // namespace cimomd
