#pragma once

// Where a MIF cell takes its property, type and value from.

#include <Pegasus/Client/CIMClient.h>

namespace Pegasus {

class CimScriptParser;

/// A property as it is shown: value and type of the instance, qualifiers of the class.
struct ResolvedProperty {
    CIMProperty property;
    CIMType type = CIMTYPE_STRING;
    CIMValue value{CIMTYPE_STRING, false};
};

/// One property that a script lists for a class, to be looked up in one instance after the other.
class PropertyLookup {
  public:
    PropertyLookup(CIMClass& cimClass, const CIMName& name);

    /// Value and type from the instance where it has the property, the property object (with its
    /// qualifiers) from the class where that declares it; what the instance lacks is the class
    /// default, and what neither has is a null string without a property object.
    /// @param instance  null for none
    ResolvedProperty in(const CIMInstance* instance) const;

    const CIMName& getName() const { return name; }

  private:
    CIMName name;
    bool declared;
    CIMProperty inClass;
};

/// The script's property names for a class; none when the script does not name the class.
/// @throws InvalidNameException  an entry is no CIM name
Array<CIMName> scriptProperties(CimScriptParser& parser, CIMClass& cimClass);

}  // namespace Pegasus
