#pragma once

// The head of a request as the HTTP library hands it over.

#include "protocol/HttpMessages.h"

struct MHD_Connection;

namespace cimomd {

/// The first line of a request, as the library cut it up where it lies.
struct RequestLine {
    const char* method;
    const char* url;
    const char* version;
};

/// To be called when the library first tells of a request.
HttpHead requestHead(MHD_Connection* connection, const RequestLine& line);

}  // namespace cimomd
