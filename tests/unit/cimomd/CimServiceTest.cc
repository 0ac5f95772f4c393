#include "protocol/CimService.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

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

TEST_F(CimServiceTest, endsAConnectionWhoseRequestIsAmbiguous) {
    head.isAmbiguous = true;
    const auto refusal = service.refusalOf(head);
    ASSERT_TRUE(refusal);
    EXPECT_EQ(refusal->status, 400U);
    EXPECT_EQ(headerOf(*refusal, "Connection"), "close");
}

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

TEST_F(CimServiceTest, takesRequestsOverTheNetworkUnderLoopbackNamesOnly) {
    head.fromNetwork = true;
    EXPECT_EQ(refusedWith(), 403U);
    for (const char* name :
         {"localhost", "LOCALHOST:5988", "127.0.0.1:5988", "127.8.9.1", "[::1]:5988", "[::1]"}) {
        head.host = name;
        EXPECT_EQ(refusedWith(), 0U) << name;
    }
    for (const char* name : {"", "example.org", "localhost.example.org:80", "10.0.0.1", "128.0.0.1",
                             "127.0.0.1.example.org", "localhost:x", "[::2]", "127.1"}) {
        head.host = name;
        EXPECT_EQ(refusedWith(), 403U) << name;
    }
    head.fromNetwork = false;
    EXPECT_EQ(refusedWith(), 0U);
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
    const std::string good = requestBody("GetClass", "root/cimv2", "A");
    struct Case {
        std::string from;
        std::string to;
        std::string answer;
    };
    const std::vector<Case> cases{
        {good, "", "400 request-not-well-formed"},
        {good, "<CIM", "400 request-not-well-formed"},
        {good, "hello", "400 request-not-well-formed"},
        {"</MESSAGE>", "", "400 request-not-well-formed"},
        {"<MESSAGE ID=\"7\"", "<MESSAGE ID=\"7\" ID=\"8\"", "400 request-not-well-formed"},
        {good, "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"/>", "400 request-not-valid"},
        {"<MESSAGE ID=\"7\"", "<MESSAGE", "400 request-not-valid"},
        {" NAME=\"GetClass\"", "", "400 request-not-valid"},
        {"PROTOCOLVERSION=\"1.0\"", "PROTOCOLVERSION=\"3.0\"", "501 unsupported-protocol-version"},
        {"CIMVERSION=\"2.0\"", "CIMVERSION=\"3.0\"", "501 unsupported-cim-version"},
        {"DTDVERSION=\"2.0\"", "DTDVERSION=\"3.0\"", "501 unsupported-dtd-version"},
        {good.substr(good.find("<SIMPLEREQ>"), good.find("</MESSAGE>") - good.find("<SIMPLEREQ>")),
         "<MULTIREQ/>", "501 multiple-requests-unsupported"},
        {good.substr(good.find("<SIMPLEREQ>"), good.find("</MESSAGE>") - good.find("<SIMPLEREQ>")),
         "<SIMPLEEXPREQ/>", "501 unsupported-operation"},
    };
    for (const Case& each : cases) {
        std::string body = good;
        body.replace(body.find(each.from), each.from.size(), each.to);
        EXPECT_EQ(answerTo(body), each.answer) << body;
    }
}

TEST_F(CimServiceTest, tellsWhatDsp0200NamesForEachFailure) {
    struct Case {
        std::string body;
        std::string error;
    };
    std::string method = requestBody("Reset", "root/cimv2", "");
    method.replace(method.find("<IMETHODCALL"), 12, "<METHODCALL");
    method.replace(method.find("</IMETHODCALL"), 13, "</METHODCALL");
    method.replace(method.find("<LOCALNAMESPACEPATH>"), 20, "<LOCALCLASSPATH><LOCALNAMESPACEPATH>");
    method.replace(method.find("</LOCALNAMESPACEPATH>"), 21,
                   "</LOCALNAMESPACEPATH><CLASSNAME NAME=\"A\"/></LOCALCLASSPATH>");
    const std::vector<Case> cases{
        {requestBody("ModifyInstance", "root/cimv2", "A"),
         "IMETHODRESPONSE NAME=\"ModifyInstance\"><ERROR CODE=\"7\""},
        {requestBody("NoSuchOperation", "root/cimv2", "A"),
         "IMETHODRESPONSE NAME=\"NoSuchOperation\"><ERROR CODE=\"7\""},
        {method, "<METHODRESPONSE NAME=\"Reset\"><ERROR CODE=\"7\""},
        {requestBody("GetClass", "root/none", "A"), "<ERROR CODE=\"3\""},
        {requestBody("GetClass", "root/cimv2", ""), "<ERROR CODE=\"4\""},
        {requestBody("GetClass", "root/cimv2", "A", flag("Unknown", true)), "<ERROR CODE=\"4\""},
        {requestBody("GetClass", "root/cimv2", "B"), "<ERROR CODE=\"6\""},
        {requestBody("EnumerateClasses", "root/cimv2", "B"), "<ERROR CODE=\"5\""},
        {requestBody("EnumerateInstances", "root/cimv2", "B"), "<ERROR CODE=\"5\""},
    };
    for (const Case& each : cases) {
        const std::string answer = answerTo(each.body);
        EXPECT_EQ(answer.substr(0, 4), "200 ") << each.body;
        EXPECT_NE(answer.find(each.error), std::string::npos) << answer;
    }
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
