#pragma once

// HTTP as the CIM service sees it, apart from any HTTP library.

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "protocol/ResponseStream.h"

namespace cimomd {

/// The parts of a request's head that CIM over HTTP (DSP0200) looks at; absent headers are nothing.
struct HttpHead {
    std::string method;
    std::string path;
    /// Over TCP, where the Host header tells under which name the client looked for this server.
    bool fromNetwork = false;
    /// Others on the request's way may read it differently, its Host or where it ends.
    bool isAmbiguous = false;
    std::optional<std::string> host;
    std::optional<std::string> contentType;
    std::optional<std::string> contentLength;
    std::optional<std::string> te;
    std::optional<std::string> cimOperation;
    std::optional<std::string> cimMethod;
    std::optional<std::string> cimObject;
};

/// Either a refusal without a body, or status 200 with a body that is made while it is sent.
struct HttpAnswer {
    unsigned status = 200;
    std::vector<std::pair<std::string, std::string>> headers;
    std::unique_ptr<ResponseStream> body;
    /// The CIM status goes into trailers.
    bool trailers = false;
};

}  // namespace cimomd
