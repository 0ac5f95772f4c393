#include "xml/ScalarParser.h"

#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <charconv>
#include <limits>
#include <string_view>
#include <system_error>
#include <type_traits>
#include <utility>

#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

// Takes a sign off the front of `text`; true for a minus.
bool takeSign(std::string_view& text) {
    if (text.empty() || (text.front() != '+' && text.front() != '-')) {
        return false;
    }
    const bool isNegative = text.front() == '-';
    text.remove_prefix(1);
    return isNegative;
}

bool parseMagnitude(std::string_view digits, Uint64& magnitude) {
    int radix = 10;
    if (digits.starts_with("0x") || digits.starts_with("0X")) {
        radix = 16;
        digits.remove_prefix(2);
    }
    const char* end = digits.data() + digits.size();
    const std::from_chars_result result = std::from_chars(digits.data(), end, magnitude, radix);
    return result.ec == std::errc() && result.ptr == end;
}

template <typename T>
bool parseInteger(std::string_view text, T& value) {
    const bool isNegative = takeSign(text);
    Uint64 magnitude = 0;
    if ((isNegative && std::is_unsigned_v<T>) || !parseMagnitude(text, magnitude)) {
        return false;
    }
    constexpr auto kMax = static_cast<Uint64>(std::numeric_limits<T>::max());
    if (magnitude > kMax + (isNegative ? 1 : 0)) {
        return false;
    }
    // Unsigned negation wraps, which is how the smallest signed number comes out right.
    value = static_cast<T>(isNegative ? 0 - magnitude : magnitude);
    return true;
}

// Whether an unsigned decimal number, not zero, is less than 1. Only asked of numbers of more than
// three hundred digits' magnitude, so the exponent may saturate.
bool isBelowOne(std::string_view number) {
    const std::size_t mark = number.find_first_of("eE");
    const std::string_view mantissa = number.substr(0, mark);
    const std::size_t point = std::min(mantissa.find('.'), mantissa.size());
    const std::size_t first = mantissa.find_first_of("123456789");
    const auto leading =
        static_cast<long long>(point) - static_cast<long long>(first) - (first < point ? 1 : 0);
    if (mark == std::string_view::npos) {
        return leading < 0;
    }
    std::string_view digits = number.substr(mark + 1);
    const bool isNegative = takeSign(digits);
    long long exponent = 0;
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), exponent);
    if (result.ec != std::errc()) {
        return isNegative;
    }
    return isNegative ? leading < exponent : leading < -exponent;
}

template <typename T>
bool parseReal(std::string_view text, T& value) {
    const bool isNegative = takeSign(text);
    // Keeps out the words for infinity and NaN, and a second sign.
    if (text.empty() || (!isDigit(text.front()) && text.front() != '.')) {
        return false;
    }
    const char* end = text.data() + text.size();
    T magnitude = 0;
    const std::from_chars_result result = std::from_chars(text.data(), end, magnitude);
    if (result.ptr != end || result.ec == std::errc::invalid_argument) {
        return false;
    }
    if (result.ec == std::errc::result_out_of_range) {
        if (!isBelowOne(text)) {
            return false;
        }
        magnitude = 0;
    }
    value = isNegative ? -magnitude : magnitude;
    return true;
}

}  // namespace

bool parseScalar(const ElementText& text, Boolean& value) {
    const std::string_view word = trimXmlSpace(text.raw);
    const bool isTrue = equalsIgnoringCase(word, "true");
    if (!isTrue && !equalsIgnoringCase(word, "false")) {
        return false;
    }
    value = isTrue;
    return true;
}

bool parseScalar(const ElementText& text, Uint8& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Sint8& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Uint16& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Sint16& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Uint32& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Sint32& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Uint64& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Sint64& value) {
    return parseInteger(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Real32& value) {
    return parseReal(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Real64& value) {
    return parseReal(trimXmlSpace(text.raw), value);
}

bool parseScalar(const ElementText& text, Char16& value) {
    String character = makeString(text.raw);
    if (character.size() != 1) {
        character = makeString(text.trimmed);
    }
    if (character.size() != 1) {
        return false;
    }
    value = std::as_const(character)[0];
    return true;
}

bool parseScalar(const ElementText& text, String& value) {
    value = makeString(text.trimmed);
    return true;
}

bool parseScalar(const ElementText& text, CIMDateTime& value) {
    const std::string_view form = trimXmlSpace(text.raw);
    if (form.empty()) {
        value = CIMDateTime();
        return true;
    }
    try {
        const CIMDateTime parsed(makeString(form));
        // Servers exist that write a time stamp with ":" for the sign of its offset. The asterisks,
        // for which an interval has no use, tell some of these from intervals.
        if (parsed.isInterval() && form.find('*') != std::string_view::npos) {
            return false;
        }
        value = parsed;
        return true;
    } catch (const InvalidDateTimeFormatException&) {
        return false;
    } catch (const DateTimeOutOfRangeException&) {
        return false;
    }
}

String makeString(std::string_view utf8) {
    return String(utf8.data(), static_cast<Uint32>(utf8.size()));
}

}  // namespace Pegasus
