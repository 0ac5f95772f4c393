#pragma once

// A value as a MOF text writes it, before it is fitted to a CIM type.

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "mof/MofPosition.h"

namespace cimomd {

struct MofNull {};

struct MofInteger {
    bool negative = false;
    std::uint64_t magnitude = 0;
};

struct MofChar {
    /// One character in UTF-8.
    std::string character;
};

/// The instance declared `as $name`.
struct MofAlias {
    std::string name;
};

using MofScalar = std::variant<MofNull, bool, MofInteger, double, std::string, MofChar, MofAlias>;

struct MofElement {
    MofScalar value;
    MofPosition position;
    /// The first word of the value, for messages. Lives as long as the text that was parsed.
    std::string_view text;
};

/// One scalar, or the elements between braces.
struct MofLiteral {
    bool isArray = false;
    std::vector<MofElement> elements;
    MofPosition position;
};

}  // namespace cimomd
