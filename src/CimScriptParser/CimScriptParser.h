#pragma once

// The model of one inventory script: a text file whose name ends in ".script.inv" and that says
// which CIM classes are inventoried, in which namespace, with which properties, under which title.

#include <Pegasus/Client/CIMClient.h>

namespace Pegasus {

/// Reads one inventory script and answers what it asks for. Call parse() once, then the getters.
/// Malformed lines are without effect; an unreadable file is a script without classes.
class CimScriptParser {
  public:
    /// Number of class slots a script can fill: 0 to 9.
    static constexpr Uint32 kSlots = 10;

    /// Remembers the path; nothing is read before parse().
    explicit CimScriptParser(const String& scriptFileName);

    /// Reads the whole file. Afterwards the slots without a class name are gone and the others are
    /// numbered from 0 in their order.
    /// @throws IndexOutOfBoundsException  a slot number of 10 or more
    /// @throws Exception                  a line whose bytes are not UTF-8
    void parse();

    /// Number of classes the script names.
    Uint32 getNumberOfClasses() const;

    /// Class name at slot k; empty when there is no such slot.
    String getClassName(int k) const;

    /// Namespace of slot k, or the script's default one.
    /// @throws InvalidNamespaceNameException  the text is no namespace name
    CIMNamespaceName getNamespace(int k) const;

    /// First slot with this class name, ignoring case; -1 when there is none.
    int getClassIndex(String className) const;

    /// Properties listed for slot k, in the script's order: not null but empty for a slot without a
    /// list, null when there is no such slot.
    /// @throws InvalidNameException  an entry is no CIM name
    CIMPropertyList getPropertyList(int k) const;

    /// The script's title; without one the file's name without directory and ".script.inv", or the
    /// path as given when it does not end so.
    String getTitle() const;

    /// 1 when c is one of the bytes of separators, otherwise 0. The terminating NUL is none of
    /// them.
    static int isSeparator(char c, const char* separators);

    /// Splits a text at separator bytes; only the low 8 bits of a character are looked at. No token
    /// is empty. A separator that ends the text stays at the end of the token before it.
    static Array<String> parseTokens(const String& text, const char* separators);

    /// Takes one entry line of the [DEFAULT] section.
    void parseDefault(const String& line);

    /// Takes one entry line of the [CIM] section.
    /// @throws IndexOutOfBoundsException  a slot number beyond the slots
    void parseCim(const String& line);

    /// Drops the slots without a class name.
    void fixUpArrays();

  private:
    bool hasSlot(int k) const;
    Array<String>* fieldOf(const String& letter);

    String title;
    String fileName;
    String defaultNamespace;
    Array<String> namespaces;
    Array<String> classNames;
    Array<String> propertyLists;
};

}  // namespace Pegasus
