// Decodes the answers to the client's operations (CIM-XML, DSP0201) while they arrive.
//
// Nothing of the message is kept but the objects returned, so the memory used beside them does not
// depend on the length of the answer. The functions share no state: threads need no lock.

#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>

#include <string>

#include "xml/ByteSource.h"

namespace Pegasus {

/// Reads the answer to GetClass up to the end of `source`. Returns an uninitialized CIMClass when
/// the answer has neither a class nor an error: the status then came, or is missing, in HTTP
/// trailers.
///
/// Throws CIMException for an ERROR element, CIMClientResponseException when the answer carries
/// another message ID than `messageId` or is not UTF-8, CIMClientXmlException for everything else
/// that is wrong with it, and what `source` throws.
CIMClass decodeGetClassResponse(ByteSource& source, const std::string& messageId);

/// Reads the answer to EnumerateInstances up to the end of `source`. The instances are in the order
/// of the answer and each has its path. An answer without instances gives an empty array.
/// One faulty instance fails the whole answer. Throws as decodeGetClassResponse does.
Array<CIMInstance> decodeEnumerateInstancesResponse(ByteSource& source,
                                                    const std::string& messageId);

/// Reads the answer to EnumerateClassNames up to the end of `source`: the names in the order of the
/// answer. Throws as decodeGetClassResponse does.
Array<CIMName> decodeEnumerateClassNamesResponse(ByteSource& source, const std::string& messageId);

}  // namespace Pegasus
