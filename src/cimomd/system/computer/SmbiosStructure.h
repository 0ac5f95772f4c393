#pragma once

// One structure of the SMBIOS tables (DSP0134): a formatted area of fixed places and a set of
// texts that it refers to by number. What firmware writes is not to be trusted: a field beyond the
// formatted area does not exist, whatever the structure's version promises.

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

/// Offsets count from the start of the structure, as the tables of the standard do.
class SmbiosStructure {
  public:
    /// The first bytes of every structure: type, length and handle.
    static constexpr std::size_t kHeaderBytes = 4;

    /// `formattedArea` with its header, which must be whole; `texts` in their order.
    SmbiosStructure(std::string_view formattedArea, std::vector<std::string> textSet);

    std::uint8_t type() const { return static_cast<std::uint8_t>(area[0]); }
    std::uint16_t handle() const { return static_cast<std::uint16_t>(*number(2, 2)); }
    /// Of the formatted area, in bytes.
    std::size_t length() const { return area.size(); }

    // A number, little-endian; Absent when it does not lie within the formatted area as a whole.
    Fact<std::uint8_t> byte(std::size_t offset) const;
    Fact<std::uint16_t> word(std::size_t offset) const;
    Fact<std::uint32_t> doubleWord(std::size_t offset) const;

    /// `count` bytes as they stand; Absent as for numbers.
    Fact<std::string> bytes(std::size_t offset, std::size_t count) const;

    /// The text whose number stands at `offset`, without outer blanks. Absent when the number is 0
    /// or does not exist, Unreadable when there is no such text, Filtered for a placeholder.
    Fact<std::string> text(std::size_t offset) const;

  private:
    Fact<std::uint64_t> number(std::size_t offset, std::size_t width) const;

    std::string area;
    std::vector<std::string> texts;
};

}  // namespace cimomd
