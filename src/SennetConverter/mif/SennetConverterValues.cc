// The part of SennetConverter that renders types and values.

#include <cstdio>
#include <cstring>
#include <utility>

#include "SennetConverter/framework/SennetUtilities.h"
#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

namespace {

constexpr Uint32 kMaxText = 255;
constexpr Uint32 kMaxOtherText = 32;
constexpr Uint32 kDateTimeLength = 25;
constexpr Uint32 kMicrosecondsPoint = 14;

bool isPrintableAscii(Uint16 character) {
    return character >= ' ' && character <= '~';
}

bool isOneOf(Uint16 character, const char* characters) {
    return character != 0 && character <= '~' && std::strchr(characters, character) != nullptr;
}

// Whether escaping changes nothing. Without a branch in the loop, so that the compiler makes vector
// code of it; of the characters to escape, those that are not printable need no look of their own.
bool isPlain(const Char16* text, Uint32 size, const char* escapedCharacters) {
    Uint16 printable[2] = {};
    Uint32 count = 0;
    for (; *escapedCharacters != '\0'; ++escapedCharacters) {
        const auto character = static_cast<unsigned char>(*escapedCharacters);
        if (isPrintableAscii(character)) {
            if (count == 2) {
                return false;
            }
            printable[count++] = character;
        }
    }
    Uint16 odd = 0;
    for (Uint32 i = 0; i < size; ++i) {
        const Uint16 character = text[i];
        odd |= static_cast<Uint16>((static_cast<Uint16>(character - ' ') > '~' - ' ') |
                                   (character == printable[0]) | (character == printable[1]));
    }
    return odd == 0;
}

String cut(const String& text, Uint32 limit) {
    return text.size() > limit ? text.subString(0, limit) : text;
}

// The first kMaxText characters of size texts joined with commas; element(i) gives the i-th. What
// is cut off anyway is not made first: a small answer can stand for gigabytes of it.
template <typename Element>
String join(Uint32 size, Element element) {
    String joined;
    for (Uint32 i = 0; i < size && joined.size() < kMaxText; ++i) {
        if (i > 0) {
            joined.append(Char16(','));
        }
        joined.append(cut(element(i), kMaxText - joined.size()));
    }
    return joined;
}

template <typename T, typename ToText>
String joinElements(CIMValue& value, ToText toText) {
    Array<T> elements;
    value.get(elements);
    const Array<T>& read = elements;
    return join(read.size(), [&](Uint32 i) { return toText(read[i]); });
}

// The products expect uint32 as signed.
template <typename T>
String joinIntegers(CIMValue& value) {
    return joinElements<T>(
        value, [](T number) { return SennetUtilities::toDecimal(static_cast<Sint32>(number)); });
}

String realText(Real64 number) {
    // The largest double has 309 digits before the point.
    char text[400];
    std::snprintf(text, sizeof text, "%f", number);
    return String(text);
}

String joinNonIntegers(CIMValue& value, CIMType type) {
    switch (type) {
        case CIMTYPE_BOOLEAN:
            return joinElements<Boolean>(value,
                                         [](Boolean flag) { return String(flag ? "1" : "0"); });
        case CIMTYPE_REAL32:
            return joinElements<Real32>(value, [](Real32 number) { return realText(number); });
        case CIMTYPE_REAL64:
            return joinElements<Real64>(value, realText);
        case CIMTYPE_STRING:
            return joinElements<String>(value, [](const String& text) { return text; });
        case CIMTYPE_CHAR16:
            return joinElements<Char16>(value, [](Char16 character) {
                const Char16 low(static_cast<Uint16>(Uint16(character) & 0xFF));
                return String(&low, 1);
            });
        case CIMTYPE_DATETIME:
            return joinElements<CIMDateTime>(
                value, [](const CIMDateTime& time) { return time.toString(); });
        case CIMTYPE_REFERENCE:
            return joinElements<CIMObjectPath>(
                value, [](const CIMObjectPath& path) { return path.toString(); });
        default:
            return String();
    }
}

}  // namespace

String SennetConverter::getTypeString(CIMClass cimClass, String propertyName, CIMType type) {
    const String maxLength = getMaxLength(cimClass, propertyName);
    if (isInteger(type) && !hasMappedValues(cimClass, propertyName)) {
        return "         Type = Integer";
    }
    if (type == CIMTYPE_DATETIME) {
        return "         Type = Date";
    }
    return stringType(maxLength);
}

String SennetConverter::getValueString(CIMValue value, CIMType type, CIMProperty property) {
    if (isInteger(type)) {
        return value.isNull() ? String("0")
                              : formatEnumArray(std::move(value), type, std::move(property));
    }
    if (type == CIMTYPE_DATETIME) {
        CIMDateTime time;
        value.get(time);
        const String text = time.toString();
        return isCalendarDateTime(text) ? quote(text) : quote(kUnknownDate);
    }
    if (type == CIMTYPE_STRING) {
        String text;
        value.get(text);
        return quote(formatString(cut(text, kMaxText)));
    }
    String text = cut(formatString(value.toString()), kMaxOtherText);
    if (type == CIMTYPE_BOOLEAN) {
        text.toLower();
    }
    return quote(text);
}

String SennetConverter::formatValue(CIMValue value, CIMType type, CIMProperty property) {
    return value.isArray() ? formatArray(std::move(value), type, std::move(property))
                           : getValueString(std::move(value), type, std::move(property));
}

String SennetConverter::formatArray(CIMValue value, CIMType type, CIMProperty property) {
    if (isInteger(type)) {
        return formatEnumArray(value, type, property);
    }
    return quote(formatString(joinNonIntegers(value, type)));
}

String SennetConverter::formatEnumArray(CIMValue value, CIMType type, CIMProperty property) {
    static const CIMName kValues("Values");
    const Uint32 values = property.findQualifier(kValues);
    String text;
    if (values != PEG_NOT_FOUND) {
        const ValueNames& names = valueNames.of(property, values);
        if (value.isArray()) {
            const Array<Uint64> numbers = getUint64Array(value, type);
            text = join(numbers.size(), [&](Uint32 i) { return names.nameOf(numbers[i]); });
        } else {
            text = names.nameOf(getUint64(value, type));
        }
    } else if (value.isArray()) {
        text = formatIntegerArray(value, type);
    } else {
        return mapInteger(value, type);
    }
    return quote(formatString(cut(text, kMaxText)));
}

String SennetConverter::formatIntegerArray(CIMValue value, CIMType type) {
    switch (type) {
        case CIMTYPE_UINT8:
            return joinIntegers<Uint8>(value);
        case CIMTYPE_SINT8:
            return joinIntegers<Sint8>(value);
        case CIMTYPE_UINT16:
            return joinIntegers<Uint16>(value);
        case CIMTYPE_SINT16:
            return joinIntegers<Sint16>(value);
        case CIMTYPE_UINT32:
            return joinIntegers<Uint32>(value);
        case CIMTYPE_SINT32:
            return joinIntegers<Sint32>(value);
        case CIMTYPE_UINT64:
            return joinElements<Uint64>(value, SennetUtilities::toUnsignedDecimal);
        case CIMTYPE_SINT64:
            return joinElements<Sint64>(value, SennetUtilities::toDecimal);
        default:
            return String();
    }
}

String SennetConverter::formatString(String text) {
    return escape(text, "\r\n\"\\");
}

String SennetConverter::escape(const String& text, const char* escapedCharacters) {
    const Char16* const data = text.getChar16Data();
    if (isPlain(data, text.size(), escapedCharacters)) {
        return text;
    }
    String escaped;
    escaped.reserveCapacity(2 * text.size());
    for (Uint32 i = 0; i < text.size(); ++i) {
        const Uint16 character = data[i];
        if (isOneOf(character, escapedCharacters)) {
            escaped.append(Char16('\\'));
            escaped.append(Char16(character));
        } else {
            escaped.append(Char16(isPrintableAscii(character) ? character : Uint16(' ')));
        }
    }
    return escaped;
}

String SennetConverter::stringType(const String& length) {
    return String("         Type = String(") + length + ")";
}

bool SennetConverter::isCalendarDateTime(const String& text) {
    if (text.size() != kDateTimeLength || Uint16(text[kMicrosecondsPoint]) != '.') {
        return false;
    }
    const Uint16 first = text[0];
    const Uint16 second = text[1];
    return (first == '1' && second == '9') || (first == '2' && second == '0');
}

String SennetConverter::quote(const String& text) {
    String quoted;
    quoted.reserveCapacity(text.size() + 2);
    quoted.append(Char16('"'));
    quoted.append(text.getChar16Data(), text.size());
    quoted.append(Char16('"'));
    return quoted;
}

}  // namespace Pegasus
