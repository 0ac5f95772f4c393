#pragma once

// The order in which the kernel counts its devices: sda, sdb, sdaa; nvme2n1, nvme10n1.

#include <string_view>

namespace cimomd {

/// Whether the device called `a` comes before the one called `b`: the one with fewer characters
/// before its first digit, else by the numbers in the names. The order is total.
bool deviceNameLess(std::string_view a, std::string_view b);

}  // namespace cimomd
