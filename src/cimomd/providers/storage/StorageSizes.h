#pragma once

// Sizes in units whose numbers fit 31 bits: what is written as a signed number of 32 bits stays
// whole.

#include <cstdint>

#include "system/Fact.h"

namespace cimomd {

/// Bytes in units of 2^20, rounded down; filtered when that needs more than 31 bits.
Fact<std::uint32_t> mebibytesOf(const Fact<std::uint64_t>& bytes);

/// Bytes in units of 10^6, as makers of disks count; otherwise the same.
Fact<std::uint32_t> decimalMegabytesOf(const Fact<std::uint64_t>& bytes);

/// Sectors of 512 bytes, which must fit 64 bits as bytes.
Fact<std::uint64_t> bytesOfSectors(const Fact<std::uint64_t>& sectors);

/// A number that fits 31 bits; any other is filtered.
Fact<std::uint32_t> narrowed(const Fact<std::uint64_t>& number);

}  // namespace cimomd
