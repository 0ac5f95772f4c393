#pragma once

// The daemon's main thread: takes connections as long as there is room, watches over their time,
// and obeys signals.

#include <chrono>
#include <functional>
#include <string_view>
#include <vector>

#include "protocol/HttpServer.h"
#include "service/ConnectionLog.h"
#include "service/Log.h"
#include "service/Signals.h"

namespace cimomd {

class MainLoop {
  public:
    /// Both must outlive the loop. Raises std::runtime_error when the kernel gives no descriptor.
    MainLoop(HttpServer& httpServer, Signals& daemonSignals);
    /// Closes all connections. When a provider still works after five seconds, the process ends
    /// without it.
    ~MainLoop();
    MainLoop(const MainLoop&) = delete;
    MainLoop& operator=(const MainLoop&) = delete;

    /// Takes connections from a listening, non-blocking socket, which stays the caller's.
    void listenOn(int listeningSocket) { listeners.push_back(listeningSocket); }

    /// Takes one connected stream socket over and ends with it.
    void serveOnly(int connectedSocket);

    /// Returns when a signal or the end of the only connection asks for it. `reload` is called for
    /// SIGHUP.
    void run(const std::function<void()>& reload);

  private:
    void wait();
    void acceptFrom(int listeningSocket);
    bool obeySignals(const std::function<void()>& reload);

    HttpServer& server;
    Signals& signals;
    std::vector<int> listeners;
    ConnectionLog connectionLog{[](std::string_view line) { logText(LogLevel::Info, line); }};
    /// Written to by the server's threads when a connection has ended.
    int ended = -1;
    bool onlyOne = false;
    std::chrono::steady_clock::time_point acceptAgain{};
};

}  // namespace cimomd
