#include "mof/MofValue.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <cmath>
#include <limits>

#include "mof/MofError.h"
#include "mof/MofToken.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::Array;
using Pegasus::CIMValue;

/// Turns the elements of one literal into values of the C++ type T.
template <typename T>
class ElementReader {
  public:
    ElementReader(const MofType& type, std::string_view file) : type(type), file(file) {}

    T read(const MofElement& element) const;

  private:
    T readInteger(const MofElement& element, const MofInteger& integer) const {
        constexpr auto kMax = static_cast<std::uint64_t>(std::numeric_limits<T>::max());
        constexpr std::uint64_t kLargestNegative = std::is_signed_v<T> ? kMax + 1 : 0;
        if (integer.magnitude > (integer.negative ? kLargestNegative : kMax))
            fail(element);
        return static_cast<T>(integer.negative ? 0 - integer.magnitude : integer.magnitude);
    }

    T readReal(const MofElement& element, double real) const {
        if (std::abs(real) > static_cast<double>(std::numeric_limits<T>::max()))
            fail(element);
        return static_cast<T>(real);
    }

    [[noreturn]] void fail(const MofElement& element) const {
        throw MofError(file, element.position, quotedText(element.text), expectation());
    }

    std::string expectation() const {
        const char* name = Pegasus::cimTypeToString(type.type);
        if constexpr (std::is_integral_v<T> && !std::is_same_v<T, bool>)
            return fmt::format("a {} ({} to {})", name, +std::numeric_limits<T>::min(),
                               +std::numeric_limits<T>::max());
        return fmt::format("a {}", name);
    }

    const MofType& type;
    std::string_view file;
};

template <typename T>
T ElementReader<T>::read(const MofElement& element) const {
    if (const auto* integer = std::get_if<MofInteger>(&element.value)) {
        if constexpr (std::is_integral_v<T> && !std::is_same_v<T, bool>)
            return readInteger(element, *integer);
        else if constexpr (std::is_floating_point_v<T>)
            return readReal(element, integer->negative ? -static_cast<double>(integer->magnitude)
                                                       : static_cast<double>(integer->magnitude));
    }
    if constexpr (std::is_floating_point_v<T>) {
        if (const auto* real = std::get_if<double>(&element.value))
            return readReal(element, *real);
    }
    if constexpr (std::is_same_v<T, bool>) {
        if (const auto* boolean = std::get_if<bool>(&element.value))
            return *boolean;
    }
    fail(element);
}

template <>
Pegasus::String ElementReader<Pegasus::String>::read(const MofElement& element) const {
    if (const auto* text = std::get_if<std::string>(&element.value))
        return cimString(*text);
    fail(element);
}

template <>
Pegasus::Char16 ElementReader<Pegasus::Char16>::read(const MofElement& element) const {
    const auto* character = std::get_if<MofChar>(&element.value);
    if (character == nullptr)
        fail(element);
    const Pegasus::String text = cimString(character->character);
    if (text.size() != 1)
        fail(element);
    return text[0];
}

/// A datetime or a reference: a text that the class T reads itself.
template <typename T>
T readParsed(const MofElement& element, const MofType& type, std::string_view file) {
    if (const auto* text = std::get_if<std::string>(&element.value)) {
        try {
            return T(cimString(*text));
        } catch (const Pegasus::Exception&) {
            throw MofError(file, element.position, quotedText(element.text),
                           fmt::format("a {}", Pegasus::cimTypeToString(type.type)));
        }
    }
    throw MofError(file, element.position, quotedText(element.text),
                   fmt::format("a {} in quotes", Pegasus::cimTypeToString(type.type)));
}

template <>
Pegasus::CIMDateTime ElementReader<Pegasus::CIMDateTime>::read(const MofElement& element) const {
    return readParsed<Pegasus::CIMDateTime>(element, type, file);
}

template <>
Pegasus::CIMObjectPath ElementReader<Pegasus::CIMObjectPath>::read(
    const MofElement& element) const {
    return readParsed<Pegasus::CIMObjectPath>(element, type, file);
}

template <typename T>
CIMValue valueOf(const MofLiteral& literal, const MofType& type, std::string_view file) {
    const ElementReader<T> reader(type, file);
    if (!type.isArray)
        return CIMValue(reader.read(literal.elements.front()));
    Array<T> elements;
    for (const MofElement& element : literal.elements)
        elements.append(reader.read(element));
    return CIMValue(elements);
}

bool isNull(const MofLiteral& literal) {
    return !literal.isArray && std::holds_alternative<MofNull>(literal.elements.front().value);
}

}  // namespace

CIMValue nullOf(const MofType& type) {
    return CIMValue(type.type, type.isArray, type.arraySize);
}

CIMValue cimValueOf(const MofLiteral& literal, const MofType& type, std::string_view file) {
    if (isNull(literal))
        return nullOf(type);
    if (literal.isArray != type.isArray)
        throw MofError(file, literal.position,
                       literal.isArray ? "'{'" : quotedText(literal.elements[0].text),
                       fmt::format("{} {}", type.isArray ? "an array of" : "one",
                                   Pegasus::cimTypeToString(type.type)));
    if (type.arraySize != 0 && literal.elements.size() > type.arraySize)
        throw MofError(file, literal.elements[type.arraySize].position,
                       quotedText(literal.elements[type.arraySize].text),
                       fmt::format("at most {} elements", type.arraySize));
    switch (type.type) {
        case Pegasus::CIMTYPE_BOOLEAN:
            return valueOf<Pegasus::Boolean>(literal, type, file);
        case Pegasus::CIMTYPE_UINT8:
            return valueOf<Pegasus::Uint8>(literal, type, file);
        case Pegasus::CIMTYPE_SINT8:
            return valueOf<Pegasus::Sint8>(literal, type, file);
        case Pegasus::CIMTYPE_UINT16:
            return valueOf<Pegasus::Uint16>(literal, type, file);
        case Pegasus::CIMTYPE_SINT16:
            return valueOf<Pegasus::Sint16>(literal, type, file);
        case Pegasus::CIMTYPE_UINT32:
            return valueOf<Pegasus::Uint32>(literal, type, file);
        case Pegasus::CIMTYPE_SINT32:
            return valueOf<Pegasus::Sint32>(literal, type, file);
        case Pegasus::CIMTYPE_UINT64:
            return valueOf<Pegasus::Uint64>(literal, type, file);
        case Pegasus::CIMTYPE_SINT64:
            return valueOf<Pegasus::Sint64>(literal, type, file);
        case Pegasus::CIMTYPE_REAL32:
            return valueOf<Pegasus::Real32>(literal, type, file);
        case Pegasus::CIMTYPE_REAL64:
            return valueOf<Pegasus::Real64>(literal, type, file);
        case Pegasus::CIMTYPE_CHAR16:
            return valueOf<Pegasus::Char16>(literal, type, file);
        case Pegasus::CIMTYPE_DATETIME:
            return valueOf<Pegasus::CIMDateTime>(literal, type, file);
        case Pegasus::CIMTYPE_REFERENCE:
            return valueOf<Pegasus::CIMObjectPath>(literal, type, file);
        default:
            return valueOf<Pegasus::String>(literal, type, file);
    }
}

}  // namespace cimomd
