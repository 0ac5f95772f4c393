// The part of SennetConverter that renders types and values.

#include <cstdio>
#include <cstring>

#include "SennetConverter/framework/SennetUtilities.h"
#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

namespace {

constexpr Uint32 kMaxText = 255;
constexpr Uint32 kMaxOtherText = 32;
constexpr Uint32 kDateTimeLength = 25;
constexpr Uint32 kMicrosecondsPoint = 14;
constexpr char kUnknownDateTime[] = "\"19800101000000.000000+000\"";

bool isPrintableAscii(Uint16 character) {
    return character >= ' ' && character <= '~';
}

bool isOneOf(Uint16 character, const char* characters) {
    return character != 0 && character <= '~' && std::strchr(characters, character) != nullptr;
}

String cut(const String& text, Uint32 limit) {
    return text.size() > limit ? text.subString(0, limit) : text;
}

// Joins size texts with commas; element(i) gives the i-th.
template <typename Element>
String join(Uint32 size, Element element) {
    String joined;
    for (Uint32 i = 0; i < size; ++i) {
        if (i > 0) {
            joined.append(Char16(','));
        }
        joined.append(element(i));
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

// The strings of a qualifier; none when its value is no array of strings or null.
Array<String> qualifierTexts(const CIMValue& value) {
    Array<String> texts;
    if (value.getType() == CIMTYPE_STRING && value.isArray()) {
        value.get(texts);
    }
    return texts;
}

Uint32 findText(const Array<String>& texts, const String& text) {
    for (Uint32 i = 0; i < texts.size(); ++i) {
        if (String::equal(texts[i], text)) {
            return i;
        }
    }
    return PEG_NOT_FOUND;
}

// Names of the numbers of an enumerated property.
class ValueNames {
  public:
    ValueNames(CIMProperty& property, const CIMValue& theNames) : names(qualifierTexts(theNames)) {
        const Uint32 position = property.findQualifier(CIMName("ValueMap"));
        if (position == PEG_NOT_FOUND) {
            return;
        }
        const CIMValue map = property.getQualifier(position).getValue();
        if (map.getType() == CIMTYPE_STRING) {
            mapped = true;
            numbers = qualifierTexts(map);
        }
    }

    String nameOf(Uint64 number) const {
        const String decimal = SennetUtilities::toUnsignedDecimal(number);
        const Uint64 position = mapped ? findText(numbers, decimal) : number;
        return position < names.size() ? names[static_cast<Uint32>(position)] : decimal;
    }

  private:
    Array<String> names;
    Array<String> numbers;
    bool mapped = false;
};

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
        return value.isNull() ? String("0") : formatEnumArray(value, type, property);
    }
    if (type == CIMTYPE_DATETIME) {
        CIMDateTime time;
        value.get(time);
        const String text = time.toString();
        return isCalendarDateTime(text) ? quote(text) : String(kUnknownDateTime);
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
    return value.isArray() ? formatArray(value, type, property)
                           : getValueString(value, type, property);
}

String SennetConverter::formatArray(CIMValue value, CIMType type, CIMProperty property) {
    if (isInteger(type)) {
        return formatEnumArray(value, type, property);
    }
    return quote(formatString(cut(joinNonIntegers(value, type), kMaxText)));
}

String SennetConverter::formatEnumArray(CIMValue value, CIMType type, CIMProperty property) {
    const Uint32 values = property.findQualifier(CIMName("Values"));
    String text;
    if (values != PEG_NOT_FOUND) {
        const ValueNames names(property, property.getQualifier(values).getValue());
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
    String escaped;
    escaped.reserveCapacity(2 * text.size());
    for (Uint32 i = 0; i < text.size(); ++i) {
        const Uint16 character = text[i];
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
    const String century = text.subString(0, 2);
    return String::equal(century, "19") || String::equal(century, "20");
}

String SennetConverter::quote(const String& text) {
    return String("\"") + text + "\"";
}

}  // namespace Pegasus
