#pragma once

// The places where a file may leave the grammar and still be read. Products read such files; the
// reader says so only when it is told to, one place at a time.

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string_view>

namespace Mif {

enum class Tolerance : std::uint8_t {
    // CR and LF as they are behind a backslash in a literal: importers take the character, while
    // the escapes \r and \n reach some of them as the letters.
    RawLineEnds,
    // A backslash stands for itself unless CR, LF or a double quote follows it.
    PlainBackslashes,
    // A bare integer where the type is a string: row numbers, and integers that a product wants
    // declared as text.
    IntegersAsText,
    // A literal where the type is an integer: the empty value of a template, and the text of an
    // enumeration that the class definition does not declare.
    TextAsIntegers,
    // Numbers up to 4294967295 where the type is Integer: the low word of a 64-bit value.
    UnsignedIntegers,
    // An empty literal where the type is a date: the value of a template.
    EmptyDates,
    // A literal longer than its type says: the length comes from the class definition, which
    // nothing makes the values keep to.
    LongLiterals,
    // Two attributes of a group with one name: abbreviating comes after the names are made unique.
    RepeatedNames,
    // CR and LF as they are in a literal, without a backslash.
    BareLineEnds,
    // Any number of 64 bits where the type is Integer.
    WideIntegers,
    // Any literal or integer where the type is a date.
    AnyDates,
};

// The name of a tolerance in command lines: "raw-line-ends", "plain-backslashes" and so on.
std::optional<Tolerance> parseTolerance(std::string_view name);

// A set of them.
class Tolerances {
  public:
    Tolerances() = default;
    Tolerances(std::initializer_list<Tolerance> elements) {
        for (const Tolerance element : elements) {
            add(element);
        }
    }
    void add(Tolerance element) { bits |= bit(element); }
    bool has(Tolerance element) const { return (bits & bit(element)) != 0; }

  private:
    static unsigned int bit(Tolerance element) { return 1U << static_cast<unsigned int>(element); }

    unsigned int bits = 0;
};

}  // namespace Mif
