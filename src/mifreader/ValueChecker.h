#pragma once

// Checks values against the type of their attribute.

#include "mifreader/Document.h"
#include "mifreader/Tolerance.h"

namespace Mif {

class ValueChecker {
  public:
    explicit ValueChecker(Tolerances theTolerances) : tolerances(theTolerances) {}

    // Throws Error at the value when it does not fit. Omitted, unsupported and asked values fit
    // every type.
    void check(const Value& value, const Type& type) const;

  private:
    void checkInteger(const Value& value, Type::Base base) const;
    void checkLength(const Value& value, const Type& type) const;
    void checkDate(const Value& value) const;

    Tolerances tolerances;
};

}  // namespace Mif
