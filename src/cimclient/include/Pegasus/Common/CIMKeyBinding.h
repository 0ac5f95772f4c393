// One key of an instance's path: a name and a value in its text form.
#pragma once

#include <Pegasus/Common/CIMName.h>

namespace Pegasus {

class CIMValue;

class CIMKeyBinding {
  public:
    enum Type { BOOLEAN, STRING, NUMERIC, REFERENCE };

    /// A null name with an empty string.
    CIMKeyBinding() = default;
    /// `value` is the text as it stands in the path, without quotes; that of a REFERENCE is an
    /// object path.
    CIMKeyBinding(CIMName name, String value, Type type);
    /// The text and type of `value`. Raises TypeMismatchException for a null, an array, a real or
    /// an embedded object: none of these can be a key.
    CIMKeyBinding(CIMName name, const CIMValue& value);

    const CIMName& getName() const { return name; }
    void setName(CIMName newName);
    const String& getValue() const { return value; }
    void setValue(String newValue);
    Type getType() const { return type; }
    void setType(Type newType);

    /// Whether both bind one key to one value: booleans ignore case, integers compare as numbers,
    /// references as paths.
    Boolean equal(const CIMKeyBinding& other) const;

  private:
    CIMName name;
    String value;
    Type type = STRING;
};

inline Boolean operator==(const CIMKeyBinding& a, const CIMKeyBinding& b) {
    return a.equal(b);
}

}  // namespace Pegasus
