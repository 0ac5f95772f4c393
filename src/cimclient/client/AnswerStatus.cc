#include "client/AnswerStatus.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <Pegasus/Common/CIMStatusCode.h>

#include <charconv>
#include <string>
#include <string_view>

#include "client/WireText.h"

namespace Pegasus {

namespace {

constexpr int kOk = 200;

bool isXml(std::string_view contentType) {
    const std::string_view type = trimmed(contentType.substr(0, contentType.find(';')));
    return equalIgnoringCase(type, "application/xml") || equalIgnoringCase(type, "text/xml");
}

CIMClientHTTPErrorException httpError(const HttpAnswer& answer, const std::string* cimError) {
    std::string text = "HTTP error: " + answer.statusLine();
    if (cimError != nullptr) {
        text += "; CIMError: " + *cimError;
    }
    if (const std::string* detail = answer.header().find("PGErrorDetail")) {
        text += "; " + percentDecoded(*detail);
    }
    return CIMClientHTTPErrorException(printableText(text));
}

Uint32 statusCodeOf(const std::string& text) {
    Uint32 code = 0;
    const char* end = text.data() + text.size();
    const auto [rest, error] = std::from_chars(text.data(), end, code);
    if (error != std::errc() || rest != end) {
        throw CIMClientMalformedHTTPException(
            printableText("CIMStatusCode is \"" + text + "\", which is no status code"));
    }
    return code;
}

void checkReportedStatus(const HttpFields& fields) {
    const std::string* text = fields.find("CIMStatusCode");
    if (text == nullptr) {
        return;
    }
    const Uint32 code = statusCodeOf(*text);
    if (code == 0) {
        return;
    }
    const std::string* description = fields.find("CIMStatusCodeDescription");
    throw CIMException(
        static_cast<CIMStatusCode>(code),
        description == nullptr ? String() : printableText(percentDecoded(*description)));
}

}  // namespace

void checkHead(const HttpAnswer& answer) {
    const std::string* cimError = answer.header().find("CIMError");
    if (answer.status() != kOk || cimError != nullptr) {
        throw httpError(answer, cimError);
    }
    const std::string* contentType = answer.header().find("Content-Type");
    if (contentType != nullptr && !isXml(*contentType)) {
        throw CIMClientMalformedHTTPException(
            printableText("The answer's content type is \"" + *contentType +
                          "\"; expected application/xml or text/xml"));
    }
}

void checkReportedStatus(const HttpAnswer& answer) {
    checkReportedStatus(answer.header());
    checkReportedStatus(answer.trailer());
    if (const std::string* cimError = answer.trailer().find("CIMError")) {
        throw httpError(answer, cimError);
    }
}

}  // namespace Pegasus
