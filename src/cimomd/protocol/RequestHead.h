#pragma once

// The head of a request as the HTTP library hands it over.

#include "protocol/HttpMessages.h"

struct MHD_Connection;

namespace cimomd {

/// To be called when the library first tells of a request; `url` and `method` are what it tells.
HttpHead requestHead(MHD_Connection* connection, const char* url, const char* method);

}  // namespace cimomd
