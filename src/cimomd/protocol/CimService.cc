#include "protocol/CimService.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <array>
#include <utility>

#include "files/TextFields.h"
#include "protocol/LoopbackAddress.h"
#include "protocol/PercentCoding.h"
#include "text/CimText.h"
#include "text/Utf8.h"
#include "utf8/Utf8.h"
#include "xml/MemorySource.h"

namespace cimomd {
namespace {

constexpr std::string_view kPath = "/cimom";

constexpr unsigned kBadRequest = 400;
constexpr unsigned kForbidden = 403;
constexpr unsigned kNotFound = 404;
constexpr unsigned kMethodNotAllowed = 405;
constexpr unsigned kBodyTooLarge = 413;
constexpr unsigned kUnsupportedMediaType = 415;
constexpr unsigned kNotImplemented = 501;

// The values of CIMError for what DSP0200 has and this server has not; all others are mistakes.
constexpr std::array<std::string_view, 5> kNotImplementedErrors{
    "multiple-requests-unsupported", "unsupported-cim-version", "unsupported-dtd-version",
    "unsupported-operation", "unsupported-protocol-version"};

HttpAnswer refusal(unsigned status) {
    HttpAnswer answer;
    answer.status = status;
    return answer;
}

HttpAnswer cimRefusal(unsigned status, const std::string& cimError, std::string_view detail) {
    HttpAnswer answer = refusal(status);
    answer.headers.emplace_back("CIMError", cimError);
    answer.headers.emplace_back("PGErrorDetail", percentEncoded(detail));
    return answer;
}

/// The words of a list such as "chunked, trailers;q=0.5", parameters left out.
bool listHas(std::string_view list, std::string_view wanted) {
    while (!list.empty()) {
        const std::size_t comma = list.find(',');
        const std::string_view entry = list.substr(0, comma);
        if (equalsIgnoringCase(trimmed(entry.substr(0, entry.find(';'))), wanted))
            return true;
        list.remove_prefix(comma == std::string_view::npos ? list.size() : comma + 1);
    }
    return false;
}

bool isXml(const std::string& contentType) {
    const std::string_view type =
        trimmed(std::string_view(contentType).substr(0, contentType.find(';')));
    return equalsIgnoringCase(type, "application/xml") || equalsIgnoringCase(type, "text/xml");
}

bool bodyIsTooLarge(const HttpHead& head) {
    if (!head.contentLength)
        return false;
    const auto length = parseUnsigned(*head.contentLength);
    return length && *length > CimService::kMaxBodyBytes;
}

bool namesMethod(const std::string& header, const Pegasus::CimRequest& request) {
    const auto decoded = percentDecoded(header);
    return decoded && equalsIgnoringCase(trimmed(*decoded), request.method);
}

bool namesNamespace(const std::string& header, const Pegasus::CimRequest& request) {
    const auto decoded = percentDecoded(header);
    if (!decoded)
        return false;
    try {
        return Pegasus::CIMNamespaceName(cimString(trimmed(*decoded))).equal(request.nameSpace);
    } catch (const Pegasus::Exception&) {
        return false;
    }
}

/// DSP0200 has the operation in the headers too, for firewalls; the two must not differ.
std::optional<HttpAnswer> headerMismatch(const HttpHead& head, const Pegasus::CimRequest& request) {
    if (head.cimMethod && !namesMethod(*head.cimMethod, request))
        return cimRefusal(kBadRequest, "header-mismatch", "CIMMethod is not the request's method");
    // A method's object is a path whose spelling differs from client to client.
    if (!request.isExtrinsic && head.cimObject && !namesNamespace(*head.cimObject, request))
        return cimRefusal(kBadRequest, "header-mismatch",
                          "CIMObject is not the request's namespace");
    return std::nullopt;
}

unsigned statusOf(const Pegasus::CimRequestError& error) {
    const bool isMissing = std::find(kNotImplementedErrors.begin(), kNotImplementedErrors.end(),
                                     error.cimError) != kNotImplementedErrors.end();
    return isMissing ? kNotImplemented : kBadRequest;
}

std::unique_ptr<ResponseStream> respond(const Dispatcher& dispatcher,
                                        const Pegasus::CimRequest& request, bool trailers) {
    auto stream = std::make_unique<ResponseStream>(request, trailers);
    try {
        stream->succeed(dispatcher.dispatch(request));
    } catch (const Pegasus::CIMException& error) {
        stream->fail(CimStatus::of(error));
    } catch (const Pegasus::Exception& error) {
        stream->fail({Pegasus::CIM_ERR_FAILED, utf8Of(error.getMessage())});
    } catch (const std::exception& error) {
        stream->fail({Pegasus::CIM_ERR_FAILED, utf8::clean(error.what())});
    }
    return stream;
}

}  // namespace

std::optional<HttpAnswer> CimService::refusalOf(const HttpHead& head) const {
    if (head.isAmbiguous) {
        HttpAnswer answer = refusal(kBadRequest);
        answer.headers.emplace_back("Connection", "close");
        return answer;
    }
    if (head.fromNetwork && (!head.host || !isLoopbackHost(*head.host)))
        return refusal(kForbidden);
    if (head.method == "M-POST")
        return refusal(kNotImplemented);
    if (head.method != "POST") {
        HttpAnswer answer = refusal(kMethodNotAllowed);
        answer.headers.emplace_back("Allow", "POST");
        return answer;
    }
    if (head.path != kPath)
        return refusal(kNotFound);
    if (!head.contentType || !isXml(*head.contentType))
        return refusal(kUnsupportedMediaType);
    if (!head.cimOperation || !equalsIgnoringCase(trimmed(*head.cimOperation), "MethodCall"))
        return cimRefusal(kBadRequest, "unsupported-operation",
                          "the header CIMOperation must be MethodCall");
    if (bodyIsTooLarge(head))
        return bodyTooLarge();
    return std::nullopt;
}

HttpAnswer CimService::answer(const HttpHead& head, std::string_view body) const {
    try {
        Pegasus::MemorySource source(body);
        const Pegasus::CimRequest request = Pegasus::decodeRequest(source);
        if (auto mismatch = headerMismatch(head, request))
            return std::move(*mismatch);
        HttpAnswer answer;
        answer.trailers = head.te && listHas(*head.te, "trailers");
        answer.headers.emplace_back("Content-Type", "application/xml; charset=utf-8");
        answer.headers.emplace_back("CIMOperation", "MethodResponse");
        if (answer.trailers)
            answer.headers.emplace_back("Trailer", "CIMStatusCode, CIMStatusCodeDescription");
        answer.body = respond(dispatcher, request, answer.trailers);
        return answer;
    } catch (const Pegasus::CimRequestError& error) {
        return cimRefusal(statusOf(error), error.cimError, error.detail);
    } catch (const Pegasus::Exception& error) {
        return cimRefusal(kBadRequest, "request-not-valid", utf8Of(error.getMessage()));
    }
}

HttpAnswer CimService::bodyTooLarge() {
    return refusal(kBodyTooLarge);
}

}  // namespace cimomd
