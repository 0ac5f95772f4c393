#pragma once

// A CIM server for tests: listens on a Unix domain socket in a temporary directory of its own and
// answers each request as scripted, over real HTTP. Every method may be called at any time from
// the test's thread while the server runs.
//
//   support::FakeCimServer server;
//   server.onGetClass("CIM_Fan", support::Reply::ok("<CLASS NAME=\"CIM_Fan\"/>"));
//   ... run a client with CIM_LOCAL_SOCKET=server.socketPath() ...
//   EXPECT_EQ(server.requests().size(), 1u);

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include "support/RecordedRequest.h"
#include "support/Reply.h"

namespace support {

class FakeCimServer {
  public:
    // Listens when the constructor returns. Throws std::runtime_error when it cannot.
    FakeCimServer();
    // Closes all connections and removes the socket.
    ~FakeCimServer();
    FakeCimServer(const FakeCimServer&) = delete;
    FakeCimServer& operator=(const FakeCimServer&) = delete;

    // The reply to every GetClass, or EnumerateInstances, of a class (its name in any case).
    // Without one a class is unknown: CIM error 6 and 5, as a trailer. Other methods get 7.
    void onGetClass(const std::string& className, Reply reply);
    void onEnumerateInstances(const std::string& className, Reply reply);
    // The reply to the next request whatever it is, before those above; several queue up.
    void onNext(Reply reply);

    std::string socketPath() const;
    // The requests read so far, in order.
    std::vector<RecordedRequest> requests() const;
    // How many connections were accepted so far.
    std::size_t connectionCount() const;
    // How many of them neither side has closed.
    std::size_t openConnectionCount() const;

    // Stops listening and removes the socket, as a server that ends; and starts anew at the same
    // path. Open connections are closed by stop().
    void stop();
    void start();

  private:
    struct State;
    std::unique_ptr<State> state;
};

}  // namespace support
