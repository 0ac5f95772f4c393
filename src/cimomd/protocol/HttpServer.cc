#include "protocol/HttpServer.h"

#include <microhttpd.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <stdexcept>
#include <string>
#include <utility>

#include "protocol/PercentCoding.h"

namespace cimomd {

struct HttpServer::State {
    const CimService& service;
    HttpLimits limits;
    std::function<void()> closed;
    MHD_Daemon* daemon = nullptr;
};

namespace {

// A connection's memory holds the request's head and the piece of the answer being sent.
constexpr std::size_t kConnectionMemoryBytes = std::size_t{32} << 10;
constexpr std::size_t kAnswerPieceBytes = std::size_t{8} << 10;
constexpr unsigned kListenThreads = 4;
// A body that is too long is read to its end, so that the client sees the refusal instead of a
// reset; beyond this the connection is simply closed.
constexpr std::size_t kMaxDrainedBytes = std::size_t{16} << 20;
constexpr auto kMaxUploadTime = std::chrono::seconds(60);

/// One request while it arrives.
struct Exchange {
    HttpHead head;
    std::optional<HttpAnswer> refusal;
    std::string body;
    std::size_t receivedBytes = 0;
    std::chrono::steady_clock::time_point started = std::chrono::steady_clock::now();

    bool takes(std::string_view piece) {
        receivedBytes += piece.size();
        if (receivedBytes > CimService::kMaxBodyBytes && !refusal)
            refusal = CimService::bodyTooLarge();
        if (!refusal)
            body += piece;
        const bool tooSlow = std::chrono::steady_clock::now() - started > kMaxUploadTime;
        return receivedBytes <= kMaxDrainedBytes && !tooSlow;
    }
};

/// A body on its way out. The response is kept to put trailers into.
struct Sending {
    std::unique_ptr<ResponseStream> body;
    MHD_Response* response = nullptr;
    bool trailers = false;
};

std::optional<std::string> header(MHD_Connection* connection, const char* name) {
    const char* value = MHD_lookup_connection_value(connection, MHD_HEADER_KIND, name);
    return value == nullptr ? std::nullopt : std::optional<std::string>(value);
}

HttpHead headOf(MHD_Connection* connection, const char* url, const char* method) {
    HttpHead head;
    head.method = method;
    head.path = url;
    head.contentType = header(connection, MHD_HTTP_HEADER_CONTENT_TYPE);
    head.contentLength = header(connection, MHD_HTTP_HEADER_CONTENT_LENGTH);
    head.te = header(connection, MHD_HTTP_HEADER_TE);
    head.cimOperation = header(connection, "CIMOperation");
    head.cimMethod = header(connection, "CIMMethod");
    head.cimObject = header(connection, "CIMObject");
    return head;
}

void addTrailers(const Sending& sending) {
    const auto& status = sending.body->trailerStatus();
    if (!status)
        return;
    MHD_add_response_footer(sending.response, "CIMStatusCode",
                            std::to_string(status->code).c_str());
    MHD_add_response_footer(sending.response, "CIMStatusCodeDescription",
                            percentEncoded(status->description).c_str());
}

ssize_t readAnswer(void* closure, std::uint64_t, char* buffer, std::size_t capacity) try {
    auto* sending = static_cast<Sending*>(closure);
    std::size_t count = 0;
    switch (sending->body->read(buffer, capacity, count)) {
        case ResponseStream::Outcome::Data:
            return static_cast<ssize_t>(count);
        case ResponseStream::Outcome::End:
            addTrailers(*sending);
            return MHD_CONTENT_READER_END_OF_STREAM;
        case ResponseStream::Outcome::Broken:
            break;
    }
    return MHD_CONTENT_READER_END_WITH_ERROR;
} catch (...) {
    // Out of memory: nothing may be thrown through the C library.
    return MHD_CONTENT_READER_END_WITH_ERROR;
}

void freeSending(void* closure) {
    delete static_cast<Sending*>(closure);
}

MHD_Response* responseOf(HttpAnswer& answer) {
    MHD_Response* response = nullptr;
    if (answer.body == nullptr) {
        response = MHD_create_response_from_buffer(0, nullptr, MHD_RESPMEM_PERSISTENT);
    } else {
        auto sending = std::make_unique<Sending>();
        sending->body = std::move(answer.body);
        sending->trailers = answer.trailers;
        Sending* closure = sending.release();
        response = MHD_create_response_from_callback(MHD_SIZE_UNKNOWN, kAnswerPieceBytes,
                                                     readAnswer, closure, freeSending);
        if (response == nullptr)
            delete closure;
        else
            closure->response = response;
    }
    if (response == nullptr)
        return nullptr;
    for (const auto& [name, value] : answer.headers)
        MHD_add_response_header(response, name.c_str(), value.c_str());
    return response;
}

MHD_Result queue(MHD_Connection* connection, HttpAnswer answer) {
    MHD_Response* response = responseOf(answer);
    if (response == nullptr)
        return MHD_NO;
    const MHD_Result result = MHD_queue_response(connection, answer.status, response);
    MHD_destroy_response(response);
    return result;
}

MHD_Result begin(const CimService& service, MHD_Connection* connection, const char* url,
                 const char* method, void** context) {
    auto exchange = std::make_unique<Exchange>();
    exchange->head = headOf(connection, url, method);
    exchange->refusal = service.refusalOf(exchange->head);
    const auto expect = header(connection, MHD_HTTP_HEADER_EXPECT);
    // A client that asks before it sends its body is told at once.
    if (exchange->refusal && expect)
        return queue(connection, std::move(*exchange->refusal));
    *context = exchange.release();
    return MHD_YES;
}

MHD_Result handle(void* closure, MHD_Connection* connection, const char* url, const char* method,
                  const char*, const char* data, std::size_t* size, void** context) try {
    const CimService& service = *static_cast<const CimService*>(closure);
    auto* exchange = static_cast<Exchange*>(*context);
    if (exchange == nullptr)
        return begin(service, connection, url, method, context);
    if (*size != 0) {
        const bool goOn = exchange->takes({data, *size});
        *size = 0;
        return goOn ? MHD_YES : MHD_NO;
    }
    if (exchange->refusal)
        return queue(connection, std::move(*exchange->refusal));
    return queue(connection, service.answer(exchange->head, exchange->body));
} catch (...) {
    // Out of memory: give this connection up, the others go on.
    return MHD_NO;
}

void completed(void*, MHD_Connection*, void** context, MHD_RequestTerminationCode) {
    delete static_cast<Exchange*>(*context);
    *context = nullptr;
}

void connectionChanged(void* closure, MHD_Connection*, void**,
                       MHD_ConnectionNotificationCode code) {
    const auto& closed = *static_cast<const std::function<void()>*>(closure);
    if (code == MHD_CONNECTION_NOTIFY_CLOSED && closed)
        closed();
}

}  // namespace

HttpServer::HttpServer(const CimService& cimService, HttpLimits httpLimits)
    : state(new State{cimService, httpLimits, {}, nullptr}) {}

HttpServer::~HttpServer() {
    if (state->daemon != nullptr)
        MHD_stop_daemon(state->daemon);
}

void HttpServer::listenOn(int listeningSocket) {
    // The library shares the connections out among its threads and wants at least one for each.
    const unsigned connections = std::max(state->limits.maxConnections, kListenThreads);
    state->daemon = MHD_start_daemon(
        MHD_USE_INTERNAL_POLLING_THREAD | MHD_USE_EPOLL, 0, nullptr, nullptr, handle,
        const_cast<CimService*>(&state->service), MHD_OPTION_LISTEN_SOCKET, listeningSocket,
        MHD_OPTION_THREAD_POOL_SIZE, kListenThreads, MHD_OPTION_CONNECTION_LIMIT, connections,
        MHD_OPTION_CONNECTION_TIMEOUT, state->limits.idleSeconds,
        MHD_OPTION_CONNECTION_MEMORY_LIMIT, kConnectionMemoryBytes, MHD_OPTION_NOTIFY_COMPLETED,
        completed, nullptr, MHD_OPTION_END);
    if (state->daemon == nullptr)
        throw std::runtime_error("the HTTP server cannot be started");
}

void HttpServer::serveConnection(int connectedSocket, std::function<void()> closed) {
    state->closed = std::move(closed);
    state->daemon = MHD_start_daemon(
        MHD_USE_INTERNAL_POLLING_THREAD | MHD_USE_POLL | MHD_USE_ITC | MHD_USE_NO_LISTEN_SOCKET, 0,
        nullptr, nullptr, handle, const_cast<CimService*>(&state->service),
        MHD_OPTION_CONNECTION_LIMIT, 1U, MHD_OPTION_CONNECTION_TIMEOUT, 0U,
        MHD_OPTION_CONNECTION_MEMORY_LIMIT, kConnectionMemoryBytes, MHD_OPTION_NOTIFY_COMPLETED,
        completed, nullptr, MHD_OPTION_NOTIFY_CONNECTION, connectionChanged, &state->closed,
        MHD_OPTION_END);
    sockaddr_storage peer{};
    peer.ss_family = AF_UNIX;
    if (state->daemon == nullptr ||
        MHD_add_connection(state->daemon, connectedSocket, reinterpret_cast<sockaddr*>(&peer),
                           sizeof(sa_family_t)) != MHD_YES)
        throw std::runtime_error("the connection cannot be served");
}

}  // namespace cimomd
