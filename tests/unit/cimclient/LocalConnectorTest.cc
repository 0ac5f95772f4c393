#include "client/LocalConnector.h"

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstring>
#include <filesystem>
#include <string>
#include <vector>

#include "TestConnections.h"
#include "client/UnixSocket.h"
#include "support/FakeCimServer.h"
#include "support/Files.h"
#include "support/ScopedEnvironment.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

using support::FakeCimServer;
using support::ScopedEnvironment;
using testing_client::messageOf;
using testing_client::Stopwatch;

constexpr uid_t kStranger = 12345;

FileDescriptor listenAt(const std::string& path, int backlog) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, path.c_str(), sizeof(address.sun_path) - 1);
    FileDescriptor listener(socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    EXPECT_EQ(bind(listener.get(), reinterpret_cast<sockaddr*>(&address), sizeof(address)), 0);
    EXPECT_EQ(listen(listener.get(), backlog), 0);
    return listener;
}

// A socket file that nobody listens at.
void leaveStaleSocket(const std::string& path) {
    listenAt(path, 1);
}

// A process of another user that listens at a path, as long as the object lives.
class StrangersServer {
  public:
    explicit StrangersServer(const std::string& path) {
        std::array<int, 2> ready{};
        EXPECT_EQ(pipe(ready.data()), 0);
        child = fork();
        if (child == 0) {
            if (setuid(kStranger) != 0) {
                _exit(1);
            }
            const FileDescriptor listener = listenAt(path, 1);
            const bool told = write(ready[1], "r", 1) == 1;
            while (told) {
                pause();
            }
            _exit(1);
        }
        close(ready[1]);
        char octet = 0;
        EXPECT_EQ(read(ready[0], &octet, 1), 1);
        close(ready[0]);
    }
    ~StrangersServer() {
        kill(child, SIGKILL);
        waitpid(child, nullptr, 0);
    }
    StrangersServer(const StrangersServer&) = delete;
    StrangersServer& operator=(const StrangersServer&) = delete;

  private:
    pid_t child = -1;
};

class LocalConnectorTest : public testing::Test {
  protected:
    ServerConnection connect(Uint32 milliseconds = 5000) const {
        return connectToLocalServer(places, Deadline(milliseconds));
    }

    ScopedEnvironment noSocket{"CIM_LOCAL_SOCKET"};
    ScopedEnvironment noCommand{"CIM_COMMAND"};
    ScopedEnvironment noChild{"CIM_EMBEDDED", "never"};
    support::TempDirectory directory;
    ServerPlaces places;
};

TEST_F(LocalConnectorTest, TakesTheSocketThatTheEnvironmentNames) {
    FakeCimServer known;
    FakeCimServer named;
    places.sockets = {known.socketPath()};
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", named.socketPath());
    const ServerConnection connection = connect();
    EXPECT_TRUE(connection.socket.isOpen());
    EXPECT_EQ(connection.child, nullptr);
    EXPECT_EQ(connection.serverUser, geteuid());
    EXPECT_EQ(known.connectionCount(), 0U);
}

TEST_F(LocalConnectorTest, TheNamedSocketIsTheOnlyOne) {
    FakeCimServer known;
    places.sockets = {known.socketPath()};
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", directory.path("none"));
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    const std::string message = messageOf<CannotConnectException>([&] { connect(); });
    EXPECT_EQ(message, "Cannot connect to CIM server: " + directory.path("none") +
                           ": No such file or directory");
    EXPECT_EQ(known.connectionCount(), 0U);
}

TEST_F(LocalConnectorTest, TellsEachPlaceThatItTried) {
    FakeCimServer server;
    const std::string stale = directory.path("stale");
    leaveStaleSocket(stale);
    places.sockets = {directory.path("none"), directory.write("file", ""), stale,
                      server.socketPath(), directory.path("beyond")};
    std::vector<TriedPlace> tried;
    connectToLocalServer(places, Deadline(5000), &tried);
    ASSERT_EQ(tried.size(), 4U);
    EXPECT_EQ(tried[0].path, directory.path("none"));
    EXPECT_EQ(tried[0].result, "not there");
    EXPECT_EQ(tried[0].owner, std::nullopt);
    EXPECT_EQ(tried[1].result, "is no socket");
    EXPECT_EQ(tried[1].owner, geteuid());
    EXPECT_EQ(tried[2].result, "Connection refused");
    EXPECT_FALSE(tried[2].chosen);
    EXPECT_EQ(tried[3].path, server.socketPath());
    EXPECT_EQ(tried[3].result, "connected");
    EXPECT_TRUE(tried[3].chosen);
}

TEST_F(LocalConnectorTest, TellsWhatItTriedBeforeItGaveUp) {
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", directory.path("none"));
    std::vector<TriedPlace> tried;
    EXPECT_THROW(connectToLocalServer(places, Deadline(5000), &tried), CannotConnectException);
    ASSERT_EQ(tried.size(), 1U);
    EXPECT_EQ(tried[0].result, "No such file or directory");
    EXPECT_FALSE(tried[0].chosen);
}

TEST_F(LocalConnectorTest, AnEmptyNameIsNoName) {
    FakeCimServer known;
    places.sockets = {known.socketPath()};
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", "");
    EXPECT_TRUE(connect().socket.isOpen());
}

TEST_F(LocalConnectorTest, TheNamedSocketMayBeALinkOrHaveALongPath) {
    FakeCimServer server;
    const std::string deep = directory.path(std::string(200, 'd'));
    std::filesystem::create_directory(deep);
    std::filesystem::create_symlink(server.socketPath(), deep + "/link");
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", deep + "/link");
    EXPECT_TRUE(connect().socket.isOpen());
}

TEST_F(LocalConnectorTest, ANamedFileThatIsNoSocketIsRefused) {
    support::writeFile(directory.path("f"), "");
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", directory.path("f"));
    EXPECT_THROW(connect(), CannotConnectException);
}

TEST_F(LocalConnectorTest, TakesTheFirstKnownSocketThatAnswers) {
    FakeCimServer first;
    FakeCimServer second;
    leaveStaleSocket(directory.path("stale"));
    places.sockets = {directory.path("missing"), directory.path("stale"), first.socketPath(),
                      second.socketPath()};
    EXPECT_TRUE(connect().socket.isOpen());
    EXPECT_EQ(second.connectionCount(), 0U);
}

TEST_F(LocalConnectorTest, AKnownSocketThatIsALinkDoesNotCount) {
    FakeCimServer server;
    std::filesystem::create_symlink(server.socketPath(), directory.path("link"));
    places.sockets = {directory.path("link")};
    EXPECT_THROW(connect(), CannotConnectException);
    EXPECT_EQ(server.connectionCount(), 0U);
}

TEST_F(LocalConnectorTest, AStaleSocketMeansThatAServerIsInstalled) {
    leaveStaleSocket(directory.path("stale"));
    places.sockets = {directory.path("stale")};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    EXPECT_EQ(messageOf<CannotConnectException>([&] { connect(); }),
              "Cannot connect to CIM server: " + directory.path("stale") + ": Connection refused");
}

TEST_F(LocalConnectorTest, AnInstalledProgramForbidsTheChild) {
    places.programs = {directory.path("missing"), "/bin/sh"};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    EXPECT_EQ(messageOf<CannotConnectException>([&] { connect(); }),
              "Cannot connect to CIM server: /bin/sh is installed but listens nowhere");
}

TEST_F(LocalConnectorTest, StartsAChildWhenNothingIsInstalled) {
    places.sockets = {directory.path("missing")};
    places.programs = {directory.path("missing")};
    places.embeddedPrograms = {directory.path("missing"), FAKE_CIMOMD};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ServerConnection connection = connect();
    EXPECT_TRUE(connection.socket.isOpen());
    EXPECT_NE(connection.child, nullptr);
    EXPECT_EQ(connection.serverUser, geteuid());
}

TEST_F(LocalConnectorTest, TheEnvironmentNamesTheProgramToStart) {
    places.embeddedPrograms = {directory.path("missing")};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    EXPECT_NE(connect().child, nullptr);
}

TEST_F(LocalConnectorTest, TheChildCanBeForbidden) {
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    EXPECT_EQ(messageOf<CannotConnectException>([&] { connect(); }),
              "No CIM server on this machine, and CIM_EMBEDDED is never");
}

TEST_F(LocalConnectorTest, SaysWhenThereIsNoProgramToStart) {
    places.embeddedPrograms = {directory.path("missing")};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    EXPECT_EQ(messageOf<CannotConnectException>([&] { connect(); }),
              "No CIM server on this machine, and no cimomd to start");
}

TEST_F(LocalConnectorTest, AServerOfAnotherUserIsNotTrusted) {
    if (geteuid() != 0) {
        GTEST_SKIP() << "only root can be another user";
    }
    std::filesystem::permissions(directory.path(), std::filesystem::perms::all);
    const StrangersServer stranger(directory.path("s"));
    {
        const ScopedEnvironment name("CIM_LOCAL_SOCKET", directory.path("s"));
        EXPECT_EQ(messageOf<CannotConnectException>([&] { connect(); }),
                  "Cannot connect to CIM server: " + directory.path("s") +
                      ": its server runs neither as root nor as this user");
    }
    // Even a socket file that was given to root does not make its listener root.
    ASSERT_EQ(chown(directory.path("s").c_str(), 0, 0), 0);
    FakeCimServer server;
    places.sockets = {directory.path("s"), server.socketPath()};
    EXPECT_TRUE(connect().socket.isOpen());
}

TEST_F(LocalConnectorTest, AStrangersSocketKeepsNobodyFromTheChild) {
    if (geteuid() != 0) {
        GTEST_SKIP() << "only root can be another user";
    }
    leaveStaleSocket(directory.path("s"));
    ASSERT_EQ(chown(directory.path("s").c_str(), kStranger, kStranger), 0);
    places.sockets = {directory.path("s")};
    const ScopedEnvironment childAllowed("CIM_EMBEDDED");
    const ScopedEnvironment command("CIM_COMMAND", FAKE_CIMOMD);
    EXPECT_NE(connect().child, nullptr);
}

TEST_F(LocalConnectorTest, AServerThatTakesNoConnectionIsGivenUpAtTheDeadline) {
    const FileDescriptor listener = listenAt(directory.path("busy"), 0);
    std::vector<FileDescriptor> waiting;
    for (;;) {
        ConnectResult result =
            connectUnixSocket(directory.path("busy"), FinalLink::Refuse, Deadline(0));
        if (result.error != 0) {
            EXPECT_EQ(result.error, ETIMEDOUT);
            break;
        }
        waiting.push_back(std::move(result.socket));
        ASSERT_LT(waiting.size(), 100U);
    }
    const ScopedEnvironment name("CIM_LOCAL_SOCKET", directory.path("busy"));
    const Stopwatch watch;
    EXPECT_THROW(connect(150), ConnectionTimeoutException);
    EXPECT_GE(watch.milliseconds(), 150);
    EXPECT_LT(watch.milliseconds(), 2000);
    std::vector<TriedPlace> tried;
    EXPECT_THROW(connectToLocalServer(places, Deadline(1), &tried), ConnectionTimeoutException);
    ASSERT_EQ(tried.size(), 1U);
    EXPECT_EQ(tried[0].path, directory.path("busy"));
    EXPECT_EQ(tried[0].result, "does not take the connection within the time-out");
    EXPECT_FALSE(tried[0].chosen);
}

}  // namespace
}  // namespace Pegasus
