#include "client/HttpExchange.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <Pegasus/Common/Exception.h>
#include <fcntl.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>

#include "client/FileDescriptor.h"
#include "client/WireText.h"

namespace Pegasus {

namespace {

constexpr long kBufferOctets = 256L << 10;
constexpr std::size_t kSkipOctets = std::size_t{16} << 10;

void initializeCurlOnce() {
    static const CURLcode initialized = curl_global_init(CURL_GLOBAL_NOTHING);
    if (initialized != CURLE_OK) {
        throw CannotConnectException("libcurl cannot be initialized");
    }
}

void require(bool success) {
    if (!success) {
        throw CannotConnectException("libcurl lacks memory or an option that this client needs");
    }
}

template <typename Value>
void setOption(CURL* easy, CURLoption option, Value value) {
    require(curl_easy_setopt(easy, option, value) == CURLE_OK);
}

// A datagram socket that can be connected to its own name, which replaces `address`. -1 on failure.
int openPlaceholder(curl_sockaddr& address) {
    FileDescriptor socket(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    sockaddr_un name{};
    name.sun_family = AF_UNIX;
    auto* generic = reinterpret_cast<sockaddr*>(&name);
    // A name of the family alone lets the kernel choose one: a NUL and five digits.
    socklen_t length = sizeof(name.sun_family);
    if (::bind(socket.get(), generic, length) != 0) {
        return -1;
    }
    length = sizeof(name);
    if (::getsockname(socket.get(), generic, &length) != 0 || length > sizeof(address.addr)) {
        return -1;
    }
    std::memcpy(&address.addr, generic, length);
    address.addrlen = length;
    return socket.release();
}

void append(curl_slist*& lines, const char* line) {
    curl_slist* longer = curl_slist_append(lines, line);
    require(longer != nullptr);
    lines = longer;
}

}  // namespace

HttpExchange::HttpExchange(int connection, const HttpRequest& request, const Deadline& deadline,
                           const HttpLimits& limits)
    : connection(connection), deadline(deadline), limits(limits), answer_(limits.head) {
    initializeCurlOnce();
    easy = curl_easy_init();
    multi = curl_multi_init();
    try {
        require(easy != nullptr && multi != nullptr);
        setOptions(request);
        require(curl_multi_add_handle(multi, easy) == CURLM_OK);
    } catch (const Exception&) {
        release();
        throw;
    }
}

HttpExchange::~HttpExchange() {
    release();
}

void HttpExchange::release() {
    curl_multi_remove_handle(multi, easy);
    curl_easy_cleanup(easy);
    curl_multi_cleanup(multi);
    curl_slist_free_all(headerLines);
}

void HttpExchange::setOptions(const HttpRequest& request) {
    append(headerLines, "Host: localhost");
    for (const std::string& line : request.headerLines) {
        append(headerLines, line.c_str());
    }
    // Fields that libcurl would add.
    append(headerLines, "Accept:");
    append(headerLines, "Expect:");

    // A numeric address keeps libcurl from asking a resolver; no connection is made to it.
    setOption(easy, CURLOPT_URL, "http://127.0.0.1/cimom");
    setOption(easy, CURLOPT_HTTP_VERSION, static_cast<long>(CURL_HTTP_VERSION_1_1));
    setOption(easy, CURLOPT_ERRORBUFFER, details.data());
    setOption(easy, CURLOPT_PROXY, "");
    setOption(easy, CURLOPT_NOSIGNAL, 1L);
    setOption(easy, CURLOPT_TCP_NODELAY, 0L);
    setOption(easy, CURLOPT_BUFFERSIZE, kBufferOctets);
    setOption(easy, CURLOPT_MAXFILESIZE_LARGE, static_cast<curl_off_t>(limits.body));
    setOption(easy, CURLOPT_POST, 1L);
    setOption(easy, CURLOPT_POSTFIELDS, request.body.data());
    setOption(easy, CURLOPT_POSTFIELDSIZE_LARGE, static_cast<curl_off_t>(request.body.size()));
    setOption(easy, CURLOPT_HTTPHEADER, headerLines);
    setOption(easy, CURLOPT_HEADERFUNCTION, &HttpExchange::onHeaderLine);
    setOption(easy, CURLOPT_HEADERDATA, static_cast<void*>(this));
    setOption(easy, CURLOPT_WRITEFUNCTION, &HttpExchange::onBody);
    setOption(easy, CURLOPT_WRITEDATA, static_cast<void*>(this));
    setOption(easy, CURLOPT_OPENSOCKETFUNCTION, &HttpExchange::onOpen);
    setOption(easy, CURLOPT_OPENSOCKETDATA, static_cast<void*>(this));
    setOption(easy, CURLOPT_PREREQFUNCTION, &HttpExchange::onConnected);
    setOption(easy, CURLOPT_PREREQDATA, static_cast<void*>(this));
    setOption(easy, CURLOPT_CLOSESOCKETFUNCTION, &HttpExchange::onClose);
    setOption(easy, CURLOPT_CLOSESOCKETDATA, static_cast<void*>(this));
}

std::size_t HttpExchange::onHeaderLine(char* data, std::size_t size, std::size_t count,
                                       void* self) {
    auto* exchange = static_cast<HttpExchange*>(self);
    try {
        exchange->answer_.addLine(std::string_view(data, size * count));
        return size * count;
    } catch (...) {
        exchange->failure = std::current_exception();
        return 0;
    }
}

std::size_t HttpExchange::onBody(char* data, std::size_t size, std::size_t count, void* self) {
    auto* exchange = static_cast<HttpExchange*>(self);
    try {
        exchange->takeBody(data, size * count);
        return size * count;
    } catch (...) {
        exchange->failure = std::current_exception();
        return 0;
    }
}

// libcurl connects what it opens itself, and versions 7.88.0 and 7.88.1 do so even when they are
// told that it is connected. So it gets a placeholder whose connecting succeeds at once, and the
// connection takes the placeholder's number just before the request is sent.
// There is no second placeholder: libcurl cannot send a request again.
curl_socket_t HttpExchange::onOpen(void* self, curlsocktype /*purpose*/, curl_sockaddr* address) {
    auto* exchange = static_cast<HttpExchange*>(self);
    if (exchange->placeholder >= 0) {
        return CURL_SOCKET_BAD;
    }
    exchange->placeholder = openPlaceholder(*address);
    return exchange->placeholder < 0 ? CURL_SOCKET_BAD : exchange->placeholder;
}

int HttpExchange::onConnected(void* self, char* /*peer*/, char* /*local*/, int /*peerPort*/,
                              int /*localPort*/) {
    const auto* exchange = static_cast<HttpExchange*>(self);
    const int moved = ::dup3(exchange->connection, exchange->placeholder, O_CLOEXEC);
    return moved < 0 ? CURL_PREREQFUNC_ABORT : CURL_PREREQFUNC_OK;
}

int HttpExchange::onClose(void* self, curl_socket_t socket) {
    static_cast<HttpExchange*>(self)->closedByCurl = true;
    return ::close(socket);
}

void HttpExchange::takeBody(const char* data, std::size_t count) {
    bodyOctets += count;
    if (bodyOctets > limits.body) {
        throw CIMClientMalformedHTTPException("HTTP answer is longer than the limit");
    }
    const std::size_t direct = std::min(count, targetRoom);
    if (direct > 0) {
        std::memcpy(target, data, direct);
        target += direct;
        targetRoom -= direct;
    }
    pending.append(data + direct, count - direct);
}

const HttpAnswer& HttpExchange::awaitHead() {
    advance();
    while (!answer_.isHeadComplete()) {
        throwIfFailed();
        wait();
        advance();
    }
    return answer_;
}

std::size_t HttpExchange::read(char* buffer, std::size_t capacity) {
    if (pendingStart < pending.size()) {
        const std::size_t count = pending.copy(buffer, capacity, pendingStart);
        pendingStart += count;
        return count;
    }
    pending.clear();
    pendingStart = 0;

    target = buffer;
    targetRoom = capacity;
    while (targetRoom == capacity && !ended) {
        advance();
        if (targetRoom == capacity && !ended) {
            wait();
        }
    }
    const std::size_t count = capacity - targetRoom;
    target = nullptr;
    targetRoom = 0;
    if (count == 0) {
        throwIfFailed();
    }
    return count;
}

void HttpExchange::skipBody() {
    // Not cleared first: most often there is nothing left.
    std::array<char, kSkipOctets> ignored;
    while (read(ignored.data(), ignored.size()) > 0) {
    }
}

// Does what can be done without waiting.
void HttpExchange::advance() {
    if (ended) {
        return;
    }
    if (deadline.hasPassed()) {
        throw ConnectionTimeoutException("The CIM server did not answer within the time-out");
    }
    int running = 0;
    require(curl_multi_perform(multi, &running) == CURLM_OK);
    int left = 0;
    while (const CURLMsg* message = curl_multi_info_read(multi, &left)) {
        if (message->msg == CURLMSG_DONE) {
            ended = true;
            result = message->data.result;
        }
    }
}

void HttpExchange::wait() const {
    require(curl_multi_poll(multi, nullptr, 0, deadline.millisecondsLeft(), nullptr) == CURLM_OK);
}

void HttpExchange::throwIfFailed() const {
    if (failure) {
        std::rethrow_exception(failure);
    }
    if (!ended || (result == CURLE_OK && answer_.isHeadComplete())) {
        return;
    }
    const std::string where =
        answer_.isHeadComplete() ? "in the body of its answer" : "before the end of its header";
    throw CIMClientMalformedHTTPException(printableText("The CIM server's HTTP connection failed " +
                                                        where + ": " + reasonOfFailure()));
}

std::string HttpExchange::reasonOfFailure() const {
    // What libcurl calls lack of memory is, but for that, a line beyond its own limit.
    if (result == CURLE_OUT_OF_MEMORY) {
        return "a line is too long, or memory is short";
    }
    return details.front() != '\0' ? details.data() : curl_easy_strerror(result);
}

}  // namespace Pegasus
