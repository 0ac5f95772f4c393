// The part of CimConverter that reads facts out of CIM values and class definitions.

#include <type_traits>

#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr char kDefaultLength[] = "255";
constexpr char kIntegerLength[] = "20";
constexpr char kDateTimeLength[] = "25";
constexpr char kOtherLength[] = "32";

// Calls visit with a zero of the C++ type that a CIM integer type has; false for other types.
template <typename Visitor>
bool visitIntegerType(CIMType type, Visitor visit) {
    switch (type) {
        case CIMTYPE_UINT8:
            visit(Uint8(0));
            return true;
        case CIMTYPE_SINT8:
            visit(Sint8(0));
            return true;
        case CIMTYPE_UINT16:
            visit(Uint16(0));
            return true;
        case CIMTYPE_SINT16:
            visit(Sint16(0));
            return true;
        case CIMTYPE_UINT32:
            visit(Uint32(0));
            return true;
        case CIMTYPE_SINT32:
            visit(Sint32(0));
            return true;
        case CIMTYPE_UINT64:
            visit(Uint64(0));
            return true;
        case CIMTYPE_SINT64:
            visit(Sint64(0));
            return true;
        default:
            return false;
    }
}

template <typename Integer>
Uint64 clampToUnsigned(Integer number) {
    if constexpr (std::is_signed_v<Integer>) {
        return number < 0 ? 0 : static_cast<Uint64>(number);
    } else {
        return number;
    }
}

// uint64 shows its low word unsigned; every other type shows its low word signed.
template <typename Integer>
Sint64 asPrinted(Integer number) {
    const auto lowWord = static_cast<Uint32>(static_cast<Uint64>(number));
    if constexpr (std::is_same_v<Integer, Uint64>) {
        return lowWord;
    } else {
        return static_cast<Sint32>(lowWord);
    }
}

bool isNumber(const CIMQualifier& qualifier) {
    return CimConverter::isInteger(qualifier.getType()) && !qualifier.getValue().isArray();
}

// The text of the MaxLen qualifier, or "-1". A MaxLen that stands after Values is not seen, nor one
// that is no single number: reading it would leave half a file.
String readMaxLen(CIMProperty& property, bool& hasValues) {
    String maxLength("-1");
    for (Uint32 i = 0; i < property.getQualifierCount() && !hasValues; ++i) {
        const CIMQualifier qualifier = property.getQualifier(i);
        const String name = qualifier.getName().getString();
        if (String::equalNoCase(name, "values")) {
            hasValues = true;
        } else if (String::equalNoCase(name, "maxlen") && isNumber(qualifier)) {
            maxLength = CimConverter::mapInteger(qualifier.getValue(), qualifier.getType());
        }
    }
    return maxLength;
}

}  // namespace

bool CimConverter::isInteger(CIMType type) {
    return type >= CIMTYPE_UINT8 && type <= CIMTYPE_SINT64;
}

Uint64 CimConverter::getUint64(CIMValue value, CIMType type) {
    Uint64 result = 0;
    visitIntegerType(type, [&](auto number) {
        value.get(number);
        result = clampToUnsigned(number);
    });
    return result;
}

Array<Uint64> CimConverter::getUint64Array(CIMValue value, CIMType type) {
    Array<Uint64> result;
    if (!value.isArray() || value.isNull()) {
        return result;
    }
    visitIntegerType(type, [&](auto number) {
        Array<decltype(number)> numbers;
        value.get(numbers);
        result.reserveCapacity(numbers.size());
        for (Uint32 i = 0; i < numbers.size(); ++i) {
            result.append(clampToUnsigned(static_cast<decltype(number)>(numbers[i])));
        }
    });
    return result;
}

String CimConverter::mapInteger(CIMValue value, CIMType type) {
    String result;
    visitIntegerType(type, [&](auto number) {
        value.get(number);
        result = SennetUtilities::toDecimal(asPrinted(number));
    });
    return result;
}

bool CimConverter::hasMappedValues(CIMClass cimClass, String propertyName) {
    const Uint32 position = cimClass.findProperty(CIMName(propertyName));
    return position != PEG_NOT_FOUND &&
           cimClass.getProperty(position).findQualifier(CIMName("Values")) != PEG_NOT_FOUND;
}

String CimConverter::getMaxLength(CIMClass cimClass, String propertyName) {
    const String name = SennetUtilities::replaceAll(propertyName, ' ', '_');
    const String key = cimClass.getClassName().getString() + "." + name + ".Size";
    if (const char* size = properties.getPropertyValue(key.getCString())) {
        return String(size);
    }
    const Uint32 position = cimClass.findProperty(CIMName(name));
    if (position == PEG_NOT_FOUND) {
        return kDefaultLength;
    }
    CIMProperty property = cimClass.getProperty(position);
    if (property.isArray()) {
        return kDefaultLength;
    }
    bool hasValues = false;
    const String maxLength = readMaxLen(property, hasValues);
    const CIMType type = property.getType();
    if (isInteger(type)) {
        return hasValues ? kDefaultLength : kIntegerLength;
    }
    if (type == CIMTYPE_DATETIME) {
        return kDateTimeLength;
    }
    if (type == CIMTYPE_STRING) {
        return String::equalNoCase(maxLength, "-1") ? String(kDefaultLength) : maxLength;
    }
    return kOtherLength;
}

}  // namespace Pegasus
