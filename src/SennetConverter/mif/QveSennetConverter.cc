#include "SennetConverter/mif/QveSennetConverter.h"

#include <utility>

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr char kNamePrefix[] = "KWX_";

// The key column holds five characters.
String paddedRowNumber(int rowNumber) {
    return String("\"") + (SennetUtilities::toDecimal(rowNumber) + "    ").subString(0, 5) + "\"";
}

// Two digits of a date without a leading zero.
String shortNumber(const String& text, Uint32 position) {
    return Uint16(text[position]) == '0' ? text.subString(position + 1, 1)
                                         : text.subString(position, 2);
}

}  // namespace

String QveSennetConverter::hashString(String text) {
    return SennetUtilities::hashString(text, maxNameLength);
}

String QveSennetConverter::mifClassHeader(CimScriptParser& parser, int n) {
    HeaderStyle style;
    style.groupPrefix = kNamePrefix;
    style.keyPrefix = "Row_";
    style.keyValue = String("\"") + SennetUtilities::toDecimal(n + 1) + "    \"";
    return classHeader(parser, n, style);
}

String QveSennetConverter::formatString(String text) {
    return SennetConverter::formatString(SennetUtilities::replaceAll(text, '"', '\''));
}

String QveSennetConverter::formatEnumArray(CIMValue value, CIMType type, CIMProperty property) {
    const String text = SennetConverter::formatEnumArray(value, type, property);
    static const CIMName kValues("Values");
    const bool bareNumber = !value.isArray() && property.findQualifier(kValues) == PEG_NOT_FOUND;
    return bareNumber ? quote(text) : text;
}

String QveSennetConverter::getValueString(CIMValue value, CIMType type, CIMProperty property) {
    if (isInteger(type) && value.isNull()) {
        return "\"null\"";
    }
    if (type != CIMTYPE_DATETIME) {
        return SennetConverter::getValueString(std::move(value), type, std::move(property));
    }
    CIMDateTime time;
    value.get(time);
    const String text = time.toString();
    if (!isCalendarDateTime(text)) {
        return "\"\"";
    }
    return quote(shortNumber(text, 4) + "/" + shortNumber(text, 6) + "/" + text.subString(2, 2));
}

String QveSennetConverter::getTypeString(CIMClass cimClass, String propertyName, CIMType type) {
    const String length = getMaxLength(cimClass, propertyName);
    return stringType(type == CIMTYPE_STRING ? SennetUtilities::limitLength(length) : length);
}

String QveSennetConverter::formatProperty(String name) {
    return SennetUtilities::formatPropertyName4quvelle(name, maxNameLength);
}

String QveSennetConverter::getPropertyValueForClass(CIMProperty property, CIMType type,
                                                    CIMValue value, int blankValues) {
    if (blankValues != 0) {
        return "\r\n         Value = \"\"";
    }
    return SennetConverter::getPropertyValueForClass(property, type, value, 0);
}

void QveSennetConverter::printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                                        CimInstanceLists& instanceLists) {
    TableStyle style;
    style.namePrefix = kNamePrefix;
    style.rowNumberCell = paddedRowNumber;
    printTable(parser, classes, instanceLists, style);
}

}  // namespace Pegasus
