// Writes CIM-XML (DSP0201): the client's requests and the parts of a server's answers.
//
// All functions append UTF-8 to a string and hold no state. The elements in requests and answers
// are those of model/ObjectXml.h.

#pragma once

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/String.h>

#include <string>
#include <string_view>

#include "model/InstanceWriter.h"
#include "model/ObjectXml.h"

namespace Pegasus {

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

/// The body of an EnumerateClassNames request. A null class name, for all classes, is left out.
std::string encodeEnumerateClassNamesRequest(std::string_view messageId,
                                             const CIMNamespaceName& nameSpace,
                                             const CIMName& className, Boolean deepInheritance);

/// Whether a call is an operation of DSP0200 or a method that a class declares.
enum class CallKind { Intrinsic, Extrinsic };

/// Opens an answer, up to and with the start tag of IMETHODRESPONSE or METHODRESPONSE. Follow it
/// with one ERROR, or with one IRETURNVALUE holding the result, or with nothing when the status
/// goes into trailers.
void beginResponse(std::string& xml, std::string_view messageId, std::string_view method,
                   CallKind kind = CallKind::Intrinsic);

/// Closes what beginResponse opened.
void endResponse(std::string& xml, CallKind kind = CallKind::Intrinsic);

void beginReturnValue(std::string& xml);
void endReturnValue(std::string& xml);

/// ERROR with the status code as defined in DSP0200.
void appendError(std::string& xml, Uint32 code, const String& description);

/// VALUE.NAMEDINSTANCE: the instance under its path, which must be set; and a line end.
void appendNamedInstance(std::string& xml, const CIMConstInstance& instance,
                         InstanceWriter& writer);
/// The same of a single instance, all of it.
void appendNamedInstance(std::string& xml, const CIMConstInstance& instance);

}  // namespace Pegasus
