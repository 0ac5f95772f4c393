#pragma once

// Which connections are open, and until when each of them has to get on: a client that sends or
// reads too slowly must not keep its place for ever.

#include <atomic>
#include <chrono>
#include <cstdint>
#include <memory>
#include <mutex>
#include <set>

namespace cimomd {

/// One connection; its functions may be called from the thread that serves it.
class WatchedConnection {
  public:
    explicit WatchedConnection(int connectedSocket) : socket(connectedSocket) {}

    /// The client has this long for its next step; 0 for ever.
    void expectProgress(std::chrono::seconds within);
    /// It is the server's turn, however long it takes.
    void waitForServer();

  private:
    friend class ConnectionWatch;

    int socket;
    /// On the steady clock.
    std::atomic<std::int64_t> deadlineNs;
};

/// May be used from several threads at once.
class ConnectionWatch {
  public:
    /// The connection is watched until remove, which must come before the socket is closed.
    WatchedConnection* add(int connectedSocket);
    void remove(WatchedConnection* connection);

    /// Shuts down those whose time has run out. The server then finds their end and closes them.
    void shutDownOverdue();

  private:
    std::mutex guard;
    std::set<std::unique_ptr<WatchedConnection>> connections;
};

}  // namespace cimomd
