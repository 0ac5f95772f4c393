// The whole program, over its sockets.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <csignal>
#include <memory>
#include <thread>
#include <vector>

#include "CimRequests.h"
#include "RecordedTree.h"
#include "RunningCimomd.h"

namespace cimomd {
namespace {

bool has(const std::string& text, std::string_view part) {
    return text.find(part) != std::string::npos;
}

class CimomdProgramTest : public testing::Test {
  protected:
    CimomdProgramTest() : socketPath((tree.root / "s").string()) {
        tree.file("machine/proc/sys/kernel/hostname", "node7\n")
            .file("machine/etc/os-release", "ID=debian\nNAME=Debian\nVERSION_ID=12\n")
            .file("machine/proc/sys/kernel/arch", "x86_64\n");
    }

    std::string machine() const { return (tree.root / "machine").string(); }

    RecordedTree tree;
    std::string socketPath;
};

class ServedSocketTest : public CimomdProgramTest {
  protected:
    void SetUp() override { ASSERT_TRUE(server.serves(socketPath)); }

    std::string answerTo(const std::string& request) const {
        const Connection connection(socketPath);
        connection.send(request);
        return connection.readAnswer();
    }

    RunningCimomd server{{"--socket", socketPath, "--root", machine()}};
};

const std::string& systemRequest() {
    static const std::string body = requestBody("EnumerateInstances", "root/cimv2",
                                                "CIM_OperatingSystem", flag("LocalOnly", false));
    return body;
}

TEST_F(ServedSocketTest, servesTheRecordedMachine) {
    const std::string answer = answerTo(postOf(systemRequest()));
    EXPECT_TRUE(has(answer, "HTTP/1.1 200 OK\r\n"));
    EXPECT_TRUE(has(answer, "Content-Type: application/xml; charset=utf-8\r\n"));
    EXPECT_TRUE(has(answer, "CIMOperation: MethodResponse\r\n"));
    EXPECT_TRUE(has(answer,
                    "<IRETURNVALUE><VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME="
                    "\"Velmira_OperatingSystem\">"));
    EXPECT_TRUE(has(answer, "<VALUE>node7</VALUE>"));
    EXPECT_TRUE(has(answer, "NAME=\"OSType\" TYPE=\"uint16\" PROPAGATED=\"true\"><VALUE>96<"));
}

TEST_F(ServedSocketTest, keepsAConnectionForSeveralRequests) {
    const Connection connection(socketPath);
    for (int i = 0; i < 3; ++i) {
        connection.send(postOf(systemRequest()));
        EXPECT_TRUE(has(connection.readAnswer(), "</CIM>"));
    }
}

TEST_F(ServedSocketTest, tellsErrorsInTheBodyOrInTrailers) {
    const std::string body = requestBody("GetClass", "root/cimv2", "CIM_Nothing");
    const std::string plain = answerTo(postOf(body));
    EXPECT_TRUE(has(plain, "<ERROR CODE=\"6\""));
    EXPECT_FALSE(has(plain, "CIMStatusCode"));
    const std::string trailed = answerTo(postOf(body, "TE: chunked, trailers\r\n"));
    EXPECT_FALSE(has(trailed, "<ERROR"));
    EXPECT_TRUE(has(trailed, "<IMETHODRESPONSE NAME=\"GetClass\"></IMETHODRESPONSE>"));
    EXPECT_TRUE(has(trailed,
                    "\r\n0\r\nCIMStatusCode: 6\r\nCIMStatusCodeDescription: "
                    "there%20is%20no%20class%20CIM_Nothing%20in%20root%2Fcimv2\r\n\r\n"));
}

TEST_F(ServedSocketTest, sendsNoStatusTrailersWithASuccess) {
    const std::string answer = answerTo(postOf(systemRequest(), "TE: trailers\r\n"));
    EXPECT_TRUE(has(answer, "</CIM>"));
    EXPECT_FALSE(has(answer, "CIMStatusCode: "));
}

TEST_F(ServedSocketTest, refusesOtherMethodsAndLivesOn) {
    for (const char* method : {"GET", "HEAD", "PUT", "DELETE", "OPTIONS", "TRACE"}) {
        const std::string answer =
            answerTo(std::string(method) + " /cimom HTTP/1.1\r\nHost: x\r\n\r\n");
        EXPECT_TRUE(has(answer, "HTTP/1.1 405 ")) << method;
        EXPECT_TRUE(has(answer, "\r\nAllow: POST\r\n")) << method;
    }
    EXPECT_TRUE(has(answerTo("M-POST /cimom HTTP/1.1\r\nHost: x\r\n\r\n"), "HTTP/1.1 501 "));
    EXPECT_TRUE(
        has(answerTo("POST / HTTP/1.1\r\nHost: x\r\nContent-Length: 0\r\n\r\n"), "HTTP/1.1 404 "));
    EXPECT_TRUE(has(answerTo(postOf(systemRequest())), "</CIM>"));
}

TEST_F(ServedSocketTest, survivesMalformedRequests) {
    const std::string body = systemRequest();
    for (const std::string& bad :
         {std::string("\r\n\r\n\r\n"), std::string("GET\r\n\r\n"), std::string(100000, 'x'),
          std::string("POST /cimom HTTP/1.1\r\nHost: x\r\nContent-Length: -5\r\n\r\n"),
          std::string("POST /cimom HTTP/9.9\r\n\r\n"),
          "POST /cimom HTTP/1.1\r\nX: " + std::string(200000, 'y') + "\r\n\r\n",
          std::string("\0\0\0\0", 4)}) {
        Connection connection(socketPath);
        connection.send(bad);
        connection.close();
    }
    EXPECT_TRUE(has(answerTo(postOf("no xml")), "CIMError: request-not-well-formed\r\n"));
    EXPECT_TRUE(has(answerTo(postOf(body.substr(0, body.size() / 2))), "HTTP/1.1 400 "));
    EXPECT_TRUE(has(answerTo(postOf(body)), "</CIM>"));
}

TEST_F(ServedSocketTest, survivesClientsThatGoAway) {
    const std::string request = postOf(systemRequest());
    for (std::size_t length = 0; length <= request.size(); length += 37) {
        Connection connection(socketPath);
        connection.send(request.substr(0, length));
        connection.close();
    }
    EXPECT_TRUE(has(answerTo(request), "</CIM>"));
}

TEST_F(ServedSocketTest, refusesBodiesThatAreTooLong) {
    EXPECT_TRUE(
        has(answerTo(postOf(std::string((std::size_t{1} << 20) + 1, 'x'))), "HTTP/1.1 413 "));
    const std::string head =
        "POST /cimom HTTP/1.1\r\nHost: x\r\nContent-Type: text/xml\r\nCIMOperation: "
        "MethodCall\r\n";
    EXPECT_TRUE(has(answerTo(head + "Expect: 100-continue\r\nContent-Length: 99999999\r\n\r\n"),
                    "HTTP/1.1 413 "));
    std::string chunked = head + "Transfer-Encoding: chunked\r\n\r\n";
    for (int i = 0; i < 17; ++i)
        chunked += "10000\r\n" + std::string(0x10000, 'x') + "\r\n";
    EXPECT_TRUE(has(answerTo(chunked + "0\r\n\r\n"), "HTTP/1.1 413 "));
}

TEST_F(ServedSocketTest, refusesHeadsThatAreTooLong) {
    const std::string head = "POST /cimom HTTP/1.1\r\nHost: x\r\nX-Long: ";
    EXPECT_TRUE(has(answerTo(head + std::string(80000, 'y') + "\r\n\r\n"), "HTTP/1.1 431 "));
}

TEST_F(ServedSocketTest, tellsClientsThatAskToSendTheirBody) {
    const Connection connection(socketPath);
    const std::string request = postOf(systemRequest(), "Expect: 100-continue\r\n");
    const std::size_t bodyAt = request.find("\r\n\r\n") + 4;
    connection.send(request.substr(0, bodyAt));
    EXPECT_EQ(connection.readSome(), "HTTP/1.1 100 Continue\r\n\r\n");
    connection.send(request.substr(bodyAt));
    EXPECT_TRUE(has(connection.readAnswer(), "</CIM>"));
}

TEST_F(ServedSocketTest, servesManyConnectionsAtOnce) {
    constexpr int kConnections = 64;
    std::vector<std::unique_ptr<Connection>> connections;
    for (int i = 0; i < kConnections; ++i) {
        connections.push_back(std::make_unique<Connection>(socketPath));
        ASSERT_TRUE(connections.back()->isOpen());
    }
    for (const auto& connection : connections)
        connection->send(postOf(systemRequest()));
    for (const auto& connection : connections)
        EXPECT_TRUE(has(connection->readAnswer(), "</CIM>"));
}

TEST_F(ServedSocketTest, endsCleanlyOnSignals) {
    const Connection connection(socketPath);
    connection.send("POST /cimom HTTP/1.1\r\n");
    server.signal(SIGTERM);
    EXPECT_EQ(server.wait(), 0);
    EXPECT_FALSE(std::filesystem::exists(socketPath));
}

TEST_F(CimomdProgramTest, closesIdleConnections) {
    RunningCimomd server({"--socket", socketPath, "--root", machine(), "--idle-timeout", "1"});
    ASSERT_TRUE(server.serves(socketPath));
    const Connection connection(socketPath);
    connection.send("POST /cimom HTTP/1.1\r\n");
    EXPECT_FALSE(has(connection.readToEnd(), "200 OK"));
    server.signal(SIGINT);
    EXPECT_EQ(server.wait(), 0);
}

TEST_F(CimomdProgramTest, closesConnectionsThatSendDropByDrop) {
    RunningCimomd server({"--socket", socketPath, "--root", machine(), "--idle-timeout", "1"});
    ASSERT_TRUE(server.serves(socketPath));
    const Connection inHead(socketPath);
    const Connection inBody(socketPath);
    const std::string request = postOf(systemRequest());
    const std::size_t bodyAt = request.find("\r\n\r\n") + 4;
    inBody.send(request.substr(0, bodyAt));
    for (std::size_t i = 0; i < 30; ++i) {
        inHead.send(request.substr(i, 1));
        inBody.send(request.substr(bodyAt + i, 1));
        std::this_thread::sleep_for(std::chrono::milliseconds(100));
    }
    EXPECT_TRUE(inHead.peerHasClosed());
    EXPECT_TRUE(inBody.peerHasClosed());
}

TEST_F(CimomdProgramTest, keepsTheOldClassesWhenTheNewOnesAreWrong) {
    const std::string own = (tree.root / "own").string();
    tree.file("own/b.mof", "class Own_B : Own_A {};")
        .file("own/a.mof", "class Own_A {};")
        .file("own/c.mof", "class Own_C {")
        .file("own/d.txt", "class Own_D {};");
    RunningCimomd server({"--socket", socketPath, "--root", machine(), "--mof-dir", own});
    ASSERT_TRUE(server.serves(socketPath));
    const Connection connection(socketPath);
    const auto knows = [&connection](const char* name) {
        connection.send(postOf(requestBody("GetClass", "root/cimv2", name)));
        return has(connection.readAnswer(), "<CLASS ");
    };
    const auto learns = [&knows](const char* name) {
        for (int i = 0; i < 500; ++i) {
            if (knows(name))
                return true;
            std::this_thread::sleep_for(std::chrono::milliseconds(10));
        }
        return false;
    };
    EXPECT_TRUE(knows("Own_A"));
    EXPECT_TRUE(knows("Own_B"));
    EXPECT_FALSE(knows("Own_C"));
    EXPECT_FALSE(knows("Own_D"));
    tree.file("own/c.mof", "class Own_C {};");
    server.signal(SIGHUP);
    EXPECT_TRUE(learns("Own_C"));
    tree.file("own/a.mof", "class Own_A2 {};").file("own/b.mof", "class Own_B : {");
    server.signal(SIGHUP);
    for (int i = 0; i < 30; ++i) {
        EXPECT_TRUE(knows("Own_A"));
        EXPECT_FALSE(knows("Own_A2"));
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    tree.file("own/b.mof", "class Own_B {};");
    server.signal(SIGHUP);
    EXPECT_TRUE(learns("Own_A2"));
    EXPECT_FALSE(knows("Own_A"));
    server.signal(SIGTERM);
    EXPECT_EQ(server.wait(), 0);
}

TEST_F(CimomdProgramTest, letsFurtherConnectionsWait) {
    RunningCimomd server({"--socket", socketPath, "--root", machine(), "--max-connections", "4"});
    ASSERT_TRUE(server.serves(socketPath));
    std::vector<std::unique_ptr<Connection>> connections;
    for (int i = 0; i < 16; ++i) {
        connections.push_back(std::make_unique<Connection>(socketPath));
        connections.back()->send(postOf(systemRequest(), "Connection: close\r\n"));
    }
    for (const auto& connection : connections)
        EXPECT_TRUE(has(connection->readToEnd(), "</CIM>"));
}

TEST_F(CimomdProgramTest, servesOneDescriptorAndEndsWithIt) {
    std::array<int, 2> ends{};
    ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    RunningCimomd server({"--fd", std::to_string(ends[1]), "--root", machine()}, ends[1]);
    ::close(ends[1]);
    Connection connection(ends[0]);
    for (int i = 0; i < 3; ++i) {
        connection.send(postOf(systemRequest(), "TE: trailers\r\n"));
        EXPECT_TRUE(has(connection.readAnswer(), "<VALUE>node7</VALUE>"));
    }
    connection.close();
    EXPECT_EQ(server.wait(), 0);
}

TEST_F(CimomdProgramTest, endsWithTheParentThatStartedIt) {
    std::array<int, 2> ends{};
    std::array<int, 2> parentsLife{};
    ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    ASSERT_EQ(::pipe2(parentsLife.data(), O_CLOEXEC), 0);
    const pid_t parent = ::fork();
    if (parent == 0) {
        ::close(parentsLife[1]);
        auto* server =
            new RunningCimomd({"--fd", std::to_string(ends[1]), "--root", machine()}, ends[1]);
        char byte = 0;
        ::_exit(::read(parentsLife[0], &byte, 1) == 0 && server != nullptr ? 0 : 1);
    }
    ::close(ends[1]);
    ::close(parentsLife[0]);
    const Connection connection(ends[0]);
    connection.send(postOf(systemRequest()));
    EXPECT_TRUE(has(connection.readAnswer(), "</CIM>"));
    ::close(parentsLife[1]);
    int status = 0;
    EXPECT_EQ(::waitpid(parent, &status, 0), parent);
    EXPECT_EQ(connection.readToEnd(), "");
    EXPECT_TRUE(connection.peerHasClosed());
}

TEST_F(CimomdProgramTest, saysWhatItCannotDo) {
    const auto statusOf = [](const std::vector<std::string>& arguments) {
        return RunningCimomd(arguments).wait();
    };
    EXPECT_EQ(statusOf({"--help"}), 0);
    EXPECT_EQ(statusOf({"--version"}), 0);
    EXPECT_EQ(statusOf({}), 1);
    EXPECT_EQ(statusOf({"--nonsense"}), 1);
    EXPECT_EQ(statusOf({"--fd", "3", "--socket", socketPath}), 1);
    EXPECT_EQ(statusOf({"--fd", "3", "--http", "127.0.0.1:0"}), 1);
    for (const char* address : {"0.0.0.0:0", "10.1.2.3:5988", "[::]:0", "example.org:80",
                                "127.0.0.1", "127.0.0.1:65536", ":5988"})
        EXPECT_EQ(statusOf({"--http", address}), 1) << address;
    EXPECT_EQ(statusOf({"--socket", socketPath, "--socket-mode", "rw"}), 1);
    EXPECT_EQ(statusOf({"--socket", socketPath, "--socket-mode", "01777"}), 1);
    EXPECT_EQ(statusOf({"--socket", socketPath, "--socket-group", "no such group"}), 1);
    EXPECT_EQ(statusOf({"--socket-mode", "0660", "--http", "127.0.0.1:0"}), 1);
    EXPECT_EQ(statusOf({"--socket", socketPath, "--mof-dir", "/does/not/exist"}), 1);
    EXPECT_EQ(statusOf({"--fd", "999"}), 1);
    EXPECT_EQ(statusOf({"--fd", "1"}), 1);
    EXPECT_EQ(statusOf({"--fd", "-1"}), 1);
    EXPECT_EQ(statusOf({"--socket", (tree.root / "none" / "s").string()}), 1);
    EXPECT_EQ(statusOf({"--socket", socketPath, "--root", "/does/not/exist"}), 1);
    tree.file("schema/cimomd.mof", "class X {");
    EXPECT_EQ(statusOf({"--socket", socketPath, "--schema", (tree.root / "schema").string()}), 1);
    EXPECT_FALSE(std::filesystem::exists(socketPath));
}

TEST_F(CimomdProgramTest, checksMofFiles) {
    const auto statusOf = [](const std::vector<std::string>& arguments) {
        return RunningCimomd(arguments).wait();
    };
    tree.file("good.mof", "class Own_Device : CIM_LogicalDevice {};")
        .file("more.mof", "class Own_Disk : Own_Device {};")
        .file("bad.mof", "class X {");
    const std::string good = (tree.root / "good.mof").string();
    const std::string more = (tree.root / "more.mof").string();
    const std::string bad = (tree.root / "bad.mof").string();
    EXPECT_EQ(statusOf({"--check", good}), 0);
    EXPECT_EQ(statusOf({"--check", good, more}), 0);
    EXPECT_EQ(statusOf({"--check", more}), 1);
    EXPECT_EQ(statusOf({"--check", good, bad}), 1);
    EXPECT_EQ(statusOf({"--check"}), 1);
    EXPECT_EQ(statusOf({"--check", good, "--socket", socketPath}), 1);
}

}  // namespace
}  // namespace cimomd
