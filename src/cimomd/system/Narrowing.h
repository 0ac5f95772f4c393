#pragma once

// Numbers into the types that CIM properties have.

#include <cstdint>
#include <limits>
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

/// `value` as a uint32; nothing also when it is above the largest signed number: the formats that
/// inventory is written in have signed integers only, and would make it negative.
template <typename Wide>
std::optional<std::uint32_t> narrowedToCount(Wide value) {
    if (!std::in_range<std::int32_t>(value))
        return std::nullopt;
    return narrowedTo<std::uint32_t>(value);
}

}  // namespace cimomd
