#pragma once

// Sizes in a unit that 32 bits hold, for properties beside those that count bytes.

#include <Pegasus/Common/Config.h>

#include <cstdint>

#include "system/Fact.h"
#include "system/Narrowing.h"

namespace cimomd {

/// `bytes` in units of 1,048,576, rounded down; filtered when that is beyond signed 32 bits.
inline Fact<Pegasus::Uint32> megabytesOf(const Fact<std::uint64_t>& bytes) {
    return bytes.then([](std::uint64_t count) { return narrowedToCount(count >> 20U); });
}

}  // namespace cimomd
