#pragma once

// One intrinsic operation of DSP0200.

#include <memory>

#include "protocol/Answer.h"
#include "protocol/Model.h"
#include "xml/CimRequest.h"

namespace cimomd {

/// Operations keep no state and may be started from several threads at once.
class Operation {
  public:
    virtual ~Operation() = default;

    /// As DSP0200 spells it; static text.
    virtual const char* name() const = 0;

    /// The namespace of the request exists in the model. Raises Pegasus::CIMException for missing
    /// or wrong parameters; the answer may raise too, when it is read.
    virtual std::unique_ptr<Answer> start(const Pegasus::CimRequest& request,
                                          const Model& model) const = 0;

  protected:
    Operation() = default;
    Operation(const Operation&) = default;
    Operation& operator=(const Operation&) = default;
};

}  // namespace cimomd
