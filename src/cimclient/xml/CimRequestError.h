// Why a server refuses a request before it has become an operation.

#pragma once

#include <string>

namespace Pegasus {

/// Thrown by decodeRequest. To be answered with HTTP status 400 (501 for "unsupported-operation"
/// and "multiple-requests-unsupported") and the header `CIMError: <cimError>`, as DSP0200 defines
/// them.
struct CimRequestError {
    /// One of DSP0200's words, for example "request-not-valid".
    std::string cimError;
    /// What was found where, as UTF-8 for people; percent-encode it before it goes into a header.
    std::string detail;
};

}  // namespace Pegasus
