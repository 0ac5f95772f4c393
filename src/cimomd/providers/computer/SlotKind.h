#pragma once

// Kinds of slots: from the numbers of DSP0134 to what CIM_Slot says.

#include <cstdint>
#include <optional>
#include <string>

namespace cimomd {

/// CIM_PhysicalConnector.ConnectorLayout of a slot of that type.
std::uint16_t connectorLayoutOf(std::uint8_t slotType);

/// The usual name of what fits into a slot of that type; nothing for a type without one.
std::optional<std::string> slotTypeName(std::uint8_t slotType);

/// The bits of a parallel bus; nothing when the number of DSP0134 means anything else.
std::optional<std::uint16_t> dataBitsOf(std::uint8_t dataBusWidth);

/// The lanes of a serial link; nothing when the number of DSP0134 means anything else.
std::optional<std::uint16_t> lanesOf(std::uint8_t dataBusWidth);

}  // namespace cimomd
