#pragma once

// Numbers into the types that CIM properties have.

#include <optional>
#include <utility>

namespace cimomd {

/// `value` as a Number; nothing when it does not fit. Made for Fact::then.
template <typename Number, typename Wide>
std::optional<Number> narrowedTo(Wide value) {
    if (!std::in_range<Number>(value))
        return std::nullopt;
    return static_cast<Number>(value);
}

}  // namespace cimomd
