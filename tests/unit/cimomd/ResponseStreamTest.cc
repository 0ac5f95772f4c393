#include "protocol/ResponseStream.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <gtest/gtest.h>

#include <stdexcept>

namespace cimomd {
namespace {

using Outcome = ResponseStream::Outcome;

/// Gives `count` elements of `size` bytes, then ends, or fails.
class RepeatedAnswer : public Answer {
  public:
    RepeatedAnswer(int count, std::size_t size, bool fails)
        : left(count), element(size, 'x'), fails(fails) {}

    bool next(std::string& xml) override {
        if (left-- > 0) {
            xml += element;
            return true;
        }
        if (fails) {
            xml += "half an element";
            throw Pegasus::CIMException(Pegasus::CIM_ERR_FAILED, "broken");
        }
        return false;
    }

  private:
    int left;
    std::string element;
    bool fails;
};

Pegasus::CimRequest requestFor(const char* method) {
    Pegasus::CimRequest request;
    request.messageId = "7";
    request.method = method;
    return request;
}

struct Result {
    std::string body;
    Outcome outcome = Outcome::Data;
    std::size_t largestPiece = 0;
};

Result readAll(ResponseStream& stream, std::size_t capacity = 4096) {
    Result result;
    std::string buffer(capacity, '\0');
    while (true) {
        std::size_t count = 0;
        result.outcome = stream.read(buffer.data(), buffer.size(), count);
        if (result.outcome != Outcome::Data)
            return result;
        result.body.append(buffer, 0, count);
        result.largestPiece = std::max(result.largestPiece, count);
    }
}

bool has(const Result& result, std::string_view part) {
    return result.body.find(part) != std::string::npos;
}

bool endsWhole(const Result& result) {
    return result.outcome == Outcome::End && has(result, "<MESSAGE ID=\"7\"") &&
           result.body.find("</CIM>") != std::string::npos;
}

TEST(ResponseStream, wrapsElements) {
    ResponseStream stream(requestFor("GetClass"), true);
    stream.succeed(std::make_unique<RepeatedAnswer>(2, 3, false));
    const Result result = readAll(stream, 7);
    EXPECT_TRUE(endsWhole(result));
    EXPECT_TRUE(has(result, "<IMETHODRESPONSE NAME=\"GetClass\">"));
    EXPECT_TRUE(has(result, "<IRETURNVALUE>xxxxxx</IRETURNVALUE>"));
    EXPECT_FALSE(stream.trailerStatus());
}

TEST(ResponseStream, givesAnEmptyReturnValueForNoElements) {
    ResponseStream stream(requestFor("EnumerateInstances"), false);
    stream.succeed(std::make_unique<RepeatedAnswer>(0, 0, false));
    EXPECT_TRUE(has(readAll(stream), "<IRETURNVALUE></IRETURNVALUE>"));
}

TEST(ResponseStream, tellsAnErrorInTheBody) {
    ResponseStream stream(requestFor("GetClass"), false);
    stream.fail({6, "no \"A\""});
    const Result result = readAll(stream);
    EXPECT_TRUE(endsWhole(result));
    EXPECT_TRUE(has(result, "<ERROR CODE=\"6\" DESCRIPTION=\"no &quot;A&quot;\"/>"));
    EXPECT_FALSE(has(result, "IRETURNVALUE"));
    EXPECT_FALSE(stream.trailerStatus());
}

TEST(ResponseStream, answersAMethodCallAsSuch) {
    Pegasus::CimRequest request = requestFor("Reset");
    request.isExtrinsic = true;
    ResponseStream stream(request, false);
    stream.fail({7, "no"});
    const Result result = readAll(stream);
    EXPECT_TRUE(has(result,
                    "<SIMPLERSP><METHODRESPONSE NAME=\"Reset\"><ERROR CODE=\"7\" "
                    "DESCRIPTION=\"no\"/></METHODRESPONSE></SIMPLERSP>"));
}

TEST(ResponseStream, tellsAnErrorInTrailersOnly) {
    ResponseStream stream(requestFor("GetClass"), true);
    stream.fail({6, "no A"});
    const Result result = readAll(stream);
    EXPECT_TRUE(endsWhole(result));
    EXPECT_FALSE(has(result, "ERROR"));
    EXPECT_FALSE(has(result, "IRETURNVALUE"));
    ASSERT_TRUE(stream.trailerStatus());
    EXPECT_EQ(stream.trailerStatus()->code, 6U);
    EXPECT_EQ(stream.trailerStatus()->description, "no A");
}

TEST(ResponseStream, takesAnEarlyFailureBackEntirely) {
    ResponseStream stream(requestFor("EnumerateInstances"), false);
    stream.succeed(std::make_unique<RepeatedAnswer>(3, 10, true));
    const Result result = readAll(stream);
    EXPECT_TRUE(endsWhole(result));
    EXPECT_TRUE(has(result, "<ERROR CODE=\"1\" DESCRIPTION=\"broken\"/>"));
    EXPECT_FALSE(has(result, "xxx"));
}

TEST(ResponseStream, breaksOffWhenItIsTooLateForAnError) {
    ResponseStream stream(requestFor("EnumerateInstances"), false);
    stream.succeed(std::make_unique<RepeatedAnswer>(100, 1000, true));
    const Result result = readAll(stream);
    EXPECT_EQ(result.outcome, Outcome::Broken);
    EXPECT_FALSE(has(result, "</CIM>"));
}

TEST(ResponseStream, tellsALateFailureInTrailers) {
    ResponseStream stream(requestFor("EnumerateInstances"), true);
    stream.succeed(std::make_unique<RepeatedAnswer>(100, 1000, true));
    const Result result = readAll(stream);
    EXPECT_TRUE(endsWhole(result));
    EXPECT_TRUE(has(result, std::string(1000, 'x') + "</IRETURNVALUE>"));
    EXPECT_FALSE(has(result, "half"));
    ASSERT_TRUE(stream.trailerStatus());
    EXPECT_EQ(stream.trailerStatus()->code, 1U);
}

}  // namespace
}  // namespace cimomd
