#pragma once

// The common base of everything that writes an output file: the lazily opened file, the name rules
// that need the resource properties, and the reading of integers, value maps and sizes.

#include <Pegasus/Client/CIMClient.h>
#include <Velm/Properties.h>
#include <Velm/TextFile.h>

#include <functional>

namespace Pegasus {

class CimScriptParser;
class CimInstanceLists;

/// Writes one output file. The file appears only when something is written, and a converter that
/// wrote nothing removes the file of its name, so that no output of an earlier run stays behind.
class CimConverter {
  public:
    /// Neither creates nor opens the file.
    /// @param properties     held by reference; not read by the destructor
    /// @param maxNameLength  length limit of the names that hashString shortens
    CimConverter(const String& fileName, const Velm::Properties& properties,
                 unsigned int maxNameLength);
    CimConverter(const CimConverter&) = delete;
    CimConverter& operator=(const CimConverter&) = delete;

    /// Closes the file.
    virtual ~CimConverter();

    /// Writes all that one script has to say. instanceLists holds one list per class that returned
    /// instances; class k is described by list k.
    virtual void printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                             CimInstanceLists& instanceLists) = 0;

    /// Shortens a name; unchanged unless the product limits names.
    virtual String hashString(String text);

    /// Abbreviates a name; unchanged unless the product's database needs it.
    virtual String substituteValues(String text);

    /// Opens the file for writing unless it is open.
    void openFileIfNeeded();

    /// Writes text as it stands, line ends included, to the open file.
    void Output(const char* text);

    /// Closes the file if it is open, and removes it if nothing was ever written.
    void closeFile();

    /// See translatedPropertyName.
    String getTranslatedPropertyName(String section, String propertyName);

    /// Name under which a title is written: blanks as "_", translated, trimmed, shortened by
    /// hashString and abbreviated by substituteValues.
    String formatTitle(String title);

    /// True for the eight CIM integer types.
    static bool isInteger(CIMType type);

    /// A scalar integer; negative values are 0, and so is every other type.
    static Uint64 getUint64(CIMValue value, CIMType type);

    /// An integer array, converted like getUint64; empty when value is null or no integer array.
    static Array<Uint64> getUint64Array(CIMValue value, CIMType type);

    /// A scalar integer as decimal text. The importing products read 32-bit longs: uint32 is
    /// printed as signed, and of 64-bit types the low word is. Empty for other types.
    static String mapInteger(CIMValue value, CIMType type);

    /// True when the class has the property and it carries a Values qualifier.
    static bool hasMappedValues(CIMClass cimClass, String propertyName);

    /// Length that the products reserve for a property, as decimal text: the resource properties'
    /// "class.property.Size", else by type and MaxLen qualifier.
    String getMaxLength(CIMClass cimClass, String propertyName);

  protected:
    /// One property of a script as a column or attribute of the output.
    struct Column {
        Uint32 classIndex;
        const CIMName& property;
        String name;        ///< unique in the output but for accidents, see makeUnique
        String numberText;  ///< 2 for the first: the row's own key is number 1
        bool last;          ///< the last entry of the last class
    };

    /// Visits the properties that the script lists, class by class. Each class's list is read only
    /// when its turn comes, so that what a malformed list raises does not undo earlier columns.
    /// @param format  the product's rule for a translated name
    /// @throws InvalidNameException  an entry of a list is no CIM name
    void forEachColumn(CimScriptParser& parser, Array<CIMClass>& classes,
                       const std::function<String(const String&)>& format,
                       const std::function<void(const Column&)>& visit);

    Velm::TextFile outputFile;
    int fileOpen = 0;
    int somethingWritten = 0;
    const Velm::Properties& properties;
    unsigned int maxNameLength;
};

}  // namespace Pegasus
