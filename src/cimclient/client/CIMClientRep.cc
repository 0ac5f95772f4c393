#include "client/CIMClientRep.h"

#include <chrono>
#include <optional>
#include <utility>
#include <vector>

#include "client/AnswerStatus.h"
#include "client/LocalAuthentication.h"
#include "client/UnixSocket.h"
#include "client/WireText.h"
#include "xml/CimXmlReader.h"
#include "xml/CimXmlWriter.h"

namespace Pegasus {

namespace {

constexpr int kUnauthorized = 401;

// Some servers close after an answer without having said so, a moment after its last octet. A
// request that is written into such a connection is lost, for it is not sent twice.
constexpr std::chrono::microseconds kCloseGrace{500};

std::string authorizationLine(const std::string& value) {
    return "PegasusAuthorization: " + value;
}

// The line of PegasusAuthorization is the last one.
HttpRequest makeRequest(const char* method, const CIMNamespaceName& nameSpace, std::string body) {
    const CString name = nameSpace.getString().getCString();
    return HttpRequest{{"Content-Type: application/xml; charset=utf-8", "TE: chunked, trailers",
                        "CIMOperation: MethodCall", std::string("CIMMethod: ") + method,
                        "CIMObject: " + percentEncoded(static_cast<const char*>(name)),
                        authorizationLine(localAuthorization(effectiveUserName()))},
                       std::move(body)};
}

// An error answer may come without a body and without saying so.
bool saysItHasBody(const HttpAnswer& answer) {
    return answer.header().find("Content-Length") != nullptr ||
           answer.header().find("Transfer-Encoding") != nullptr;
}

// The file of the challenge for local authentication, which may stand among others.
std::optional<std::string> localChallengeFile(const HttpAnswer& answer) {
    if (answer.status() == kUnauthorized) {
        for (const std::string* challenge : answer.header().findAll("WWW-Authenticate")) {
            if (std::optional<std::string> file = challengeFile(*challenge)) {
                return file;
            }
        }
    }
    return std::nullopt;
}

bool wantsToClose(const HttpAnswer& answer) {
    const std::string* option = answer.header().find("Connection");
    return option != nullptr && equalIgnoringCase(*option, "close");
}

}  // namespace

class CIMClientRep::ConnectionGuard {
  public:
    explicit ConnectionGuard(ServerConnection& connection) : connection(connection) {}
    ~ConnectionGuard() {
        if (!kept) {
            connection.close();
        }
    }
    ConnectionGuard(const ConnectionGuard&) = delete;
    ConnectionGuard& operator=(const ConnectionGuard&) = delete;

    void keepIf(bool wanted) { kept = wanted; }

  private:
    ServerConnection& connection;
    bool kept = false;
};

CIMClientRep::CIMClientRep(ClientSettings settings) : settings(std::move(settings)) {}

void CIMClientRep::connectLocal() {
    if (connected) {
        throw AlreadyConnectedException("The CIM client is connected already");
    }
    connection = connectToLocalServer(settings.places, Deadline(timeoutMilliseconds));
    connected = true;
}

void CIMClientRep::disconnect() {
    connected = false;
    connection.close();
}

std::string CIMClientRep::nextMessageId() {
    return std::to_string(++lastMessageId);
}

void CIMClientRep::makeReady(const Deadline& deadline) {
    const auto grace = connection.child ? std::chrono::microseconds::zero() : kCloseGrace;
    if (!connection.socket.isOpen() || !isIdle(connection.socket, grace)) {
        connection.close();
        connection = connectToLocalServer(settings.places, deadline);
    }
}

// The exchange with its answer's head read.
std::unique_ptr<HttpExchange> CIMClientRep::start(const HttpRequest& request,
                                                  const Deadline& deadline, Uint64 answerLimit) {
    makeReady(deadline);
    auto started = std::make_unique<HttpExchange>(connection.socket.get(), request, deadline,
                                                  HttpLimits{answerLimit, settings.headLimit});
    started->awaitHead();
    return started;
}

// Changes the request so that it answers the challenge of a refused one. False when the challenge
// is none that this client may answer.
bool CIMClientRep::answerChallenge(const HttpExchange& refused, HttpRequest& request) const {
    const std::optional<std::string> file = localChallengeFile(refused.answer());
    if (!file.has_value()) {
        return false;
    }
    const std::optional<std::string> secret =
        readLocalSecret(*file, settings.authenticationDirectories, connection.serverUser);
    if (!secret.has_value()) {
        return false;
    }
    request.headerLines.back() =
        authorizationLine(localAuthorization(effectiveUserName(), *file, *secret));
    return true;
}

std::unique_ptr<HttpExchange> CIMClientRep::exchange(HttpRequest& request, const Deadline& deadline,
                                                     Uint64 answerLimit) {
    std::unique_ptr<HttpExchange> current = start(request, deadline, answerLimit);
    if (!answerChallenge(*current, request)) {
        return current;
    }
    // A server may have bound its secret to this connection: it is kept if that can be done.
    bool open = !wantsToClose(current->answer());
    if (saysItHasBody(current->answer())) {
        current->skipBody();
        open = current->leavesConnectionOpen();
    }
    current.reset();
    if (!open) {
        connection.close();
    }
    return start(request, deadline, answerLimit);
}

template <typename Decode>
auto CIMClientRep::perform(const char* method, const CIMNamespaceName& nameSpace, std::string body,
                           Uint64 answerLimit, Decode decode) {
    if (!connected) {
        throw NotConnectedException("The CIM client is not connected");
    }
    const Deadline deadline(timeoutMilliseconds);
    ConnectionGuard guard(connection);
    HttpRequest request = makeRequest(method, nameSpace, std::move(body));
    const std::unique_ptr<HttpExchange> current = exchange(request, deadline, answerLimit);
    checkHead(current->answer());
    try {
        MemoryBoundedSource answer(*current, memory);
        auto result = decode(answer);
        current->skipBody();
        checkReportedStatus(current->answer());
        guard.keepIf(current->leavesConnectionOpen());
        return result;
    } catch (const CIMException&) {
        guard.keepIf(current->leavesConnectionOpen());
        throw;
    } catch (const CIMClientXmlException&) {
        // A server that fails in the middle of its answer says why after the last chunk.
        checkReportedStatus(current->answer());
        throw;
    } catch (const CIMClientMalformedHTTPException&) {
        // libcurl gives up at a long line of the trailer, such as a description, which comes after
        // the code.
        checkReportedStatus(current->answer());
        throw;
    }
}

CIMClass CIMClientRep::getClass(const CIMNamespaceName& nameSpace, const CIMName& className,
                                Boolean localOnly, Boolean includeQualifiers,
                                Boolean includeClassOrigin, const CIMPropertyList& propertyList) {
    const std::string id = nextMessageId();
    CIMClass found =
        perform("GetClass", nameSpace,
                encodeGetClassRequest(id, nameSpace, className, localOnly, includeQualifiers,
                                      includeClassOrigin, propertyList),
                settings.classBodyLimit,
                [&](ByteSource& source) { return decodeGetClassResponse(source, id); });
    if (found.isUninitialized()) {
        connection.close();
        throw CIMClientResponseException("The answer to GetClass of " + className.getString() +
                                         " has neither a class nor an error");
    }
    return found;
}

Array<CIMInstance> CIMClientRep::enumerateInstances(const CIMNamespaceName& nameSpace,
                                                    const CIMName& className,
                                                    Boolean deepInheritance, Boolean localOnly,
                                                    Boolean includeQualifiers,
                                                    Boolean includeClassOrigin,
                                                    const CIMPropertyList& propertyList) {
    const std::string id = nextMessageId();
    return perform(
        "EnumerateInstances", nameSpace,
        encodeEnumerateInstancesRequest(id, nameSpace, className, deepInheritance, localOnly,
                                        includeQualifiers, includeClassOrigin, propertyList),
        settings.bodyLimit,
        [&](ByteSource& source) { return decodeEnumerateInstancesResponse(source, id); });
}

Array<CIMName> CIMClientRep::enumerateClassNames(const CIMNamespaceName& nameSpace,
                                                 const CIMName& className,
                                                 Boolean deepInheritance) {
    const std::string id = nextMessageId();
    return perform("EnumerateClassNames", nameSpace,
                   encodeEnumerateClassNamesRequest(id, nameSpace, className, deepInheritance),
                   settings.bodyLimit, [&](ByteSource& source) {
                       return decodeEnumerateClassNamesResponse(source, id);
                   });
}

}  // namespace Pegasus
