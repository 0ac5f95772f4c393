// What the HTTP header and trailer of an answer say about a CIM operation (DSP0200).

#pragma once

#include "client/HttpAnswer.h"

namespace Pegasus {

/// Throws CIMClientHTTPErrorException unless the status is 200 and there is no CIMError field,
/// and CIMClientMalformedHTTPException when the body is said to be something else than XML; an
/// answer that does not name its content type passes. The message has the status line, CIMError and
/// PGErrorDetail.
void checkHead(const HttpAnswer& answer);

/// Throws CIMException when CIMStatusCode stands in the header or in the trailer with a code above
/// 0, and CIMClientMalformedHTTPException when it is no number.
void checkReportedStatus(const HttpAnswer& answer);

}  // namespace Pegasus
