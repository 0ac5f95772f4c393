#include "protocol/CimService.h"

#include <gtest/gtest.h>

#include "CimRequests.h"
#include "ServedModel.h"
#include "protocol/PercentCoding.h"

namespace cimomd {
namespace {

class CimServiceTest : public testing::Test {
  protected:
    CimServiceTest() {
        head.method = "POST";
        head.path = "/cimom";
        head.contentType = "application/xml; charset=\"utf-8\"";
        head.cimOperation = "MethodCall";
    }

    unsigned refusedWith() const {
        const auto refusal = service.refusalOf(head);
        return refusal ? refusal->status : 0;
    }
    /// "status CIMError", or "200 " and the body.
    std::string answerTo(const std::string& body) const {
        HttpAnswer answer = service.answer(head, body);
        std::string text = std::to_string(answer.status) + " ";
        if (!answer.body)
            return text + headerOf(answer, "CIMError");
        std::string buffer(100, '\0');
        std::size_t count = 0;
        while (answer.body->read(buffer.data(), buffer.size(), count) ==
               ResponseStream::Outcome::Data)
            text.append(buffer, 0, count);
        return text;
    }
    static std::string headerOf(const HttpAnswer& answer, const std::string& name) {
        for (const auto& [known, value] : answer.headers) {
            if (known == name)
                return value;
        }
        return "no header";
    }

    ServedModel model{"class A {};"};
    CimService service{model.dispatcher};
    HttpHead head;
};

TEST_F(CimServiceTest, takesARequestWithAGoodHead) {
    EXPECT_EQ(refusedWith(), 0U);
    head.contentType = "TEXT/XML";
    head.contentLength = "1048576";
    head.cimOperation = " methodcall ";
    EXPECT_EQ(refusedWith(), 0U);
}

TEST_F(CimServiceTest, refusesABadHead) {
    head.method = "GET";
    EXPECT_EQ(refusedWith(), 405U);
    EXPECT_EQ(headerOf(*service.refusalOf(head), "Allow"), "POST");
    head.method = "M-POST";
    EXPECT_EQ(refusedWith(), 501U);
    head.method = "POST";
    head.path = "/";
    EXPECT_EQ(refusedWith(), 404U);
    head.path = "/cimom";
    head.contentType = "text/plain";
    EXPECT_EQ(refusedWith(), 415U);
    head.contentType.reset();
    EXPECT_EQ(refusedWith(), 415U);
    head.contentType = "text/xml";
    head.cimOperation.reset();
    EXPECT_EQ(refusedWith(), 400U);
    EXPECT_EQ(headerOf(*service.refusalOf(head), "CIMError"), "unsupported-operation");
    head.cimOperation = "MethodCall";
    head.contentLength = "1048577";
    EXPECT_EQ(refusedWith(), 413U);
}

TEST_F(CimServiceTest, answersAnOperation) {
    const std::string answer = answerTo(requestBody("GetClass", "root/cimv2", "A"));
    EXPECT_NE(answer.find("200 "), std::string::npos);
    EXPECT_NE(answer.find("<CLASS NAME=\"A\""), std::string::npos);
}

TEST_F(CimServiceTest, checksTheHeadersAgainstTheBody) {
    const std::string body = requestBody("GetClass", "root/cimv2", "A");
    head.cimMethod = "getclass";
    head.cimObject = "/Root%2Fcimv2";
    EXPECT_EQ(answerTo(body).substr(0, 4), "200 ");
    head.cimMethod = "EnumerateInstances";
    EXPECT_EQ(answerTo(body), "400 header-mismatch");
    head.cimMethod.reset();
    for (const char* other : {"root%2Fother", "root%2", "a-b"}) {
        head.cimObject = other;
        EXPECT_EQ(answerTo(body), "400 header-mismatch") << other;
    }
}

TEST_F(CimServiceTest, refusesABodyThatIsNoOperation) {
    EXPECT_EQ(answerTo(""), "400 request-not-well-formed");
    EXPECT_EQ(answerTo("<CIM"), "400 request-not-well-formed");
    EXPECT_EQ(answerTo("hello"), "400 request-not-well-formed");
    EXPECT_EQ(answerTo("<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"/>"), "400 request-not-valid");
    std::string body = requestBody("GetClass", "root/cimv2", "A");
    body.replace(body.find("PROTOCOLVERSION=\"1.0\""), 21, "PROTOCOLVERSION=\"3.0\"");
    EXPECT_EQ(answerTo(body), "400 unsupported-protocol-version");
}

TEST_F(CimServiceTest, usesTrailersOnlyForClientsThatTakeThem) {
    const std::string body = requestBody("GetClass", "root/cimv2", "None");
    EXPECT_NE(answerTo(body).find("<ERROR CODE=\"6\""), std::string::npos);
    for (const char* te : {"trailers", "chunked, trailers", "chunked;q=0.5 , Trailers;q=1"}) {
        head.te = te;
        EXPECT_EQ(answerTo(body).find("<ERROR"), std::string::npos) << te;
        EXPECT_EQ(headerOf(service.answer(head, body), "Trailer"),
                  "CIMStatusCode, CIMStatusCodeDescription");
    }
    head.te = "chunked, trailersx";
    EXPECT_NE(answerTo(body).find("<ERROR CODE=\"6\""), std::string::npos);
}

TEST(PercentCoding, encodesAndDecodes) {
    EXPECT_EQ(percentEncoded("root/a b-1.2_~%\xC3\xA9\n"), "root%2Fa%20b-1.2_~%25%C3%A9%0A");
    EXPECT_EQ(percentDecoded("root%2Fa%20b%c3%A9"), "root/a b\xC3\xA9");
    EXPECT_EQ(percentDecoded("%"), std::nullopt);
    EXPECT_EQ(percentDecoded("a%2"), std::nullopt);
    EXPECT_EQ(percentDecoded("a%zz"), std::nullopt);
    EXPECT_EQ(percentDecoded("a%-1"), std::nullopt);
}

}  // namespace
}  // namespace cimomd
