// Writes CIM-XML (DSP0201): the client's requests and the parts of a server's answers.
//
// All functions append UTF-8 to a string and hold no state. Texts are escaped: & < > " ' and tab,
// LF and CR become references, so that they survive the white-space handling of readers; other
// control characters, which XML 1.0 cannot carry, and unpaired surrogates become U+FFFD. Real
// numbers keep every bit (9 or 17 significant digits) and do not depend on the locale.

#pragma once

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/String.h>

#include <string>
#include <string_view>

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

/// The body of a GetClass request. A null property list is left out.
std::string encodeGetClassRequest(std::string_view messageId, const CIMNamespaceName& nameSpace,
                                  const CIMName& className, Boolean localOnly,
                                  Boolean includeQualifiers, Boolean includeClassOrigin,
                                  const CIMPropertyList& propertyList);

/// The body of an EnumerateInstances request. A null property list is left out.
std::string encodeEnumerateInstancesRequest(std::string_view messageId,
                                            const CIMNamespaceName& nameSpace,
                                            const CIMName& className, Boolean deepInheritance,
                                            Boolean localOnly, Boolean includeQualifiers,
                                            Boolean includeClassOrigin,
                                            const CIMPropertyList& propertyList);

/// Opens an answer, up to and with the start tag of IMETHODRESPONSE. Follow it with one ERROR, or
/// with one IRETURNVALUE holding the result, or with nothing when the status goes into trailers.
void beginResponse(std::string& xml, std::string_view messageId, std::string_view method);

/// Closes what beginResponse opened.
void endResponse(std::string& xml);

void beginReturnValue(std::string& xml);
void endReturnValue(std::string& xml);

/// ERROR with the status code as defined in DSP0200.
void appendError(std::string& xml, Uint32 code, const String& description);

/// LOCALNAMESPACEPATH: one NAMESPACE for each part of the name.
void appendLocalNamespacePath(std::string& xml, const CIMNamespaceName& nameSpace);

/// CLASSNAME.
void appendClassName(std::string& xml, const CIMName& className);

/// CLASS with its qualifiers and properties. The class must be initialized.
void appendClass(std::string& xml, const CIMConstClass& cimClass,
                 const ObjectXmlOptions& options = ObjectXmlOptions());

/// INSTANCE with its properties. The instance must be initialized.
void appendInstance(std::string& xml, const CIMConstInstance& instance,
                    const ObjectXmlOptions& options = ObjectXmlOptions());

/// INSTANCENAME with class name and key bindings; host and namespace of the path are not written.
void appendInstanceName(std::string& xml, const CIMObjectPath& path);

/// VALUE.REFERENCE holding the shortest element that carries the path: with host, with namespace
/// only, or with neither; of a class when the path has no keys.
void appendReference(std::string& xml, const CIMObjectPath& path);

/// VALUE.NAMEDINSTANCE: the instance under its path, which must be set.
void appendNamedInstance(std::string& xml, const CIMConstInstance& instance,
                         const ObjectXmlOptions& options = ObjectXmlOptions());

/// The value element of a property or qualifier: VALUE, VALUE.ARRAY, VALUE.REFERENCE or
/// VALUE.REFARRAY; nothing at all for a null value.
void appendValue(std::string& xml, const CIMValue& value);

}  // namespace Pegasus
