#include "SennetConverter/mif/SennetConverter.h"

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/PropertyLookup.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr Sint32 kFirstGroupId = 2;
constexpr char kClassPrefix[] = "Corvane-Velt|KWX MIF ";
constexpr char kValueLine[] = "\r\n         Value = ";

// The instance of a list at a position, in storage; null when the list is shorter.
CIMInstance* instanceAt(const CimInstanceLists& lists, Uint32 list, Uint32 position,
                        CIMInstance& storage) {
    const Array<CIMInstance> instances = lists.getInstanceList(static_cast<int>(list));
    if (position >= instances.size()) {
        return nullptr;
    }
    storage = instances[position];
    return &storage;
}

}  // namespace

SennetConverter::SennetConverter(const String& fileName, const Velm::Properties& theProperties,
                                 unsigned int theMaxNameLength)
    : CimConverter(fileName, theProperties, theMaxNameLength), nextGroupId(kFirstGroupId) {}

SennetConverter::~SennetConverter() {
    if (somethingWritten != 0) {
        openFileIfNeeded();
        Output("End Component\r\n");
    }
}

void SennetConverter::printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                                  CimInstanceLists& instanceLists) {
    if (holdsData(classes, instanceLists)) {
        openFileIfNeeded();
        printInstances(parser, classes, instanceLists);
    }
}

void SennetConverter::printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                                     CimInstanceLists& instanceLists) {
    TableStyle style;
    style.rowNumberCell = plainRowNumber;
    printTable(parser, classes, instanceLists, style);
}

void SennetConverter::printTable(CimScriptParser& parser, Array<CIMClass>& classes,
                                 CimInstanceLists& instanceLists, const TableStyle& style) {
    const String idText = SennetUtilities::toDecimal(nextGroupId);
    printClass(parser, classes, instanceLists, 0);

    String header("\r\n   Start Table\r\n      Name = \"");
    header.append(style.namePrefix);
    header.append(groupName(parser));
    header.append("\"\r\n      Class = \"");
    header.append(kClassPrefix);
    header.append(parser.getTitle());
    header.append("|001\"\r\n      Id = ");
    header.append(idText);
    header.append("\r\n");
    Output(header.getCString());
    ++nextGroupId;

    const auto rows = static_cast<int>(largestListSize(instanceLists));
    for (int row = style.firstRowLast ? 1 : 0; row < rows; ++row) {
        Output(formatRow(parser, classes, instanceLists, row, style).getCString());
    }
    if (style.firstRowLast) {
        Output(formatRow(parser, classes, instanceLists, 0, style).getCString());
    }
    Output("\r\n   End Table\r\n");
}

String SennetConverter::formatRow(CimScriptParser& parser, Array<CIMClass>& classes,
                                  CimInstanceLists& instanceLists, int rowIndex,
                                  const TableStyle& style) {
    String row("      { ");
    row.append(style.rowNumberCell(rowIndex + 1));
    row.append(", ");
    for (Uint32 k = 0; k < classes.size(); ++k) {
        const Array<CIMName> names = scriptProperties(parser, classes[k]);
        CIMInstance storage;
        CIMInstance* instance =
            instanceAt(instanceLists, k, static_cast<Uint32>(rowIndex), storage);
        for (Uint32 i = 0; i < names.size(); ++i) {
            if (i > 0) {
                row.append(Char16(','));
            }
            if (instance != nullptr) {
                const ResolvedProperty cell = resolveProperty(classes[k], instance, names[i]);
                row.append(formatValue(cell.value, cell.type, cell.property));
            }
        }
        row.append(k + 1 < classes.size() ? "," : "}\r\n");
    }
    return row;
}

void SennetConverter::printClass(CimScriptParser& parser, Array<CIMClass>& classes,
                                 CimInstanceLists& instanceLists, unsigned int n) {
    bool hasInstances = false;
    int blankValues = 0;
    for (Uint32 k = 0; k < classes.size(); ++k) {
        const Uint32 size = instanceLists.getInstanceList(static_cast<int>(k)).size();
        hasInstances = hasInstances || size > 0;
        blankValues = size > 1 ? 1 : blankValues;
    }
    if (!hasInstances) {
        return;
    }
    Output(mifClassHeader(parser, static_cast<int>(n)).getCString());
    printAttributes(parser, classes, instanceLists, n, blankValues);
    Output("   End Group\r\n");
}

void SennetConverter::printAttributes(CimScriptParser& parser, Array<CIMClass>& classes,
                                      CimInstanceLists& instanceLists, unsigned int n,
                                      int blankValues) {
    const auto format = [this](const String& name) { return formatProperty(name); };
    forEachColumn(parser, classes, format, [&](const Column& column) {
        CIMClass& cimClass = classes[column.classIndex];
        const String propertyName = column.property.getString();
        CIMInstance storage;
        const ResolvedProperty shown = resolveProperty(
            cimClass, instanceAt(instanceLists, column.classIndex, n, storage), column.property);
        const String typeText = shown.value.isArray()
                                    ? stringType("255")
                                    : getTypeString(cimClass, propertyName, shown.type);

        String attribute("\r\n      Start Attribute\r\n         Name = \"");
        attribute.append(substituteValues(column.name));
        attribute.append("\"\r\n         Id = ");
        attribute.append(column.numberText);
        attribute.append("\r\n");
        attribute.append(typeText);
        attribute.append(
            getPropertyValueForClass(shown.property, shown.type, shown.value, blankValues));
        attribute.append("\r\n      End Attribute\r\n");
        Output(attribute.getCString());
    });
}

String SennetConverter::mifClassHeader(CimScriptParser& parser, int n) {
    HeaderStyle style;
    style.keyValue = SennetUtilities::toDecimal(n + 1);
    return classHeader(parser, n, style);
}

String SennetConverter::classHeader(CimScriptParser& parser, int n, const HeaderStyle& style) {
    String header;
    if (n == 0 && nextGroupId == kFirstGroupId) {
        header.append("Start Component\r\n   Name = \"");
        header.append(style.componentName);
        header.append("\"\r\n");
    }
    header.append("\r\n   Start Group\r\n      Name = \"");
    header.append(style.groupPrefix);
    header.append(groupName(parser));
    header.append("\"\r\n      Class = \"");
    header.append(kClassPrefix);
    header.append(parser.getTitle());
    header.append("|001\"\r\n");
    header.append(style.groupIdLine);
    header.append("      Key = 1\r\n      Start Attribute\r\n         Name = \"");
    header.append(style.keyPrefix);
    header.append("Index\"\r\n         Id = 1\r\n         Type = ");
    header.append(style.keyType);
    header.append(kValueLine);
    header.append(style.keyValue);
    header.append("\r\n      End Attribute\r\n");
    return header;
}

String SennetConverter::getPropertyValueForClass(CIMProperty property, CIMType type, CIMValue value,
                                                 int blankValues) {
    String line(kValueLine);
    if (blankValues == 0) {
        line.append(formatValue(value, type, property));
    } else if (!isInteger(type) || value.isArray() ||
               property.findQualifier(CIMName("Values")) != PEG_NOT_FOUND) {
        line.append("\"\"");
    } else {
        line.append("0");
    }
    return line;
}

String SennetConverter::formatProperty(String name) {
    return name;
}

String SennetConverter::groupName(CimScriptParser& parser) {
    return formatTitle(parser.getTitle());
}

String SennetConverter::plainRowNumber(int rowNumber) {
    return SennetUtilities::toDecimal(rowNumber);
}

}  // namespace Pegasus
