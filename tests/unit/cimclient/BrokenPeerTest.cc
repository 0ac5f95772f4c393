// Servers that answer wrongly: each answer is one exception of the class that the client's header
// promises, the request is not sent twice, and the next request works.

#include <Pegasus/Client/CIMClient.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "ClientFixture.h"

namespace Pegasus {
namespace {

using support::Reply;
using testing_client::classXml;
using testing_client::fanXml;
using testing_client::messageOf;

class BrokenPeerTest : public testing_client::ClientFixture {
  protected:
    BrokenPeerTest() { client.connectLocal(); }

    template <typename E>
    std::string messageFor(const Reply& reply) {
        const std::size_t requestsBefore = server.requests().size();
        server.onNext(reply);
        std::string message = messageOf<E>([&] { fans(); });
        EXPECT_FALSE(message.empty());
        EXPECT_LE(server.requests().size(), requestsBefore + 1);
        expectNextRequestWorks();
        return message;
    }

    // The answer names the class and the property at fault.
    void expectFaultInSpeed(const Reply& reply) {
        const std::string message = messageFor<CIMClientXmlException>(reply);
        EXPECT_THAT(message, testing::HasSubstr("CIM_Fan"));
        EXPECT_THAT(message, testing::ContainsRegex("Speed|SPEED"));
    }
};

Reply withInstance(const std::string& instanceXml) {
    return Reply::ok(fanXml("good", "1") +
                     "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"CIM_Fan\"/>" + instanceXml +
                     "</VALUE.NAMEDINSTANCE>");
}

Reply withProperty(const std::string& propertyXml) {
    return withInstance("<INSTANCE CLASSNAME=\"CIM_Fan\">" + propertyXml + "</INSTANCE>");
}

TEST_F(BrokenPeerTest, ClosesWithoutAnAnswer) {
    messageFor<CIMClientMalformedHTTPException>(Reply::closeAtOnce());
}

TEST_F(BrokenPeerTest, ResetsTheConnection) {
    messageFor<CIMClientMalformedHTTPException>(Reply::reset());
}

TEST_F(BrokenPeerTest, StopsInsideAChunk) {
    messageFor<CIMClientMalformedHTTPException>(
        Reply::raw("HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\nTransfer-Encoding: chunked\r\n\r\n"
                   "100\r\n<?xml version=\"1.0\"?><CIM"));
}

TEST_F(BrokenPeerTest, EndsTheChunksInTheMiddle) {
    messageFor<CIMClientXmlException>(
        Reply::raw("HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\nTransfer-Encoding: chunked\r\n\r\n"
                   "5\r\n<CIM \r\n0\r\n\r\n5\r\nCIMVE\r\n0\r\n\r\n"));
}

TEST_F(BrokenPeerTest, IsCutAnywhere) {
    const Reply whole = Reply::ok(fanXml("a", "1")).trailer("CIMStatusCode", "0");
    server.onNext(whole);
    ASSERT_EQ(fans().size(), 1U);
    const std::size_t length = whole.render(server.requests().back()).size();
    for (std::size_t octets = 0; octets < length; octets += 13) {
        SCOPED_TRACE(octets);
        server.onNext(whole.cutAfter(octets));
        EXPECT_THROW(fans(), CIMClientMalformedHTTPException);
    }
    expectNextRequestWorks();
}

TEST_F(BrokenPeerTest, SaysMoreOctetsThanItSends) {
    messageFor<CIMClientMalformedHTTPException>(Reply::raw(
        "HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\nContent-Length: 1000\r\n\r\n<?xml"));
}

TEST_F(BrokenPeerTest, SendsOctetsThatBelongToNobody) {
    server.onNext(Reply::ok(fanXml("a", "1")).contentLength().followedBy("HTTP/1.1 500 X\r\n\r\n"));
    EXPECT_EQ(fans().size(), 1U);
    expectNextRequestWorks();
    server.onNext(Reply::ok(fanXml("a", "1")).followedBy("more"));
    EXPECT_EQ(fans().size(), 1U);
    expectNextRequestWorks();
}

TEST_F(BrokenPeerTest, AnswersWithAWebPage) {
    const std::string message = messageFor<CIMClientMalformedHTTPException>(
        Reply::http(200, {{"Content-Type", "text/html"}}, "<html><body>Hello</body></html>"));
    EXPECT_EQ(message,
              "The answer's content type is \"text/html\"; expected application/xml or text/xml");
    messageFor<CIMClientXmlException>(
        Reply::http(200, {{"Content-Type", "text/xml"}}, "<html><body>Hello</body></html>"));
}

TEST_F(BrokenPeerTest, SpeaksAnotherProtocol) {
    messageFor<CIMClientMalformedHTTPException>(Reply::raw("SSH-2.0-Server\r\n"));
    messageFor<CIMClientMalformedHTTPException>(Reply::raw(std::string(100000, '\0')));
    messageFor<CIMClientMalformedHTTPException>(Reply::raw(std::string(1000000, 'x')));
}

TEST_F(BrokenPeerTest, AnswersWithAnHttpError) {
    EXPECT_EQ(messageFor<CIMClientHTTPErrorException>(Reply::http(
                  400, {{"CIMError", "request-not-valid"}, {"PGErrorDetail", "Bad%20XML"}})),
              "HTTP error: HTTP/1.1 400 Bad Request; CIMError: request-not-valid; Bad XML");
    EXPECT_EQ(messageFor<CIMClientHTTPErrorException>(Reply::http(501, {}, "text")),
              "HTTP error: HTTP/1.1 501 Not Implemented");
    for (const int status : {101, 201, 204, 301, 302, 401, 403, 404, 500, 503}) {
        SCOPED_TRACE(status);
        messageFor<CIMClientHTTPErrorException>(
            Reply::http(status, {{"Location", "http://192.0.2.1/"}}));
    }
}

TEST_F(BrokenPeerTest, AnswersWithAnHttpErrorAndNeverABody) {
    const testing_client::Stopwatch watch;
    messageFor<CIMClientHTTPErrorException>(Reply::http(500, {}).withoutLength());
    messageFor<CIMClientHTTPErrorException>(Reply::http(401, {}).withoutLength());
    messageFor<CIMClientHTTPErrorException>(
        Reply::http(500, {{"Content-Length", "1000"}}).withoutLength());
    EXPECT_LT(watch.milliseconds(), 2000);
}

TEST_F(BrokenPeerTest, ReportsAMalformedStatus) {
    messageFor<CIMClientMalformedHTTPException>(
        Reply::ok(fanXml("a", "1")).trailer("CIMStatusCode", "six"));
    messageFor<CIMClientHTTPErrorException>(
        Reply::ok(fanXml("a", "1")).trailer("CIMError", "request-not-valid"));
}

TEST_F(BrokenPeerTest, DescribesAStatusAtLength) {
    server.onNext(Reply::ok(fanXml("a", "1"))
                      .trailer("CIMStatusCode", "6")
                      .trailer("CIMStatusCodeDescription", std::string(5000, 'x')));
    try {
        fans();
        ADD_FAILURE() << "no exception";
    } catch (const CIMException& error) {
        EXPECT_EQ(error.getCode(), CIM_ERR_NOT_FOUND);
    }
    expectNextRequestWorks();
}

TEST_F(BrokenPeerTest, TellsWhatIsWrongInTheTransfer) {
    EXPECT_THAT(messageFor<CIMClientMalformedHTTPException>(
                    Reply::raw("HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\nTransfer-Encoding: "
                               "chunked\r\n\r\nzz\r\n")),
                testing::HasSubstr("chunk"));
    EXPECT_THAT(messageFor<CIMClientMalformedHTTPException>(
                    Reply::raw("HTTP/1.1 200 OK\r\nField: " + std::string(200000, 'x'))),
                testing::HasSubstr("a line is too long"));
}

TEST_F(BrokenPeerTest, SendsAnEndlessHeader) {
    std::string header = "HTTP/1.1 200 OK\r\n";
    for (int i = 0; i < 20000; ++i) {
        header += "Field: value\r\n";
    }
    messageFor<CIMClientMalformedHTTPException>(Reply::raw(header));
    messageFor<CIMClientMalformedHTTPException>(
        Reply::ok(fanXml("a", "1")).trailer("Field", std::string(70000, 'x')));
}

TEST_F(BrokenPeerTest, DescribesAClassWithoutEnd) {
    const std::string blanks(std::size_t{17} << 20, ' ');
    server.onNext(Reply::ok("<CLASS NAME=\"CIM_Fan\">" + blanks + "</CLASS>"));
    EXPECT_THROW(nameOfClass("CIM_Fan"), CIMClientMalformedHTTPException);
    expectNextRequestWorks();
    // Instances may well be that many.
    server.onNext(Reply::ok(blanks + fanXml("a", "1")));
    EXPECT_EQ(fans().size(), 1U);
}

TEST_F(BrokenPeerTest, AnswersAnotherRequest) {
    messageFor<CIMClientResponseException>(Reply::ok(fanXml("a", "1")).messageId("0"));
}

TEST_F(BrokenPeerTest, SendsInvalidUtf8) {
    messageFor<CIMClientResponseException>(Reply::ok(fanXml("caf\xE9", "1")));
}

TEST_F(BrokenPeerTest, SendsMalformedXml) {
    messageFor<CIMClientXmlException>(Reply::document("<CIM CIMVERSION=\"2.0\""));
    messageFor<CIMClientXmlException>(Reply::document(""));
    messageFor<CIMClientXmlException>(Reply::ok("<UNEXPECTED/>"));
    messageFor<CIMClientXmlException>(Reply::ok(classXml("CIM_Fan")));
}

TEST_F(BrokenPeerTest, SendsInstancesThatAreNone) {
    messageFor<CIMClientXmlException>(withInstance("<INSTANCE/>"));
    messageFor<CIMClientXmlException>(withProperty("<PROPERTY TYPE=\"string\"/>"));
}

TEST_F(BrokenPeerTest, SendsValuesThatAreNone) {
    expectFaultInSpeed(Reply::ok(fanXml("a", "1") + fanXml("b", "fast")));
    expectFaultInSpeed(Reply::ok(fanXml("a", "65536")));
    expectFaultInSpeed(Reply::ok(fanXml("a", "")));
    expectFaultInSpeed(withProperty("<PROPERTY NAME=\"Speed\" TYPE=\"\"/>"));
    expectFaultInSpeed(withProperty("<PROPERTY NAME=\"Speed\"/>"));
    expectFaultInSpeed(
        withProperty("<PROPERTY NAME=\"Speed\" TYPE=\"boolean\"><VALUE></VALUE>"
                     "</PROPERTY>"));
    expectFaultInSpeed(
        withProperty("<PROPERTY NAME=\"Speed\" TYPE=\"datetime\">"
                     "<VALUE>20180911124613.128***:000</VALUE></PROPERTY>"));
    expectFaultInSpeed(
        withProperty("<PROPERTY NAME=\"Speed\" TYPE=\"uint8\"/>"
                     "<PROPERTY NAME=\"SPEED\" TYPE=\"uint8\"/>"));
}

}  // namespace
}  // namespace Pegasus
