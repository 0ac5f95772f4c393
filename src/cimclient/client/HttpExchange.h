// One HTTP/1.1 request and its answer over a connection that exists already, by libcurl. The
// answer's body is pulled, so that it can be decoded while it arrives. Knows nothing of CIM.

#pragma once

#include <Pegasus/Common/Config.h>
#include <curl/curl.h>

#include <array>
#include <cstddef>
#include <exception>
#include <string>
#include <vector>

#include "client/Deadline.h"
#include "client/HttpAnswer.h"
#include "xml/ByteSource.h"

namespace Pegasus {

/// A POST request to /cimom on "localhost".
struct HttpRequest {
    /// Whole lines without line ends; Host and Content-Length are added.
    std::vector<std::string> headerLines;
    std::string body;
};

/// Sizes above which an answer is refused, in octets.
struct HttpLimits {
    Uint64 body;       // after decoding of the transfer coding
    std::size_t head;  // header and trailer lines together
};

/// The request is sent at most once. Whatever waits longer than the deadline raises
/// ConnectionTimeoutException; a connection that ends early, and everything that is not HTTP/1.x,
/// raises CIMClientMalformedHTTPException.
class HttpExchange : public ByteSource {
  public:
    /// Prepares the exchange over `connection`, which stays the caller's, does not block and must
    /// be idle. The request must stay alive as long as the exchange.
    HttpExchange(int connection, const HttpRequest& request, const Deadline& deadline,
                 const HttpLimits& limits);
    ~HttpExchange() override;
    HttpExchange(const HttpExchange&) = delete;
    HttpExchange& operator=(const HttpExchange&) = delete;

    /// Sends the request and waits until the answer's status line and header are there.
    const HttpAnswer& awaitHead();

    /// The next octets of the body; 0 when it has ended as its length or last chunk says.
    std::size_t read(char* buffer, std::size_t capacity) override;

    /// Reads the rest of the body and forgets it.
    void skipBody();

    /// Header and trailer as far as they have come.
    const HttpAnswer& answer() const { return answer_; }

    /// Whether the whole answer was received without error, trailer included.
    bool hasEnded() const { return ended && result == CURLE_OK; }

    /// Whether the connection can take another request: the answer has ended, and neither side
    /// wants to close.
    bool leavesConnectionOpen() const { return hasEnded() && !closedByCurl; }

  private:
    static std::size_t onHeaderLine(char* data, std::size_t size, std::size_t count, void* self);
    static std::size_t onBody(char* data, std::size_t size, std::size_t count, void* self);
    static curl_socket_t onOpen(void* self, curlsocktype purpose, curl_sockaddr* address);
    static int onConnected(void* self, char* peer, char* local, int peerPort, int localPort);
    static int onClose(void* self, curl_socket_t socket);

    void setOptions(const HttpRequest& request);
    void release();
    void takeBody(const char* data, std::size_t count);
    void advance();
    void wait() const;
    void throwIfFailed() const;
    std::string reasonOfFailure() const;

    int connection;
    int placeholder = -1;  // what libcurl takes for its socket; it closes that itself
    bool closedByCurl = false;
    Deadline deadline;
    HttpLimits limits;
    HttpAnswer answer_;
    Uint64 bodyOctets = 0;

    char* target = nullptr;  // where read() wants the next octets
    std::size_t targetRoom = 0;
    std::string pending;  // octets that came when read() had no room for them
    std::size_t pendingStart = 0;

    bool ended = false;
    CURLcode result = CURLE_OK;                   // valid when ended
    std::exception_ptr failure;                   // raised in a callback, which must not throw
    std::array<char, CURL_ERROR_SIZE> details{};  // what libcurl says beside the result

    curl_slist* headerLines = nullptr;
    CURL* easy = nullptr;
    CURLM* multi = nullptr;
};

}  // namespace Pegasus
