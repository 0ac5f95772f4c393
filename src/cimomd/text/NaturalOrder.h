#pragma once

// The order people expect of names that hold numbers: eth2 before eth10.

#include <string_view>

namespace cimomd {

/// Whether `a` comes before `b`: runs of decimal digits compare by their numbers, of any length,
/// everything else by its bytes. Names that differ only in leading zeros compare by their bytes, so
/// that the order is total.
bool naturallyBefore(std::string_view a, std::string_view b);

}  // namespace cimomd
