#pragma once

// Sizes in a unit that 32 bits hold, for properties beside those that count bytes.

#include <Pegasus/Common/Config.h>

#include <cstdint>
#include <limits>
#include <optional>

#include "system/Fact.h"

namespace cimomd {

/// `bytes` in units of 1,048,576, rounded down; filtered when that is beyond 32 bits.
inline Fact<Pegasus::Uint32> megabytesOf(const Fact<std::uint64_t>& bytes) {
    return bytes.then([](std::uint64_t count) -> std::optional<Pegasus::Uint32> {
        const std::uint64_t megabytes = count >> 20U;
        if (megabytes > std::numeric_limits<Pegasus::Uint32>::max())
            return std::nullopt;
        return static_cast<Pegasus::Uint32>(megabytes);
    });
}

}  // namespace cimomd
