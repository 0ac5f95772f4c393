#pragma once

// What a scripted server saw of one request.

#include <string>

namespace support {

struct RecordedRequest {
    std::string method;         // of the IMETHODCALL, e.g. "GetClass"; empty when there is none
    std::string className;      // of the parameter ClassName; empty when there is none
    std::string namespaceName;  // parts joined by "/", e.g. "root/cimv2"
    std::string messageId;      // of the MESSAGE element
    std::string headers;  // request line and header lines as they came, without the empty line
    std::string body;

    // The value of the header called so (in any case), without blanks around; empty when absent.
    std::string header(const std::string& name) const;
};

}  // namespace support
