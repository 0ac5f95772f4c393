#include "client/HttpAnswer.h"

#include <Pegasus/Client/ClientExceptions.h>

#include <algorithm>
#include <string>
#include <vector>

#include "client/WireText.h"

namespace Pegasus {

namespace {

constexpr int kSwitchingProtocols = 101;

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

std::string_view withoutLineEnd(std::string_view line) {
    if (!line.empty() && line.back() == '\n') {
        line.remove_suffix(1);
    }
    if (!line.empty() && line.back() == '\r') {
        line.remove_suffix(1);
    }
    return line;
}

// The status of "HTTP/1.1 200 OK", or 0.
int statusOf(std::string_view line) {
    const std::size_t blank = line.find(' ');
    if (line.substr(0, 7) != "HTTP/1." || blank == std::string_view::npos) {
        return 0;
    }
    const std::string_view code = line.substr(blank + 1, 3);
    const bool codeEnds = line.size() <= blank + 4 || line[blank + 4] == ' ';
    if (code.size() != 3 || !std::all_of(code.begin(), code.end(), isDigit) || !codeEnds) {
        return 0;
    }
    return (code[0] - '0') * 100 + (code[1] - '0') * 10 + (code[2] - '0');
}

// Where two lengths differ nobody knows where the answer ends (RFC 9112, section 6.3).
void refuseTwoLengths(const HttpFields& header) {
    const std::vector<const std::string*> lengths = header.findAll("Content-Length");
    for (const std::string* length : lengths) {
        if (*length != *lengths.front()) {
            throw CIMClientMalformedHTTPException(printableText(
                "HTTP answer has the lengths " + *lengths.front() + " and " + *length));
        }
    }
}

}  // namespace

void HttpAnswer::addLine(std::string_view line) {
    if (line.size() > octetsLeft) {
        throw CIMClientMalformedHTTPException("HTTP header and trailer are too long");
    }
    octetsLeft -= line.size();
    const std::string_view content = withoutLineEnd(line);
    if (headComplete) {
        if (!content.empty()) {
            trailer_.addLine(content);
        }
    } else if (status_ == 0) {
        setStatusLine(content);
    } else if (content.empty()) {
        endHead();
    } else {
        header_.addLine(content);
    }
}

void HttpAnswer::setStatusLine(std::string_view line) {
    statusLine_ = line;
    status_ = statusOf(line);
    if (status_ < 100) {
        throw CIMClientMalformedHTTPException(
            printableText("HTTP status line \"" + statusLine_ + "\" has no valid status"));
    }
}

void HttpAnswer::endHead() {
    const bool interim = status_ < 200 && status_ != kSwitchingProtocols;
    if (interim) {
        status_ = 0;
        header_.clear();
    } else {
        refuseTwoLengths(header_);
        headComplete = true;
    }
}

}  // namespace Pegasus
