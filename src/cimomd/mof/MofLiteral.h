#pragma once

// A value as a MOF text writes it, before it is fitted to a CIM type.

#include <cstdint>
#include <string>
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

using MofScalar = std::variant<MofNull, bool, MofInteger, double, std::string, MofChar>;

struct MofElement {
    MofScalar value;
    MofPosition position;
    /// The words of the value, for messages.
    std::string text;
};

/// One scalar, or the elements between braces.
struct MofLiteral {
    bool isArray = false;
    std::vector<MofElement> elements;
    MofPosition position;
};

}  // namespace cimomd
