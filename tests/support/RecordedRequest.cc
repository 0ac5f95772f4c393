#include "support/RecordedRequest.h"

#include <strings.h>

namespace support {

std::string RecordedRequest::header(const std::string& name) const {
    std::size_t line = headers.find("\r\n");
    while (line != std::string::npos) {
        line += 2;
        const std::size_t end = headers.find("\r\n", line);
        const std::string field = headers.substr(line, end == std::string::npos ? end : end - line);
        const std::size_t colon = field.find(':');
        if (colon == name.size() && strncasecmp(field.c_str(), name.c_str(), colon) == 0) {
            const std::size_t first = field.find_first_not_of(" \t", colon + 1);
            const std::size_t last = field.find_last_not_of(" \t");
            return first == std::string::npos ? "" : field.substr(first, last - first + 1);
        }
        line = end;
    }
    return "";
}

}  // namespace support
