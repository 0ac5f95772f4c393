#include "client/HttpExchange.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <memory>
#include <string>
#include <thread>

#include "TestConnections.h"
#include "client/FileDescriptor.h"

namespace Pegasus {
namespace {

using testing_client::Stopwatch;

const std::string kHead = "HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\n";
const std::string kChunkedHead = kHead + "Transfer-Encoding: chunked\r\n\r\n";

// A connection whose other end the test plays by hand.
class HttpExchangeTest : public testing::Test {
  protected:
    HttpExchangeTest() {
        std::array<int, 2> ends{};
        EXPECT_EQ(socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
        client = FileDescriptor(ends[0]);
        server = FileDescriptor(ends[1]);
        fcntl(client.get(), F_SETFL, O_NONBLOCK);
    }

    void send(const std::string& bytes) const {
        ASSERT_EQ(::send(server.get(), bytes.data(), bytes.size(), MSG_NOSIGNAL),
                  static_cast<ssize_t>(bytes.size()));
    }

    // The server has said all; it still takes what the client sends.
    void endAnswer() const { ASSERT_EQ(shutdown(server.get(), SHUT_WR), 0); }

    std::unique_ptr<HttpExchange> exchange(Uint32 milliseconds = 5000) {
        return std::make_unique<HttpExchange>(client.get(), request, Deadline(milliseconds),
                                              limits);
    }

    static std::string bodyOf(HttpExchange& exchange, std::size_t capacity = 100) {
        exchange.awaitHead();
        std::string body;
        std::string buffer(capacity, '\0');
        while (const std::size_t count = exchange.read(buffer.data(), capacity)) {
            body.append(buffer, 0, count);
        }
        return body;
    }

    // The body of an answer that is there already and followed by the end of the connection.
    std::string bodyOf(const std::string& answer) {
        send(answer);
        endAnswer();
        return bodyOf(*exchange());
    }

    std::string receivedByServer() const {
        std::array<char, 10000> buffer{};
        const ssize_t count = recv(server.get(), buffer.data(), buffer.size(), MSG_DONTWAIT);
        return count > 0 ? std::string(buffer.data(), static_cast<std::size_t>(count)) : "";
    }

    HttpRequest request{{"Content-Type: text/xml", "Two: 2"}, "<body/>"};
    HttpLimits limits{1000000, 2000};
    FileDescriptor client;
    FileDescriptor server;
};

TEST_F(HttpExchangeTest, SendsExactlyTheRequest) {
    send(kHead + "Content-Length: 0\r\n\r\n");
    exchange()->awaitHead();
    EXPECT_EQ(receivedByServer(),
              "POST /cimom HTTP/1.1\r\nHost: localhost\r\nContent-Type: text/xml\r\nTwo: 2\r\n"
              "Content-Length: 7\r\n\r\n<body/>");
}

TEST_F(HttpExchangeTest, ProxyVariablesChangeNothing) {
    setenv("http_proxy", "http://192.0.2.1:3128", 1);
    send(kHead + "Content-Length: 2\r\n\r\nok");
    EXPECT_EQ(bodyOf(*exchange()), "ok");
    unsetenv("http_proxy");
    EXPECT_EQ(receivedByServer().substr(0, 21), "POST /cimom HTTP/1.1\r");
}

TEST_F(HttpExchangeTest, ReadsABodyOfGivenLengthAndLeavesTheConnectionOpen) {
    send(kHead + "Content-Length: 5\r\n\r\nhello");
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "hello");
    EXPECT_TRUE(current->hasEnded());
    EXPECT_TRUE(current->leavesConnectionOpen());
    EXPECT_EQ(current->answer().status(), 200);
}

TEST_F(HttpExchangeTest, TheSameConnectionCarriesManyExchanges) {
    for (int i = 0; i < 20; ++i) {
        send(kChunkedHead + "3\r\nabc\r\n0\r\n\r\n");
        const auto current = exchange();
        EXPECT_EQ(bodyOf(*current), "abc");
        EXPECT_TRUE(current->leavesConnectionOpen());
    }
}

TEST_F(HttpExchangeTest, ReadsChunksAndTrailers) {
    send(kChunkedHead +
         "3\r\nabc\r\n0000a;name=value\r\n0123456789\r\nB\r\n0123456789!\r\n"
         "0\r\nCIMStatusCode: 6\r\nOther: x\r\n\r\n");
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "abc01234567890123456789!");
    EXPECT_EQ(*current->answer().trailer().find("cimstatuscode"), "6");
    EXPECT_EQ(*current->answer().trailer().find("Other"), "x");
    EXPECT_TRUE(current->leavesConnectionOpen());
}

TEST_F(HttpExchangeTest, ReadsOneOctetAtATime) {
    send(kChunkedHead + "3\r\nabc\r\n2\r\nde\r\n0\r\n\r\n");
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current, 1), "abcde");
    EXPECT_TRUE(current->hasEnded());
}

TEST_F(HttpExchangeTest, AnAnswerThatComesInSingleOctetsIsTheSame) {
    const std::string answer = kChunkedHead + "3\r\nabc\r\n0\r\nCIMStatusCode: 6\r\n\r\n";
    std::thread sender([&] {
        for (const char octet : answer) {
            send(std::string(1, octet));
            std::this_thread::yield();
        }
    });
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "abc");
    sender.join();
    EXPECT_EQ(*current->answer().trailer().find("CIMStatusCode"), "6");
}

TEST_F(HttpExchangeTest, ReadsALongBodyWhole) {
    std::string expected;
    for (int i = 0; expected.size() < 5000000; ++i) {
        expected += std::to_string(i) + ",";
    }
    limits.body = expected.size();
    std::thread sender([&] {
        const std::string answer =
            kHead + "Content-Length: " + std::to_string(expected.size()) + "\r\n\r\n" + expected;
        for (std::size_t sent = 0; sent < answer.size();) {
            const ssize_t count =
                ::send(server.get(), answer.data() + sent, answer.size() - sent, MSG_NOSIGNAL);
            ASSERT_GT(count, 0);
            sent += static_cast<std::size_t>(count);
        }
    });
    const auto current = exchange(30000);
    const std::string body = bodyOf(*current, 65536);
    sender.join();
    EXPECT_TRUE(body == expected) << "length " << body.size() << " of " << expected.size();
}

TEST_F(HttpExchangeTest, ABodyWithoutLengthEndsWithTheConnection) {
    send(kHead + "\r\nall of it");
    endAnswer();
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "all of it");
    EXPECT_FALSE(current->leavesConnectionOpen());
}

TEST_F(HttpExchangeTest, TheServersWishToCloseIsHeeded) {
    send(kHead + "Connection: close\r\nContent-Length: 2\r\n\r\nok");
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "ok");
    EXPECT_FALSE(current->leavesConnectionOpen());
}

TEST_F(HttpExchangeTest, OctetsAfterTheBodyBelongToNobody) {
    send(kHead + "Content-Length: 2\r\n\r\nokHTTP/1.1 200 OK\r\n\r\n");
    const auto current = exchange();
    EXPECT_EQ(bodyOf(*current), "ok");
    EXPECT_FALSE(current->leavesConnectionOpen());
}

TEST_F(HttpExchangeTest, TheHeadIsKnownBeforeTheBodyComes) {
    send("HTTP/1.1 501 No\r\nContent-Length: 1000\r\n\r\n");
    EXPECT_EQ(exchange()->awaitHead().status(), 501);
}

TEST_F(HttpExchangeTest, InterimAnswersAreSkipped) {
    send("HTTP/1.1 100 Continue\r\n\r\n" + kHead + "Content-Length: 2\r\n\r\nok");
    EXPECT_EQ(bodyOf(*exchange()), "ok");
}

TEST_F(HttpExchangeTest, RefusesWhatIsNoHttp) {
    EXPECT_THROW(bodyOf("SSH-2.0-OpenSSH\r\n"), CIMClientMalformedHTTPException);
}

class BrokenAnswerTest : public HttpExchangeTest,
                         public testing::WithParamInterface<std::string> {};

TEST_P(BrokenAnswerTest, IsRefused) {
    EXPECT_THROW(bodyOf(GetParam()), CIMClientMalformedHTTPException);
}

INSTANTIATE_TEST_SUITE_P(
    All, BrokenAnswerTest,
    testing::Values("",                                              // closed without an answer
                    "HTTP/1.1 200 OK\r\nContent-Type: text",         // closed in the header
                    "HTTP/1.1 200 OK\r\nno colon\r\n\r\n",           // no field
                    "HTTP/1.1 2x0 OK\r\nContent-Length: 0\r\n\r\n",  // no status
                    "HTTP/2 200 OK\r\nContent-Length: 0\r\n\r\n",    // another version
                    "<html></html>",                                 // HTTP 0.9
                    "HTTP/1.1 200 OK\r\nContent-Length: 10\r\n\r\nshort",
                    "HTTP/1.1 200 OK\r\nContent-Length: ten\r\n\r\n0123456789",
                    "HTTP/1.1 200 OK\r\nContent-Length: 1000001\r\n\r\nabove the limit",
                    kChunkedHead + "5\r\nabc",                      // cut in a chunk
                    kChunkedHead + "3\r\nabc\r\n",                  // cut between chunks
                    kChunkedHead + "3\r\nabc\r\n0\r\nCIMStatus",    // cut in the trailer
                    kChunkedHead + "3\r\nabc\r\n0\r\n",             // no empty line at the end
                    kChunkedHead + "g\r\nabc\r\n0\r\n\r\n",         // no number
                    kChunkedHead + "3\r\nabcd\r\n0\r\n\r\n",        // longer than it says
                    kChunkedHead + "-1\r\nabc\r\n0\r\n\r\n",        // negative
                    kChunkedHead + "FFFFFFFFFFFFFFFFF\r\nabc\r\n",  // above 64 bits
                    kChunkedHead + "3\r\nabc\r\n0\r\nno field\r\n\r\n"));

TEST_F(HttpExchangeTest, WhatCameBeforeACutIsReadFirst) {
    send(kChunkedHead + "3\r\nabc\r\n");
    endAnswer();
    const auto current = exchange();
    current->awaitHead();
    std::array<char, 10> buffer{};
    EXPECT_EQ(current->read(buffer.data(), buffer.size()), 3U);
    EXPECT_THROW(current->read(buffer.data(), buffer.size()), CIMClientMalformedHTTPException);
    EXPECT_FALSE(current->leavesConnectionOpen());
}

TEST_F(HttpExchangeTest, RefusesALongHeader) {
    std::string answer = "HTTP/1.1 200 OK\r\n";
    for (int i = 0; i < 1000; ++i) {
        answer += "Field: value\r\n";
    }
    EXPECT_THROW(bodyOf(answer + "Content-Length: 0\r\n\r\n"), CIMClientMalformedHTTPException);
}

TEST_F(HttpExchangeTest, RefusesALongTrailer) {
    std::string answer = kChunkedHead + "0\r\n";
    for (int i = 0; i < 1000; ++i) {
        answer += "Field: value\r\n";
    }
    EXPECT_THROW(bodyOf(answer + "\r\n"), CIMClientMalformedHTTPException);
}

TEST_F(HttpExchangeTest, RefusesInterimAnswersWithoutEnd) {
    std::string answer;
    for (int i = 0; i < 1000; ++i) {
        answer += "HTTP/1.1 100 Continue\r\n\r\n";
    }
    EXPECT_THROW(bodyOf(answer), CIMClientMalformedHTTPException);
}

TEST_F(HttpExchangeTest, TakesChunksUpToTheLimit) {
    limits.body = 5;
    EXPECT_EQ(bodyOf(kChunkedHead + "5\r\n01234\r\n0\r\n\r\n"), "01234");
}

TEST_F(HttpExchangeTest, RefusesOneOctetAboveTheLimit) {
    limits.body = 5;
    EXPECT_THROW(bodyOf(kChunkedHead + "3\r\n012\r\n3\r\n345\r\n0\r\n\r\n"),
                 CIMClientMalformedHTTPException);
}

TEST_F(HttpExchangeTest, GivesUpASilentServerAtTheDeadline) {
    const Stopwatch watch;
    EXPECT_THROW(exchange(200)->awaitHead(), ConnectionTimeoutException);
    EXPECT_GE(watch.milliseconds(), 200);
    EXPECT_LT(watch.milliseconds(), 2000);
}

TEST_F(HttpExchangeTest, GivesUpABodyThatDripsAtTheDeadline) {
    send(kHead + "Content-Length: 1000\r\n\r\n");
    std::thread sender([&] {
        for (int i = 0; i < 60; ++i) {
            ::send(server.get(), "x", 1, MSG_NOSIGNAL);
            std::this_thread::sleep_for(std::chrono::milliseconds(10));
        }
    });
    const Stopwatch watch;
    EXPECT_THROW(bodyOf(*exchange(200)), ConnectionTimeoutException);
    EXPECT_LT(watch.milliseconds(), 550);
    sender.join();
}

TEST_F(HttpExchangeTest, AServerThatDoesNotReadIsGivenUpAtTheDeadline) {
    request.body.assign(10000000, 'x');
    EXPECT_THROW(exchange(200)->awaitHead(), ConnectionTimeoutException);
}

TEST_F(HttpExchangeTest, AConnectionThatIsGoneIsNoSignal) {
    server.reset();
    EXPECT_THROW(exchange()->awaitHead(), CIMClientMalformedHTTPException);
}

TEST_F(HttpExchangeTest, TheConnectionStaysTheCallers) {
    send(kHead + "Connection: close\r\nContent-Length: 0\r\n\r\n");
    bodyOf(*exchange());
    EXPECT_GE(fcntl(client.get(), F_GETFD), 0);
}

}  // namespace
}  // namespace Pegasus
