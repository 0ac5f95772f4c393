#include "support/FakeCimServer.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cstdint>
#include <cstring>
#include <deque>
#include <map>
#include <mutex>
#include <optional>
#include <stdexcept>
#include <thread>
#include <utility>

#include "support/ReplySender.h"
#include "support/RequestReader.h"
#include "support/TempDirectory.h"

namespace support {

namespace {

std::string folded(std::string name) {
    std::transform(name.begin(), name.end(), name.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return name;
}

int listenAt(const std::string& path) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.size() >= sizeof(address.sun_path)) {
        throw std::runtime_error("socket path too long: " + path);
    }
    std::memcpy(address.sun_path, path.c_str(), path.size() + 1);
    const int listener = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (listener < 0 ||
        bind(listener, reinterpret_cast<const sockaddr*>(&address), sizeof(address)) != 0 ||
        listen(listener, 64) != 0) {
        throw std::runtime_error("cannot listen at " + path + ": " + std::strerror(errno));
    }
    return listener;
}

}  // namespace

struct FakeCimServer::State {
    using Key = std::pair<std::string, std::string>;  // method, class name in lower case

    TempDirectory directory;
    mutable std::mutex mutex;
    std::map<Key, Reply> replies;
    std::deque<Reply> nextReplies;
    std::vector<RecordedRequest> requests;
    std::size_t connectionCount = 0;

    int listener = -1;
    int stopDescriptor = -1;  // readable from the stop on, for every thread
    std::thread acceptor;
    std::vector<std::thread> connectionThreads;  // touched by the acceptor, or after it has ended
    std::vector<int> connections;

    void acceptConnections();
    void serve(int connection);
    bool takeReset();
    Reply replyFor(const RecordedRequest& request);
};

void FakeCimServer::State::acceptConnections() {
    for (;;) {
        std::array<pollfd, 2> descriptors = {pollfd{listener, POLLIN, 0},
                                             pollfd{stopDescriptor, POLLIN, 0}};
        if (poll(descriptors.data(), descriptors.size(), -1) < 0 || descriptors[1].revents != 0) {
            return;
        }
        const int connection = accept4(listener, nullptr, nullptr, SOCK_CLOEXEC);
        if (connection < 0) {
            continue;
        }
        {
            const std::lock_guard lock(mutex);
            ++connectionCount;
            connections.push_back(connection);
        }
        connectionThreads.emplace_back([this, connection] { serve(connection); });
    }
}

void FakeCimServer::State::serve(int connection) {
    RequestReader reader(connection, stopDescriptor);
    bool open = true;
    while (open && reader.waitForOctets() && !takeReset()) {
        const std::optional<RecordedRequest> request = reader.next();
        open = request.has_value() &&
               sendReply(connection, stopDescriptor, replyFor(*request), *request);
    }
    const std::lock_guard lock(mutex);
    std::erase(connections, connection);
    close(connection);
}

bool FakeCimServer::State::takeReset() {
    const std::lock_guard lock(mutex);
    if (nextReplies.empty() || !nextReplies.front().closesBeforeReading()) {
        return false;
    }
    nextReplies.pop_front();
    return true;
}

Reply FakeCimServer::State::replyFor(const RecordedRequest& request) {
    const std::lock_guard lock(mutex);
    requests.push_back(request);
    if (!nextReplies.empty()) {
        Reply reply = nextReplies.front();
        nextReplies.pop_front();
        return reply;
    }
    const auto found = replies.find(Key(request.method, folded(request.className)));
    if (found != replies.end()) {
        return found->second;
    }
    if (request.method == "GetClass") {
        return Reply::cimError(6, "CIM_ERR_NOT_FOUND: " + request.className);
    }
    if (request.method == "EnumerateInstances") {
        return Reply::cimError(5, "CIM_ERR_INVALID_CLASS: " + request.className);
    }
    return Reply::cimError(7, "CIM_ERR_NOT_SUPPORTED: " + request.method);
}

FakeCimServer::FakeCimServer() : state(std::make_unique<State>()) {
    start();
}

FakeCimServer::~FakeCimServer() {
    stop();
}

void FakeCimServer::start() {
    if (state->listener >= 0) {
        return;
    }
    state->listener = listenAt(socketPath());
    state->stopDescriptor = eventfd(0, EFD_CLOEXEC);
    state->acceptor = std::thread([this] { state->acceptConnections(); });
}

void FakeCimServer::stop() {
    if (state->listener < 0) {
        return;
    }
    unlink(socketPath().c_str());
    const std::uint64_t one = 1;
    if (write(state->stopDescriptor, &one, sizeof(one)) != sizeof(one)) {
        std::terminate();
    }
    state->acceptor.join();
    {
        // A thread may be blocked in sending to a client that does not read.
        const std::lock_guard lock(state->mutex);
        for (const int connection : state->connections) {
            shutdown(connection, SHUT_RDWR);
        }
    }
    for (std::thread& thread : state->connectionThreads) {
        thread.join();
    }
    state->connectionThreads.clear();
    close(std::exchange(state->listener, -1));
    close(std::exchange(state->stopDescriptor, -1));
}

void FakeCimServer::onGetClass(const std::string& className, Reply reply) {
    const std::lock_guard lock(state->mutex);
    state->replies.insert_or_assign({"GetClass", folded(className)}, std::move(reply));
}

void FakeCimServer::onEnumerateInstances(const std::string& className, Reply reply) {
    const std::lock_guard lock(state->mutex);
    state->replies.insert_or_assign({"EnumerateInstances", folded(className)}, std::move(reply));
}

void FakeCimServer::onNext(Reply reply) {
    const std::lock_guard lock(state->mutex);
    state->nextReplies.push_back(std::move(reply));
}

std::string FakeCimServer::socketPath() const {
    return state->directory.path("cim.socket");
}

std::vector<RecordedRequest> FakeCimServer::requests() const {
    const std::lock_guard lock(state->mutex);
    return state->requests;
}

std::size_t FakeCimServer::connectionCount() const {
    const std::lock_guard lock(state->mutex);
    return state->connectionCount;
}

std::size_t FakeCimServer::openConnectionCount() const {
    const std::lock_guard lock(state->mutex);
    return state->connections.size();
}

}  // namespace support
