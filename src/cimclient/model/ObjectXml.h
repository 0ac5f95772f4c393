// Writes the CIM-XML elements (DSP0201) of classes, instances, paths and values.
//
// All functions append UTF-8 to a string and hold no state. Texts are escaped: & < > " ' and tab,
// LF and CR become references, so that they survive the white-space handling of readers; other
// control characters, which XML 1.0 cannot carry, and unpaired surrogates become U+FFFD. Real
// numbers keep every bit (9 or 17 significant digits) and do not depend on the locale.
#pragma once

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMValue.h>

#include <string>

namespace Pegasus {

/// Which parts of a class or an instance are written; the defaults write all of it.
struct ObjectXmlOptions {
    /// Leave out elements that are marked as propagated from a superclass.
    Boolean localOnly = false;
    Boolean includeQualifiers = true;
    /// Write CLASSORIGIN where the property has one.
    Boolean includeClassOrigin = true;
    /// Null: all properties. Otherwise only those named, ignoring case.
    CIMPropertyList propertyList;
};

/// LOCALNAMESPACEPATH: one NAMESPACE for each part of the name.
void appendLocalNamespacePath(std::string& xml, const CIMNamespaceName& nameSpace);

/// CLASSNAME.
void appendClassName(std::string& xml, const CIMName& className);

/// CLASS with its qualifiers and properties. The class must be initialized.
void appendClassElement(std::string& xml, const CIMConstClass& cimClass);

/// The same without its end, so that more can be put into the element behind the properties.
void beginClassElement(std::string& xml, const CIMConstClass& cimClass,
                       const ObjectXmlOptions& options);
void endClassElement(std::string& xml);

/// QUALIFIER.
void appendQualifier(std::string& xml, const CIMConstQualifier& qualifier);

/// INSTANCE with its properties. The instance must be initialized.
void appendInstance(std::string& xml, const CIMConstInstance& instance,
                    const ObjectXmlOptions& options = ObjectXmlOptions());

/// CLASS or INSTANCE, all of it; nothing for a handle on nothing.
void appendObject(std::string& xml, const CIMObject& object);

/// INSTANCENAME with class name and key bindings; host and namespace of the path are not written.
void appendInstanceName(std::string& xml, const CIMObjectPath& path);

/// VALUE.REFERENCE holding the shortest element that carries the path: with host, with namespace
/// only, or with neither; of a class when the path has no keys.
void appendReference(std::string& xml, const CIMObjectPath& path);

/// The value element of a property or qualifier: VALUE, VALUE.ARRAY, VALUE.REFERENCE or
/// VALUE.REFARRAY; nothing at all for a null value.
void appendValue(std::string& xml, const CIMValue& value);

}  // namespace Pegasus
