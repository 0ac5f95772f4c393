#pragma once

// How devices are called in captions.

#include <optional>
#include <string>

#include "system/Fact.h"

namespace cimomd {

/// Vendor and product as "8086:15f3"; missing when one of them is.
Fact<std::string> hardwareIdOf(const Fact<std::uint16_t>& vendor,
                               const Fact<std::uint16_t>& product);

/// Maker and product as far as known, else `fallback`. A maker that the product's name begins with
/// is not said twice.
std::string titleOf(const std::optional<std::string>& maker,
                    const std::optional<std::string>& product, const std::string& fallback);

}  // namespace cimomd
