#pragma once

// HTTP/1.1 for the CIM service, by libmicrohttpd, which runs its own threads.

#include <chrono>
#include <functional>
#include <memory>

#include "protocol/CimService.h"

namespace cimomd {

struct HttpLimits {
    unsigned maxConnections = 128;
    /// What a client has for each step: to send a request's head, its body, and to take each
    /// piece of the answer; also how long a connection may stay idle. 0 for ever.
    std::chrono::seconds patience{30};
};

/// Every connection has a thread of its own, so that a slow source keeps nobody else waiting.
class HttpServer {
  public:
    /// `cimService` must outlive the server.
    HttpServer(const CimService& cimService, HttpLimits httpLimits);
    ~HttpServer();
    HttpServer(const HttpServer&) = delete;
    HttpServer& operator=(const HttpServer&) = delete;

    /// Raises std::runtime_error when it cannot start. `closed` is called from other threads when
    /// a connection has ended.
    void start(std::function<void()> closed);
    /// Closes all connections.
    void stop();

    /// Serves a connected stream socket and closes it at its end, also when false says that it
    /// cannot be served or that there is no place left for its user (ConnectionPlaces).
    bool serve(int connectedSocket);

    std::size_t connections() const;
    /// Whether some peer at this socket would be served. Where users are told, one has to be
    /// accepted to know.
    bool hasRoomAt(int listeningSocket) const;
    /// Ends the connections of clients that are too slow. To be called now and then.
    void closeOverdue();

  private:
    struct State;

    std::unique_ptr<State> state;
};

}  // namespace cimomd
