#include "SennetConverter/mif/SennetConverter.h"

#include <utility>
#include <vector>

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr Sint32 kFirstGroupId = 2;
constexpr char kClassPrefix[] = "Corvane-Velt|KWX MIF ";
constexpr char kValueLine[] = "\r\n         Value = ";

// The instance at a position; null when the list is shorter.
const CIMInstance* instanceAt(const Array<CIMInstance>& instances, Uint32 position) {
    return position < instances.size() ? &instances[position] : nullptr;
}

}  // namespace

// The cells of one class: its instances and the columns that show them.
struct SennetConverter::ClassRows {
    Array<CIMInstance> instances;
    std::vector<PropertyLookup> columns;
};

SennetConverter::SennetConverter(const String& fileName, const Velm::Properties& theProperties,
                                 unsigned int theMaxNameLength)
    : CimConverter(fileName, theProperties, theMaxNameLength), nextGroupId(kFirstGroupId) {}

SennetConverter::~SennetConverter() {
    if (somethingWritten != 0) {
        openFileIfNeeded();
        Output("End Component\r\n");
    }
}

void SennetConverter::shareRows(SennetConverter& other) {
    sharedRows = std::make_shared<TableRows>();
    other.sharedRows = sharedRows;
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

    if (sharedRows != nullptr && sharedRows->show(instanceLists, *this)) {
        for (const std::string& rows : sharedRows->take()) {
            Output(rows.c_str());
        }
    } else {
        printRows(parser, classes, instanceLists, style);
    }
    Output("\r\n   End Table\r\n");
}

void SennetConverter::printRows(CimScriptParser& parser, Array<CIMClass>& classes,
                                CimInstanceLists& instanceLists, const TableStyle& style) {
    std::vector<ClassRows> cells;
    for (Uint32 k = 0; k < classes.size(); ++k) {
        cells.push_back({instanceLists.getInstanceList(static_cast<int>(k)), {}});
        const Array<CIMName> names = scriptProperties(parser, classes[k]);
        for (Uint32 i = 0; i < names.size(); ++i) {
            cells.back().columns.emplace_back(classes[k], names[i]);
        }
    }
    if (sharedRows != nullptr) {
        sharedRows->start(instanceLists, *this);
    }
    const Uint32 rows = largestListSize(instanceLists);
    for (Uint32 row = style.firstRowLast ? 1 : 0; row < rows; ++row) {
        printRow(cells, row, style);
    }
    if (style.firstRowLast) {
        printRow(cells, 0, style);
    }
}

void SennetConverter::printRow(const std::vector<ClassRows>& classes, Uint32 rowIndex,
                               const TableStyle& style) {
    String& row = rowText;
    row.remove(0);
    row.append("      { ");
    row.append(style.rowNumberCell(static_cast<int>(rowIndex + 1)));
    row.append(", ");
    for (const ClassRows& each : classes) {
        if (&each != &classes.front()) {
            row.append(Char16(','));
        }
        const CIMInstance* instance = instanceAt(each.instances, rowIndex);
        for (const PropertyLookup& column : each.columns) {
            if (&column != &each.columns.front()) {
                row.append(Char16(','));
            }
            if (instance != nullptr) {
                ResolvedProperty cell = column.in(instance);
                row.append(formatValue(std::move(cell.value), cell.type, std::move(cell.property)));
            }
        }
    }
    row.append("}\r\n");
    const CString utf8 = row.getCString();
    Output(utf8);
    if (sharedRows != nullptr) {
        sharedRows->add(static_cast<const char*>(utf8));
    }
}

void SennetConverter::printClass(CimScriptParser& parser, Array<CIMClass>& classes,
                                 CimInstanceLists& instanceLists, unsigned int n) {
    GroupAttributes attributes;
    printGroup(parser, classes, instanceLists, n, attributes);
}

void SennetConverter::printGroup(CimScriptParser& parser, Array<CIMClass>& classes,
                                 CimInstanceLists& instanceLists, unsigned int n,
                                 GroupAttributes& attributes) {
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
    printAttributes(parser, classes, instanceLists, n, blankValues, attributes);
    Output("   End Group\r\n");
}

void SennetConverter::printAttributes(CimScriptParser& parser, Array<CIMClass>& classes,
                                      CimInstanceLists& instanceLists, unsigned int n,
                                      int blankValues, GroupAttributes& attributes) {
    const auto print = [&](GroupAttributes::Attribute& attribute) {
        const Array<CIMInstance> instances =
            instanceLists.getInstanceList(static_cast<int>(attribute.classIndex));
        printAttribute(classes[attribute.classIndex], attribute, instanceAt(instances, n),
                       blankValues);
    };
    if (attributes.complete) {
        for (GroupAttributes::Attribute& attribute : attributes.attributes) {
            print(attribute);
        }
        return;
    }
    const auto format = [this](const String& name) { return formatProperty(name); };
    forEachColumn(parser, classes, format, [&](const Column& column) {
        const PropertyLookup lookup(classes[column.classIndex], column.property);
        attributes.attributes.push_back(
            {column.classIndex, lookup, column.name, column.numberText, {}});
        print(attributes.attributes.back());
    });
    attributes.complete = true;
}

void SennetConverter::printAttribute(CIMClass& cimClass, GroupAttributes::Attribute& attribute,
                                     const CIMInstance* instance, int blankValues) {
    const ResolvedProperty shown = attribute.lookup.in(instance);
    if (attribute.head.empty() || attribute.type != shown.type ||
        attribute.isArray != static_cast<bool>(shown.value.isArray())) {
        writeHead(cimClass, attribute, shown);
    }
    const CString value =
        getPropertyValueForClass(shown.property, shown.type, shown.value, blankValues).getCString();
    Output(attribute.head.c_str());
    Output(value);
    Output("\r\n      End Attribute\r\n");
}

void SennetConverter::writeHead(CIMClass& cimClass, GroupAttributes::Attribute& attribute,
                                const ResolvedProperty& shown) {
    attribute.type = shown.type;
    attribute.isArray = shown.value.isArray();
    String head("\r\n      Start Attribute\r\n         Name = \"");
    head.append(substituteValues(attribute.name));
    head.append("\"\r\n         Id = ");
    head.append(attribute.numberText);
    head.append("\r\n");
    head.append(attribute.isArray
                    ? stringType("255")
                    : getTypeString(cimClass, attribute.lookup.getName().getString(), shown.type));
    attribute.head = head.getCString();
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
