// What the CIM client raises when a server's answer cannot be used.
//
// A status that the server reports by itself is a CIMException instead; failures to reach the
// server at all are in Pegasus/Common/Exception.h.

#pragma once

#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>

namespace Pegasus {

/// The answer is not HTTP as RFC 9112 defines it, or lacks what CIM over HTTP (DSP0200) needs.
class CIMClientMalformedHTTPException : public Exception {
  public:
    explicit CIMClientMalformedHTTPException(const String& message) : Exception(message) {}
};

/// The server answered with an HTTP status other than 200.
class CIMClientHTTPErrorException : public Exception {
  public:
    explicit CIMClientHTTPErrorException(const String& message) : Exception(message) {}
};

/// The answer's body is not well-formed XML, not CIM-XML (DSP0201), cut short, or holds a value
/// that does not fit its type. The message says where.
class CIMClientXmlException : public Exception {
  public:
    explicit CIMClientXmlException(const String& message) : Exception(message) {}
};

/// The answer is CIM-XML but not an answer to the request, or its text is not UTF-8.
class CIMClientResponseException : public Exception {
  public:
    explicit CIMClientResponseException(const String& message) : Exception(message) {}
};

}  // namespace Pegasus
