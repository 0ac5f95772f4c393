// The shape of a synthetic inventory: its classes, their properties and what these may hold.

#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace bench {

enum class Kind {
    Text,
    Enumeration,
    EnumerationArray,
    TextArray,
    DateTime,
    Uint32,
    Uint64,
    Sint64,
    Boolean,
    Real32,
    Real64
};

struct SyntheticProperty {
    std::string name;
    Kind kind;
    bool isKey;

    /// As CIM names it, without its being an array: "uint16".
    const char* type() const;
    bool isArray() const { return kind == Kind::EnumerationArray || kind == Kind::TextArray; }
    bool isEnumerated() const {
        return kind == Kind::Enumeration || kind == Kind::EnumerationArray;
    }
};

struct SyntheticClass {
    std::string name;
    /// What an instance has: kinds in turns of twenty, eight texts (the first is the key),
    /// two enumerated integers, an array of these, an array of texts, a date and seven other
    /// scalars.
    std::vector<SyntheticProperty> properties;
    /// What the class has from others and no instance has a value for.
    std::vector<SyntheticProperty> inherited;
};

/// The texts of enumerated integers, whose numbers are the places in it.
const std::vector<std::string>& stateTexts();

/// The class of this number with so many properties: 1 to 300.
SyntheticClass makeClass(std::size_t number, std::size_t properties);

}  // namespace bench
