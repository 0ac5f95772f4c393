// The names of CIM classes, properties and qualifiers, and of namespaces (DSP0004, "Naming").
#pragma once

#include <Pegasus/Common/String.h>

namespace Pegasus {

/// A letter, "_" or a character above 127, then these and digits; or null, which is no name.
class CIMName {
  public:
    /// The null name.
    CIMName() = default;
    /// Raises InvalidNameException when `name` is not legal.
    CIMName(const String& name);
    CIMName(const char* name);

    static Boolean legal(const String& name);

    /// Empty when null. Of a name that somebody holds it is the name's own text; of one that a
    /// function just returned, a copy, which a reference to it keeps alive.
    const String& getString() const& { return name; }
    String getString() const&& { return name; }
    Boolean isNull() const { return name.size() == 0; }
    void clear();
    /// Ignores the case of ASCII letters.
    Boolean equal(const CIMName& other) const {
        return foldedHash == other.foldedHash && String::equalNoCase(name, other.name);
    }
    /// The same for names that are equal.
    Uint32 hash() const { return foldedHash; }

  private:
    String name;
    Uint32 foldedHash = 0;
};

inline Boolean operator==(const CIMName& a, const CIMName& b) {
    return a.equal(b);
}

/// Legal names joined by "/", or null, which is no namespace.
class CIMNamespaceName {
  public:
    /// The null name.
    CIMNamespaceName() = default;
    /// One leading "/" is dropped. Raises InvalidNamespaceNameException when `name` is not legal.
    CIMNamespaceName(const String& name);
    CIMNamespaceName(const char* name);

    static Boolean legal(const String& name);

    /// Without a leading "/"; empty when null.
    const String& getString() const { return name; }
    Boolean isNull() const { return name.size() == 0; }
    void clear();
    /// Ignores the case of ASCII letters.
    Boolean equal(const CIMNamespaceName& other) const;

  private:
    String name;
};

inline Boolean operator==(const CIMNamespaceName& a, const CIMNamespaceName& b) {
    return a.equal(b);
}

}  // namespace Pegasus
