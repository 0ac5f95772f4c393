// The integer and floating point types of the CIM client library, by the names that CIM uses.
#pragma once

#include <cstdint>

namespace Pegasus {

using Boolean = bool;
using Uint8 = std::uint8_t;
using Sint8 = std::int8_t;
using Uint16 = std::uint16_t;
using Sint16 = std::int16_t;
using Uint32 = std::uint32_t;
using Sint32 = std::int32_t;
using Uint64 = std::uint64_t;
using Sint64 = std::int64_t;
using Real32 = float;
using Real64 = double;

/// What the searches return when there is nothing to be found; as a length it means "to the end".
inline constexpr Uint32 PEG_NOT_FOUND = 0xFFFFFFFFU;

}  // namespace Pegasus
