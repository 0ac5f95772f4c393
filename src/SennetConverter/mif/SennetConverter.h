#pragma once

// Writes DMTF MIF documents: one component per file, and for each inventory script that has
// instances a group (the template) and a table (one row per instance). What the importing products
// want differently is in the subclasses.

#include <memory>
#include <vector>

#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/mif/GroupAttributes.h"
#include "SennetConverter/mif/TableRows.h"
#include "SennetConverter/mif/ValueNames.h"

namespace Pegasus {

/// The MIF document and the steps that a product dialect may replace.
class SennetConverter : public CimConverter {
  public:
    /// Stands in most products' files where there is no date: they take no empty one.
    static constexpr const char* kUnknownDate = "19800101000000.000000+000";

    /// See CimConverter.
    SennetConverter(const String& fileName, const Velm::Properties& properties,
                    unsigned int maxNameLength);

    /// Ends the component if anything was written.
    ~SennetConverter() override;

    /// Writes group and table of one script; nothing when no class has an instance.
    void printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                     CimInstanceLists& instanceLists) override;

    /// Has the rows of each table rendered once for this document and `other`, whose class must
    /// render values as this one's does. Each script is to be printed to both before the next.
    void shareRows(SennetConverter& other);

    /// Header of the group that describes instance n (0 or more), with its key attribute; before
    /// the file's first group the component's header too.
    virtual String mifClassHeader(CimScriptParser& parser, int n);

    /// Escapes text for a quoted MIF literal; what is not printable ASCII becomes a blank, except
    /// CR and LF, which stay, escaped.
    virtual String formatString(String text);

    /// An integer or integer array as quoted text, numbers replaced by their names where the
    /// property carries Values; a scalar without Values as a bare number.
    virtual String formatEnumArray(CIMValue value, CIMType type, CIMProperty property);

    /// A scalar as it stands in a MIF file, with quotes where the type has them.
    virtual String getValueString(CIMValue value, CIMType type, CIMProperty property);

    /// The Type line of a scalar attribute, without line end.
    virtual String getTypeString(CIMClass cimClass, String propertyName, CIMType type);

    /// The attribute name as the product accepts it.
    virtual String formatProperty(String name);

    /// The Value line of an attribute, with the line end before it. blankValues is not 0 when the
    /// group is only a template and the table holds the values.
    virtual String getPropertyValueForClass(CIMProperty property, CIMType type, CIMValue value,
                                            int blankValues);

    /// Writes the group and the table of one script.
    virtual void printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                                CimInstanceLists& instanceLists);

    /// Writes one group: an attribute for each property of each class, described from instance n.
    void printClass(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists, unsigned int n);

    /// An array as one quoted text, elements separated by commas, at most 255 characters.
    String formatArray(CIMValue value, CIMType type, CIMProperty property);

    /// An integer array as numbers separated by commas, unquoted; empty for other types.
    static String formatIntegerArray(CIMValue value, CIMType type);

  protected:
    /// How a dialect words the header of component and group.
    struct HeaderStyle {
        const char* componentName = "KW Services Inventory";
        const char* groupPrefix = "";
        String groupIdLine;
        const char* keyPrefix = "";
        const char* keyType = "String(5)";
        String keyValue;
    };

    /// How a dialect writes a table. Rows are numbered from 1.
    struct TableStyle {
        const char* namePrefix = "";
        String (*rowNumberCell)(int rowNumber) = nullptr;
        bool firstRowLast = false;
    };

    /// The scalar Type line for a text attribute of this length.
    static String stringType(const String& length);

    /// A row number as a bare number.
    static String plainRowNumber(int rowNumber);

    /// True when text is a point in time of the years 1900 to 2099 in the 25-character form.
    static bool isCalendarDateTime(const String& text);

    /// text with a backslash before each of the characters named, and a blank in place of every
    /// other character that is not printable ASCII.
    static String escape(const String& text, const char* escapedCharacters);

    static String quote(const String& text);

    String classHeader(CimScriptParser& parser, int n, const HeaderStyle& style);
    void printTable(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists, const TableStyle& style);

    /// The value as it is, array or scalar.
    String formatValue(CIMValue value, CIMType type, CIMProperty property);

    /// Id that the next table, or numbered group, receives; 2 while nothing has been numbered.
    Sint32 nextGroupId = 2;

    /// printClass for one of several groups of a script, which share `attributes`.
    void printGroup(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists, unsigned int n, GroupAttributes& attributes);

  private:
    struct ClassRows;

    String groupName(CimScriptParser& parser);
    void printRows(CimScriptParser& parser, Array<CIMClass>& classes,
                   CimInstanceLists& instanceLists, const TableStyle& style);
    void printRow(const std::vector<ClassRows>& classes, Uint32 rowIndex, const TableStyle& style);
    void printAttributes(CimScriptParser& parser, Array<CIMClass>& classes,
                         CimInstanceLists& instanceLists, unsigned int n, int blankValues,
                         GroupAttributes& attributes);
    void printAttribute(CIMClass& cimClass, GroupAttributes::Attribute& attribute,
                        const CIMInstance* instance, int blankValues);
    void writeHead(CIMClass& cimClass, GroupAttributes::Attribute& attribute,
                   const ResolvedProperty& shown);

    ValueNamesCache valueNames;
    // Kept from row to row for its capacity.
    String rowText;
    std::shared_ptr<TableRows> sharedRows;
};

}  // namespace Pegasus
