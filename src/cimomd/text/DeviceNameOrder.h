#pragma once

// The order in which the kernel counts its devices: sda, sdb, sdaa; nvme2n1, nvme10n1.

#include <string_view>

namespace cimomd {

/// Whether the device called `a` comes before the one called `b`: names are compared piece by
/// piece, runs of digits as numbers, other runs with the shorter one first. Names that differ are
/// never equal.
bool deviceNameLess(std::string_view a, std::string_view b);

}  // namespace cimomd
