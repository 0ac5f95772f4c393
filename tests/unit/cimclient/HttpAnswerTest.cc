#include "client/HttpAnswer.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(HttpAnswerTest, TakesStatusHeaderAndTrailerApart) {
    HttpAnswer answer(1000);
    EXPECT_EQ(answer.status(), 0);
    answer.addLine("HTTP/1.1 401 Not you\r\n");
    answer.addLine("A: 1\r\n");
    EXPECT_FALSE(answer.isHeadComplete());
    answer.addLine("\r\n");
    EXPECT_TRUE(answer.isHeadComplete());
    answer.addLine("B: 2\r\n");
    answer.addLine("\r\n");
    EXPECT_EQ(answer.status(), 401);
    EXPECT_EQ(answer.statusLine(), "HTTP/1.1 401 Not you");
    EXPECT_EQ(*answer.header().find("A"), "1");
    EXPECT_EQ(answer.header().find("B"), nullptr);
    EXPECT_EQ(*answer.trailer().find("B"), "2");
    EXPECT_EQ(answer.trailer().find("A"), nullptr);
}

TEST(HttpAnswerTest, AcceptsAStatusWithoutReason) {
    HttpAnswer answer(1000);
    answer.addLine("HTTP/1.0 204\r\n");
    EXPECT_EQ(answer.status(), 204);
}

TEST(HttpAnswerTest, DropsInterimAnswers) {
    HttpAnswer answer(1000);
    answer.addLine("HTTP/1.1 100 Continue\r\n");
    answer.addLine("Interim: yes\r\n");
    answer.addLine("\r\n");
    EXPECT_FALSE(answer.isHeadComplete());
    answer.addLine("HTTP/1.1 200 OK\r\n");
    answer.addLine("\r\n");
    EXPECT_TRUE(answer.isHeadComplete());
    EXPECT_EQ(answer.status(), 200);
    EXPECT_EQ(answer.header().find("Interim"), nullptr);
}

TEST(HttpAnswerTest, RefusesBadStatusLines) {
    for (const char* line :
         {"", "HTTP/1.1", "HTTP/1.1 20 OK", "HTTP/1.1 2000 OK", "HTTP/1.1 2x0 OK",
          "HTTP/1.1 099 Low", "HTTP/2 200 OK", "ICY 200 OK"}) {
        HttpAnswer answer(1000);
        EXPECT_THROW(answer.addLine(line), CIMClientMalformedHTTPException) << line;
    }
}

TEST(HttpAnswerTest, RefusesTwoLengths) {
    HttpAnswer answer(1000);
    answer.addLine("HTTP/1.1 200 OK\r\n");
    answer.addLine("Content-Length: 20\r\n");
    answer.addLine("content-length: 400\r\n");
    EXPECT_THROW(answer.addLine("\r\n"), CIMClientMalformedHTTPException);
}

TEST(HttpAnswerTest, AcceptsOneLengthTwice) {
    HttpAnswer answer(1000);
    answer.addLine("HTTP/1.1 200 OK\r\n");
    answer.addLine("Content-Length: 20\r\n");
    answer.addLine("Content-Length: 20\r\n");
    answer.addLine("\r\n");
    EXPECT_TRUE(answer.isHeadComplete());
}

TEST(HttpAnswerTest, RefusesMoreOctetsThanTheLimit) {
    HttpAnswer exact(17 + 6);
    exact.addLine("HTTP/1.1 200 OK\r\n");
    exact.addLine("A: 1\r\n");
    EXPECT_THROW(exact.addLine("\r\n"), CIMClientMalformedHTTPException);
}

}  // namespace
}  // namespace Pegasus
