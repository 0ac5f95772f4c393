#pragma once

// Names for the numbers in which ARM processors tell who made them (the MIDR register).

#include <optional>
#include <string_view>

namespace cimomd {

/// The maker, from the text of "CPU implementer" in /proc/cpuinfo ("0x41"); nothing for unknown
/// ones.
std::optional<std::string_view> armImplementerName(std::string_view implementer);

/// The core, from the texts of "CPU implementer" and "CPU part".
std::optional<std::string_view> armPartName(std::string_view implementer, std::string_view part);

}  // namespace cimomd
