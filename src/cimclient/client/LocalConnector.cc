#include "client/LocalConnector.h"

#include <Pegasus/Common/Exception.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>

#include "client/UnixSocket.h"
#include "client/WireText.h"

namespace Pegasus {

namespace {

std::string environmentText(const char* name) {
    const char* value = ::secure_getenv(name);
    return value == nullptr ? "" : value;
}

bool isTrusted(uid_t user) {
    return user == 0 || user == ::geteuid();
}

bool programExists(const std::string& path) {
    return ::access(path.c_str(), X_OK) == 0;
}

// Whether a server has put a socket there. What anybody else put into a directory that all may
// write does not count: it must keep nobody from a server.
bool isServerSocket(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 && S_ISSOCK(status.st_mode) &&
           isTrusted(status.st_uid);
}

std::optional<uid_t> ownerOf(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 ? std::optional<uid_t>(status.st_uid) : std::nullopt;
}

// Why a path of a known place is passed over.
std::string reasonToSkip(const std::string& path) {
    struct stat status {};
    if (::lstat(path.c_str(), &status) != 0) {
        return errno == ENOENT ? "not there" : std::generic_category().message(errno);
    }
    return S_ISSOCK(status.st_mode) ? "belongs neither to root nor to this user" : "is no socket";
}

// Notes what becomes of each place, if anybody wants to know.
class SearchLog {
  public:
    explicit SearchLog(std::vector<TriedPlace>* tried) : tried(tried) {}

    void add(const std::string& path, const std::string& result, bool chosen = false) const {
        if (tried != nullptr) {
            tried->push_back({path, ownerOf(path), result, chosen});
        }
    }

  private:
    std::vector<TriedPlace>* tried;
};

// Connects to one socket. Without success the connection is not open and `reason` says why.
ServerConnection connectTo(const std::string& path, FinalLink finalLink, const Deadline& deadline,
                           const SearchLog& log, std::string& reason) {
    ConnectResult result = connectUnixSocket(path, finalLink, deadline);
    if (result.error == ETIMEDOUT) {
        log.add(path, "does not take the connection within the time-out");
        throw ConnectionTimeoutException(
            printableText("Cannot connect to " + path + " within the time-out"));
    }
    if (result.error != 0) {
        reason = std::generic_category().message(result.error);
        return {};
    }
    const std::optional<uid_t> user = peerUserOf(result.socket);
    if (!user.has_value() || !isTrusted(*user)) {
        reason = "its server runs neither as root nor as this user";
        return {};
    }
    return {nullptr, std::move(result.socket), *user};
}

ServerConnection connectToNamedSocket(const std::string& path, const Deadline& deadline,
                                      const SearchLog& log) {
    std::string reason;
    ServerConnection connection = connectTo(path, FinalLink::Follow, deadline, log, reason);
    const bool connected = connection.socket.isOpen();
    log.add(path, connected ? "connected" : reason, connected);
    if (!connected) {
        throw CannotConnectException(
            printableText("Cannot connect to CIM server: " + path + ": " + reason));
    }
    return connection;
}

std::string embeddedProgram(const ServerPlaces& places) {
    std::string program = environmentText("CIM_COMMAND");
    if (!program.empty()) {
        return program;
    }
    const auto found =
        std::find_if(places.embeddedPrograms.begin(), places.embeddedPrograms.end(), programExists);
    if (found == places.embeddedPrograms.end()) {
        throw CannotConnectException("No CIM server on this machine, and no cimomd to start");
    }
    return *found;
}

ServerConnection startServer(const ServerPlaces& places, const Deadline& deadline,
                             const SearchLog& log) {
    if (environmentText("CIM_EMBEDDED") == "never") {
        throw CannotConnectException("No CIM server on this machine, and CIM_EMBEDDED is never");
    }
    const std::string program = embeddedProgram(places);
    std::array<int, 2> ends = {-1, -1};
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0) {
        throw CannotConnectException(
            printableText("Cannot make a socket pair: " + std::generic_category().message(errno)));
    }
    FileDescriptor ownEnd(ends[0]);
    FileDescriptor childEnd(ends[1]);
    auto child = std::make_unique<ChildProcess>(program, std::move(childEnd), deadline);
    log.add(program, "started for this connection, for no CIM server is installed", true);
    return {std::move(child), std::move(ownEnd), ::geteuid()};
}

}  // namespace

ServerConnection connectToLocalServer(const ServerPlaces& places, const Deadline& deadline,
                                      std::vector<TriedPlace>* tried) {
    const SearchLog log(tried);
    const std::string named = environmentText("CIM_LOCAL_SOCKET");
    if (!named.empty()) {
        return connectToNamedSocket(named, deadline, log);
    }
    std::string reasons;
    for (const std::string& path : places.sockets) {
        if (!isServerSocket(path)) {
            log.add(path, reasonToSkip(path));
            continue;
        }
        std::string reason;
        ServerConnection connection = connectTo(path, FinalLink::Refuse, deadline, log, reason);
        if (connection.socket.isOpen()) {
            log.add(path, "connected", true);
            return connection;
        }
        log.add(path, reason);
        reasons.append(reasons.empty() ? "" : "; ").append(path).append(": ").append(reason);
    }
    for (const std::string& program : places.programs) {
        if (reasons.empty() && programExists(program)) {
            reasons = program + " is installed but listens nowhere";
            log.add(program, "is installed but listens nowhere, so no other server is started");
        }
    }
    if (!reasons.empty()) {
        throw CannotConnectException(printableText("Cannot connect to CIM server: " + reasons));
    }
    return startServer(places, deadline, log);
}

}  // namespace Pegasus
