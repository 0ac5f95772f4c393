#pragma once

// HTTP/1.1 for the CIM service, by libmicrohttpd, which runs its own threads.

#include <functional>
#include <memory>

#include "protocol/CimService.h"

namespace cimomd {

struct HttpLimits {
    unsigned maxConnections = 128;
    /// Seconds without traffic after which a connection is closed; 0 for never.
    unsigned idleSeconds = 30;
};

class HttpServer {
  public:
    /// `cimService` must outlive the server.
    HttpServer(const CimService& cimService, HttpLimits httpLimits);
    /// Stops serving: closes all connections and, when it listened, the listening socket.
    ~HttpServer();
    HttpServer(const HttpServer&) = delete;
    HttpServer& operator=(const HttpServer&) = delete;

    /// Accepts connections from a listening socket, which the server closes at its end. Raises
    /// std::runtime_error when it cannot start. Call one of the two once.
    void listenOn(int listeningSocket);

    /// Serves one connected stream socket, which the server closes at its end. `closed` is called
    /// from another thread when the connection has ended. Raises std::runtime_error when it cannot
    /// start.
    void serveConnection(int connectedSocket, std::function<void()> closed);

  private:
    struct State;

    std::unique_ptr<State> state;
};

}  // namespace cimomd
