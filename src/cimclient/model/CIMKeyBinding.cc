#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>

#include <charconv>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "Utf16.h"

namespace Pegasus {

namespace {

CIMKeyBinding::Type keyTypeOf(const CIMName& name, const CIMValue& value) {
    if (!value.isNull() && !value.isArray()) {
        const CIMType type = value.getType();
        if (type == CIMTYPE_BOOLEAN)
            return CIMKeyBinding::BOOLEAN;
        if (type >= CIMTYPE_UINT8 && type <= CIMTYPE_SINT64)
            return CIMKeyBinding::NUMERIC;
        if (type == CIMTYPE_CHAR16 || type == CIMTYPE_STRING || type == CIMTYPE_DATETIME)
            return CIMKeyBinding::STRING;
        if (type == CIMTYPE_REFERENCE)
            return CIMKeyBinding::REFERENCE;
    }
    throw TypeMismatchException("The value of key " + name.getString() +
                                " cannot be part of a path: it is null, an array, a real or an "
                                "embedded object");
}

struct Integer {
    Boolean negative;
    Uint64 magnitude;
    bool operator==(const Integer&) const = default;
};

/// Decimal or 0x hexadecimal with an optional sign.
std::optional<Integer> parseInteger(const String& text) {
    const std::string utf8 = encodeUtf8(text.getChar16Data(), text.size());
    std::string_view digits(utf8);
    const Boolean negative = digits.starts_with('-');
    if (negative || digits.starts_with('+'))
        digits.remove_prefix(1);
    const Boolean hexadecimal = digits.starts_with("0x") || digits.starts_with("0X");
    if (hexadecimal)
        digits.remove_prefix(2);
    Uint64 magnitude = 0;
    const char* const end = digits.data() + digits.size();
    const auto [stop, error] =
        std::from_chars(digits.data(), end, magnitude, hexadecimal ? 16 : 10);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return Integer{negative && magnitude != 0, magnitude};
}

Boolean equalNumbers(const String& a, const String& b) {
    const std::optional<Integer> numberA = parseInteger(a);
    return numberA && numberA == parseInteger(b);
}

Boolean equalPaths(const String& a, const String& b) {
    try {
        return CIMObjectPath(a).identical(CIMObjectPath(b));
    } catch (const MalformedObjectNameException&) {
        return false;
    }
}

}  // namespace

CIMKeyBinding::CIMKeyBinding(CIMName name, String value, Type type)
    : name(std::move(name)), value(std::move(value)), type(type) {}

CIMKeyBinding::CIMKeyBinding(CIMName name, const CIMValue& value)
    : name(std::move(name)), type(keyTypeOf(this->name, value)) {
    this->value = value.toString();
}

void CIMKeyBinding::setName(CIMName newName) {
    name = std::move(newName);
}

void CIMKeyBinding::setValue(String newValue) {
    value = std::move(newValue);
}

void CIMKeyBinding::setType(Type newType) {
    type = newType;
}

Boolean CIMKeyBinding::equal(const CIMKeyBinding& other) const {
    if (type != other.type || !name.equal(other.name))
        return false;
    if (value == other.value)
        return true;
    switch (type) {
        case BOOLEAN:
            return String::equalNoCase(value, other.value);
        case NUMERIC:
            return equalNumbers(value, other.value);
        case REFERENCE:
            return equalPaths(value, other.value);
        case STRING:
            break;
    }
    return false;
}

}  // namespace Pegasus
