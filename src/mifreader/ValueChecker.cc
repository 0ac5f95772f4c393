#include "mifreader/ValueChecker.h"

#include <limits>
#include <string_view>

namespace Mif {

namespace {

struct IntegerRange {
    std::uint64_t smallest;  // magnitude of the smallest negative number; 0 where none is allowed
    std::uint64_t largest;
    const char* description;
};

IntegerRange rangeOf(Type::Base base) {
    switch (base) {
        case Type::Base::Integer:
            return {1ULL << 31, (1ULL << 31) - 1, "Integer, 32 bits with sign"};
        case Type::Base::Integer64:
            return {1ULL << 63, (1ULL << 63) - 1, "Integer64, 64 bits with sign"};
        case Type::Base::Gauge:
        case Type::Base::Counter:
            return {0, (1ULL << 32) - 1, "Gauge or Counter, 32 bits without sign"};
        default:
            return {0, std::numeric_limits<std::uint64_t>::max(),
                    "Counter64, 64 bits without sign"};
    }
}

bool isString(Type::Base base) {
    return base == Type::Base::String || base == Type::Base::DisplayString ||
           base == Type::Base::OctetString;
}

struct DateField {
    unsigned int begin;
    unsigned int length;
    int smallest;
    int largest;
};

// yyyymmddHHMMSS.uuuuuu+ooo; a second of 60 is a leap second, the offset counts minutes.
constexpr DateField kDateFields[] = {
    {0, 4, 0, 9999}, {4, 2, 1, 12},  {6, 2, 1, 31},      {8, 2, 0, 23},
    {10, 2, 0, 59},  {12, 2, 0, 60}, {15, 6, 0, 999999}, {22, 3, 0, 999},
};
constexpr std::size_t kDateLength = 25;

bool fitsField(std::string_view text, const DateField& field) {
    const std::string_view digits = text.substr(field.begin, field.length);
    if (digits.find_first_not_of('*') == std::string_view::npos) {
        return true;
    }
    int number = 0;
    for (const char c : digits) {
        if (c < '0' || c > '9') {
            return false;
        }
        number = number * 10 + (c - '0');
    }
    return number >= field.smallest && number <= field.largest;
}

bool isDate(std::string_view text) {
    if (text.size() != kDateLength || text[14] != '.' || (text[21] != '+' && text[21] != '-')) {
        return false;
    }
    for (const DateField& field : kDateFields) {
        if (!fitsField(text, field)) {
            return false;
        }
    }
    return true;
}

}  // namespace

void ValueChecker::check(const Value& value, const Type& type) const {
    if (const std::optional<std::string> refusal = refusalOf(value, type)) {
        throw Error(value.position, *refusal);
    }
}

std::optional<std::string> ValueChecker::refusalOf(const Value& value, const Type& type) const {
    if (value.kind != Value::Kind::Integer && value.kind != Value::Kind::Text) {
        return std::nullopt;
    }
    const bool text = value.kind == Value::Kind::Text;
    if (isString(type.base)) {
        if (text) {
            return refusalOfLength(value, type);
        }
        return tolerances.has(Tolerance::IntegersAsText)
                   ? std::nullopt
                   : std::optional<std::string>("integer where the type is a string");
    }
    if (type.base == Type::Base::Date) {
        return refusalOfDate(value);
    }
    if (!text) {
        return refusalOfInteger(value, type.base);
    }
    return tolerances.has(Tolerance::TextAsIntegers)
               ? std::nullopt
               : std::optional<std::string>("literal where the type is an integer");
}

std::optional<std::string> ValueChecker::refusalOfInteger(const Value& value,
                                                          Type::Base base) const {
    if (base == Type::Base::Integer && tolerances.has(Tolerance::WideIntegers)) {
        return std::nullopt;
    }
    IntegerRange range = rangeOf(base);
    if (base == Type::Base::Integer && tolerances.has(Tolerance::UnsignedIntegers)) {
        range.largest = (1ULL << 32) - 1;
    }
    if (value.magnitude > (value.negative ? range.smallest : range.largest)) {
        return std::string("integer beyond the type ") + range.description;
    }
    return std::nullopt;
}

std::optional<std::string> ValueChecker::refusalOfLength(const Value& value,
                                                         const Type& type) const {
    if (value.text.size() > type.length && !tolerances.has(Tolerance::LongLiterals)) {
        return "literal of " + std::to_string(value.text.size()) +
               " octets where the type allows " + std::to_string(type.length);
    }
    return std::nullopt;
}

std::optional<std::string> ValueChecker::refusalOfDate(const Value& value) const {
    if (tolerances.has(Tolerance::AnyDates)) {
        return std::nullopt;
    }
    if (value.kind == Value::Kind::Text) {
        const bool empty = value.text.empty() && tolerances.has(Tolerance::EmptyDates);
        if (empty || isDate(value.text)) {
            return std::nullopt;
        }
    }
    return "no date of the form yyyymmddHHMMSS.uuuuuu+ooo";
}

}  // namespace Mif
