#include "client/AnswerStatus.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <gtest/gtest.h>

#include <initializer_list>

#include "TestConnections.h"

namespace Pegasus {
namespace {

using testing_client::messageOf;
using testing_client::text;

HttpAnswer answerOf(std::initializer_list<const char*> lines) {
    HttpAnswer answer(10000);
    for (const char* line : lines) {
        answer.addLine(line);
    }
    return answer;
}

HttpAnswer withType(const char* contentTypeLine) {
    return answerOf({"HTTP/1.1 200 OK", contentTypeLine, ""});
}

HttpAnswer withTrailer(std::initializer_list<const char*> lines) {
    HttpAnswer answer = withType("Content-Type: text/xml");
    for (const char* line : lines) {
        answer.addLine(line);
    }
    return answer;
}

TEST(AnswerStatusTest, AcceptsBothXmlTypesInAnyCase) {
    for (const char* line : {"Content-Type: application/xml", "content-type: text/xml",
                             "Content-Type: Application/XML; charset=\"UTF-8\"",
                             "Content-Type: text/xml ;charset=utf-8"}) {
        EXPECT_NO_THROW(checkHead(withType(line))) << line;
    }
}

TEST(AnswerStatusTest, AcceptsAnAnswerThatNamesNoType) {
    EXPECT_NO_THROW(checkHead(withType("Other: text/html")));
}

TEST(AnswerStatusTest, RefusesOtherTypes) {
    for (const char* line : {"Content-Type: text/html", "Content-Type:",
                             "Content-Type: application/xmlx", "Content-Type: x text/xml"}) {
        EXPECT_THROW(checkHead(withType(line)), CIMClientMalformedHTTPException) << line;
    }
}

TEST(AnswerStatusTest, TellsWhatAnErrorAnswerSays) {
    const HttpAnswer answer =
        answerOf({"HTTP/1.1 400 Bad Request", "CIMError: request-not-valid",
                  "PGErrorDetail: Bad%20NAMESPACE%1B", "Content-Type: application/xml", ""});
    EXPECT_EQ(messageOf<CIMClientHTTPErrorException>([&] { checkHead(answer); }),
              "HTTP error: HTTP/1.1 400 Bad Request; CIMError: request-not-valid; Bad NAMESPACE ");
}

TEST(AnswerStatusTest, CimErrorIsAnErrorWhateverTheStatus) {
    const HttpAnswer inHeader = answerOf({"HTTP/1.1 200 OK", "CIMError: unsupported-cim-version",
                                          "Content-Type: application/xml", ""});
    EXPECT_THROW(checkHead(inHeader), CIMClientHTTPErrorException);
    const HttpAnswer inTrailer = withTrailer({"CIMError: unsupported-operation"});
    EXPECT_THROW(checkReportedStatus(inTrailer), CIMClientHTTPErrorException);
}

TEST(AnswerStatusTest, StatusCodeInTheTrailer) {
    const HttpAnswer answer =
        withTrailer({"CIMStatusCode: 99", "CIMStatusCodeDescription: caf%C3%A9%20gone", ""});
    try {
        checkReportedStatus(answer);
        FAIL() << "no exception";
    } catch (const CIMException& exception) {
        EXPECT_EQ(static_cast<Uint32>(exception.getCode()), 99U);
        EXPECT_EQ(text(exception.getMessage()), "caf\xC3\xA9 gone");
    }
}

TEST(AnswerStatusTest, StatusCodeInTheHeader) {
    const HttpAnswer answer =
        answerOf({"HTTP/1.1 200 OK", "CIMStatusCode: 6", "Content-Type: text/xml", ""});
    EXPECT_NO_THROW(checkHead(answer));
    EXPECT_THROW(checkReportedStatus(answer), CIMException);
}

TEST(AnswerStatusTest, StatusCodeZeroIsSuccess) {
    EXPECT_NO_THROW(checkReportedStatus(withTrailer({"CIMStatusCode: 0"})));
    EXPECT_NO_THROW(checkReportedStatus(withTrailer({"Content-Language: en"})));
    EXPECT_NO_THROW(checkReportedStatus(withTrailer({})));
}

TEST(AnswerStatusTest, RefusesMalformedStatusCodes) {
    for (const char* line : {"CIMStatusCode:", "CIMStatusCode: -1", "CIMStatusCode: six",
                             "CIMStatusCode: 6x", "CIMStatusCode: 4294967296", "CIMStatusCode: 0x6",
                             "CIMStatusCode: 99999999999999999999999"}) {
        EXPECT_THROW(checkReportedStatus(withTrailer({line})), CIMClientMalformedHTTPException)
            << line;
    }
}

}  // namespace
}  // namespace Pegasus
