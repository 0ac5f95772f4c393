#pragma once

// Checks values against the type of their attribute.

#include <optional>
#include <string>

#include "mifreader/Document.h"
#include "mifreader/Tolerance.h"

namespace Mif {

class ValueChecker {
  public:
    explicit ValueChecker(Tolerances theTolerances) : tolerances(theTolerances) {}

    // Throws Error at the value when it does not fit.
    void check(const Value& value, const Type& type) const;

    // Why the value does not fit; none when it does. Omitted, unsupported and asked values fit
    // every type.
    std::optional<std::string> refusalOf(const Value& value, const Type& type) const;

  private:
    std::optional<std::string> refusalOfInteger(const Value& value, Type::Base base) const;
    std::optional<std::string> refusalOfLength(const Value& value, const Type& type) const;
    std::optional<std::string> refusalOfDate(const Value& value) const;

    Tolerances tolerances;
};

}  // namespace Mif
