#pragma once

// What a monitor tells of itself: the first block of its Extended Display Identification Data
// (VESA E-EDID, structures 1.0 to 1.4).

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct Edid {
    /// Three letters that are registered for the maker.
    Fact<std::string> makerCode;
    std::uint16_t productCode = 0;
    /// The text, else the number that stands in for it.
    Fact<std::string> serialNumber;
    /// The year of manufacture, or the year of the model; a monitor tells one of them.
    Fact<std::uint16_t> year;
    Fact<std::uint16_t> modelYear;
    /// 1 to 54.
    Fact<std::uint8_t> week;
    /// The name for customers; panels of portable computers have none.
    Fact<std::string> name;
    /// Texts without a set meaning; there panels have their maker and model.
    std::vector<std::string> texts;
    /// The mode the monitor likes best.
    Fact<std::uint32_t> widthPixels;
    Fact<std::uint32_t> heightPixels;
    /// The picture's size. Projectors have none.
    Fact<std::uint32_t> widthMillimetres;
    Fact<std::uint32_t> heightMillimetres;
    Fact<bool> isColour;
    /// Whether it follows a range of frequencies.
    Fact<bool> hasFrequencyRange;
};

/// Nothing when `bytes` has no whole first block, or one with a wrong head or sum. Further blocks
/// are not looked at.
std::optional<Edid> parseEdid(std::string_view bytes);

}  // namespace cimomd
