#include "protocol/HttpServer.h"

#include <microhttpd.h>
#include <sys/socket.h>
#include <unistd.h>

#include <chrono>
#include <stdexcept>
#include <string>
#include <utility>

#include "protocol/ConnectionPlaces.h"
#include "protocol/ConnectionWatch.h"
#include "protocol/PercentCoding.h"
#include "protocol/RequestHead.h"

namespace cimomd {

struct HttpServer::State {
    State(const CimService& cimService, HttpLimits httpLimits)
        : service(cimService), limits(httpLimits), places(httpLimits.maxConnections) {}

    const CimService& service;
    HttpLimits limits;
    std::function<void()> closed;
    ConnectionWatch watch;
    /// Taken from when a connection is handed to the library, which takes it up in its own time,
    /// until it is closed.
    ConnectionPlaces places;
    MHD_Daemon* daemon = nullptr;

    MHD_Result handle(MHD_Connection* connection, const RequestLine& line, std::string_view data,
                      void** context);
    MHD_Result begin(MHD_Connection* connection, const RequestLine& line, void** context);
};

namespace {

// A connection's memory holds the request's head and the piece of the answer being sent.
constexpr std::size_t kConnectionMemoryBytes = std::size_t{64} << 10;
constexpr std::size_t kAnswerPieceBytes = std::size_t{8} << 10;
// A body that is too long is read to its end, so that the client sees the refusal instead of a
// reset; beyond this the connection is simply closed.
constexpr std::size_t kMaxDrainedBytes = std::size_t{16} << 20;

/// One request while it arrives.
struct Exchange {
    HttpHead head;
    std::optional<HttpAnswer> refusal;
    std::string body;
    std::size_t receivedBytes = 0;

    bool takes(std::string_view piece) {
        receivedBytes += piece.size();
        if (receivedBytes > CimService::kMaxBodyBytes && !refusal)
            refusal = CimService::bodyTooLarge();
        if (!refusal)
            body += piece;
        return receivedBytes <= kMaxDrainedBytes;
    }
};

/// A body on its way out. The response is kept to put trailers into.
struct Sending {
    std::unique_ptr<ResponseStream> body;
    MHD_Response* response = nullptr;
    WatchedConnection* watched = nullptr;
    std::chrono::seconds patience{};
};

/// The server's turn: the time until its end does not count against the client.
class ServersTurn {
  public:
    ServersTurn(WatchedConnection* connection, std::chrono::seconds clientsPatience)
        : watched(connection), patience(clientsPatience) {
        watched->waitForServer();
    }
    ~ServersTurn() { watched->expectProgress(patience); }
    ServersTurn(const ServersTurn&) = delete;
    ServersTurn& operator=(const ServersTurn&) = delete;

  private:
    WatchedConnection* watched;
    std::chrono::seconds patience;
};

WatchedConnection* watchedOf(MHD_Connection* connection) {
    const MHD_ConnectionInfo* info =
        MHD_get_connection_info(connection, MHD_CONNECTION_INFO_SOCKET_CONTEXT);
    return static_cast<WatchedConnection*>(info->socket_context);
}

int socketOf(MHD_Connection* connection) {
    return MHD_get_connection_info(connection, MHD_CONNECTION_INFO_CONNECTION_FD)->connect_fd;
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
    const ServersTurn turn(sending->watched, sending->patience);
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

MHD_Response* responseOf(HttpAnswer& answer, WatchedConnection* watched,
                         std::chrono::seconds patience) {
    MHD_Response* response = nullptr;
    if (answer.body == nullptr) {
        response = MHD_create_response_from_buffer(0, nullptr, MHD_RESPMEM_PERSISTENT);
    } else {
        auto sending = std::make_unique<Sending>();
        sending->body = std::move(answer.body);
        sending->watched = watched;
        sending->patience = patience;
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

MHD_Result queue(MHD_Connection* connection, HttpAnswer answer, std::chrono::seconds patience) {
    MHD_Response* response = responseOf(answer, watchedOf(connection), patience);
    if (response == nullptr)
        return MHD_NO;
    const MHD_Result result = MHD_queue_response(connection, answer.status, response);
    MHD_destroy_response(response);
    return result;
}

void freeExchange(void** context) {
    delete static_cast<Exchange*>(*context);
    *context = nullptr;
}

}  // namespace

MHD_Result HttpServer::State::begin(MHD_Connection* connection, const RequestLine& line,
                                    void** context) {
    auto exchange = std::make_unique<Exchange>();
    exchange->head = requestHead(connection, line);
    exchange->refusal = service.refusalOf(exchange->head);
    const bool asksFirst =
        MHD_lookup_connection_value(connection, MHD_HEADER_KIND, MHD_HTTP_HEADER_EXPECT) != nullptr;
    // A client that asks before it sends its body is told at once; where an ambiguous request ends
    // nobody knows.
    if (exchange->refusal && (asksFirst || exchange->head.isAmbiguous))
        return queue(connection, std::move(*exchange->refusal), limits.patience);
    *context = exchange.release();
    watchedOf(connection)->expectProgress(limits.patience);
    return MHD_YES;
}

MHD_Result HttpServer::State::handle(MHD_Connection* connection, const RequestLine& line,
                                     std::string_view data, void** context) {
    auto* exchange = static_cast<Exchange*>(*context);
    if (exchange == nullptr)
        return begin(connection, line, context);
    if (!data.empty())
        return exchange->takes(data) ? MHD_YES : MHD_NO;
    const ServersTurn turn(watchedOf(connection), limits.patience);
    if (exchange->refusal)
        return queue(connection, std::move(*exchange->refusal), limits.patience);
    return queue(connection, service.answer(exchange->head, exchange->body), limits.patience);
}

HttpServer::HttpServer(const CimService& cimService, HttpLimits httpLimits)
    : state(std::make_unique<State>(cimService, httpLimits)) {}

HttpServer::~HttpServer() {
    stop();
}

void HttpServer::stop() {
    if (state->daemon != nullptr)
        MHD_stop_daemon(state->daemon);
    state->daemon = nullptr;
}

void HttpServer::start(std::function<void()> closed) {
    state->closed = std::move(closed);
    const auto handle = [](void* closure, MHD_Connection* connection, const char* url,
                           const char* method, const char* version, const char* data,
                           std::size_t* size, void** context) -> MHD_Result {
        try {
            const std::string_view piece(data, std::exchange(*size, 0));
            return static_cast<State*>(closure)->handle(connection, {method, url, version}, piece,
                                                        context);
        } catch (...) {
            // Out of memory: give this connection up, the others go on.
            return MHD_NO;
        }
    };
    const auto completed = [](void* closure, MHD_Connection* connection, void** context,
                              MHD_RequestTerminationCode) {
        freeExchange(context);
        watchedOf(connection)->expectProgress(static_cast<State*>(closure)->limits.patience);
    };
    const auto changed = [](void* closure, MHD_Connection* connection, void** socketContext,
                            MHD_ConnectionNotificationCode code) {
        auto* server = static_cast<State*>(closure);
        if (code == MHD_CONNECTION_NOTIFY_STARTED) {
            WatchedConnection* watched = server->watch.add(socketOf(connection));
            watched->expectProgress(server->limits.patience);
            *socketContext = watched;
        } else {
            server->watch.remove(static_cast<WatchedConnection*>(*socketContext));
            server->places.giveBack(Peer::of(socketOf(connection)));
            server->closed();
        }
    };
    using Handler = MHD_AccessHandlerCallback;
    state->daemon = MHD_start_daemon(
        MHD_USE_INTERNAL_POLLING_THREAD | MHD_USE_THREAD_PER_CONNECTION | MHD_USE_POLL |
            MHD_USE_ITC | MHD_USE_NO_LISTEN_SOCKET,
        0, nullptr, nullptr, static_cast<Handler>(handle), state.get(), MHD_OPTION_CONNECTION_LIMIT,
        state->limits.maxConnections + 1, MHD_OPTION_CONNECTION_TIMEOUT, 0U,
        MHD_OPTION_CONNECTION_MEMORY_LIMIT, kConnectionMemoryBytes, MHD_OPTION_NOTIFY_COMPLETED,
        static_cast<MHD_RequestCompletedCallback>(completed), state.get(),
        MHD_OPTION_NOTIFY_CONNECTION, static_cast<MHD_NotifyConnectionCallback>(changed),
        state.get(), MHD_OPTION_END);
    if (state->daemon == nullptr)
        throw std::runtime_error("the HTTP server cannot be started");
}

bool HttpServer::serve(int connectedSocket) {
    sockaddr_storage address{};
    socklen_t length = sizeof address;
    const Peer peer = Peer::of(connectedSocket);
    if (::getpeername(connectedSocket, reinterpret_cast<sockaddr*>(&address), &length) != 0 ||
        !state->places.take(peer)) {
        ::close(connectedSocket);
        return false;
    }
    if (MHD_add_connection(state->daemon, connectedSocket, reinterpret_cast<sockaddr*>(&address),
                           length) == MHD_YES)
        return true;
    state->places.giveBack(peer);
    return false;
}

std::size_t HttpServer::connections() const {
    return state->places.taken();
}

bool HttpServer::hasRoomAt(int listeningSocket) const {
    return tellsUser(listeningSocket) ? state->places.hasAny() : state->places.hasForUnknown();
}

void HttpServer::closeOverdue() {
    state->watch.shutDownOverdue();
}

}  // namespace cimomd
