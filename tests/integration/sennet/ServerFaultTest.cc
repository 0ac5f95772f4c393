// Runs against servers that refuse, fail, break off or talk nonsense: a fault costs its class or
// its script, never the run.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "integration/sennet/CimXml.h"
#include "integration/sennet/MifFileFixture.h"
#include "support/Files.h"

namespace {

using support::ProgramResult;
using support::Reply;
using Names = std::vector<std::string>;

struct Fault {
    const char* name;
    Reply reply;
};

/// Failures that are no CIM status.
std::vector<Fault> brokenAnswers() {
    return {
        {"HTTP 500", Reply::http(500, {})},
        {"HTTP 400 with CIMError", Reply::http(400, {{"CIMError", "request-not-valid"}})},
        {"HTTP 404 with a page", Reply::http(404, {{"Content-Type", "text/html"}}, "<html/>")},
        {"connection closed", Reply::closeAtOnce()},
        {"garbage", Reply::raw("\x01\x02garbage\r\n\r\n\xFF")},
        {"cut in the header", Reply::ok("").cutAfter(30)},
        {"cut in the body", Reply::ok(namedClass("CIM_Faulty")).cutAfter(400)},
        {"no XML", Reply::document("this is no XML")},
        {"unclosed XML", Reply::document("<?xml version=\"1.0\"?><CIM CIMVERSION=\"2.0\">")},
        {"a page", Reply::document("<html><body>Hello</body></html>")},
        {"wrong message", Reply::ok(namedClass("CIM_Faulty")).messageId("0815")},
    };
}

class ServerFaultTest : public MifFileFixture {
  protected:
    ServerFaultTest() {
        setup.addScript("a.script.inv",
                        "[CIM]\nG[0]=CIM_Faulty\nA[0]=Name\nG[1]=CIM_Fan\nA[1]=Name\n");
        setup.addScript("b.script.inv", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n");
        server.onGetClass("CIM_Fan", Reply::ok(namedClass("CIM_Fan")));
        server.onEnumerateInstances("CIM_Fan", Reply::ok(namedInstances("CIM_Fan", {"f1"})));
        server.onGetClass("CIM_Faulty", Reply::ok(namedClass("CIM_Faulty")));
        server.onEnumerateInstances("CIM_Faulty", Reply::ok(namedInstances("CIM_Faulty", {"x1"})));
        leaveMifFile("a.mif", "earlier");
    }

    void expectRun(const std::string& lines) {
        const ProgramResult result = run("/SMS");
        EXPECT_EQ(result.exitStatus, 0);
        EXPECT_EQ(result.out, setup.start() + lines);
        EXPECT_EQ(result.err, "");
        EXPECT_EQ(support::readFile(setup.mifFile("b.mif")), namedMif("b", "f1"));
    }

    std::string firstFile() const { return support::readFile(setup.mifFile("a.mif")); }

    /// The file of script a when CIM_Faulty is there without instances: its place takes the list
    /// of CIM_Fan, whose own place is left without one.
    static std::string withoutFaultyInstances() {
        std::string mif = namedMif("a", "f1");
        const std::string attributeEnd = "         Value = \"f1\"\r\n      End Attribute\r\n";
        mif.insert(mif.find(attributeEnd) + attributeEnd.size(),
                   "\r\n"
                   "      Start Attribute\r\n"
                   "         Name = \"Name3\"\r\n"
                   "         Id = 3\r\n"
                   "         Type = String(64)\r\n"
                   "         Value = \"\"\r\n"
                   "      End Attribute\r\n");
        const std::string row = "{ 1, \"f1\"}";
        return mif.replace(mif.find(row), row.size(), "{ 1, \"f1\",}");
    }
};

TEST_F(ServerFaultTest, DropsAClassAtAnyCimErrorOfItsRequest) {
    for (const Reply& refusal :
         {Reply::cimError(1, "failed"), Reply::cimError(6, "CIM_Faulty"),
          Reply::cimErrorElement(2, "denied"), Reply::cimErrorElement(99, "odd")}) {
        server.onGetClass("CIM_Faulty", refusal);
        expectRun("Processing a...\nProcessing b...\n");
        EXPECT_EQ(firstFile(), namedMif("a", "f1"));
    }
}

TEST_F(ServerFaultTest, TakesACimErrorOfTheInstancesAsNone) {
    for (const Reply& refusal :
         {Reply::cimError(5, "CIM_Faulty"), Reply::cimErrorElement(7, "not supported"),
          Reply::ok(namedInstances("CIM_Faulty", {"x1"})).trailer("CIMStatusCode", "1")}) {
        server.onEnumerateInstances("CIM_Faulty", refusal);
        expectRun("Processing a...\nProcessing b...\n");
        EXPECT_EQ(firstFile(), withoutFaultyInstances());
    }
}

TEST_F(ServerFaultTest, TakesABrokenAnswerForTheInstancesAsNone) {
    for (const Fault& fault : brokenAnswers()) {
        SCOPED_TRACE(fault.name);
        server.onEnumerateInstances("CIM_Faulty", fault.reply);
        expectRun("Processing a...\nProcessing b...\n");
        EXPECT_EQ(firstFile(), withoutFaultyInstances());
    }
}

TEST_F(ServerFaultTest, AbandonsOnlyTheScriptAtABrokenAnswerForTheClass) {
    for (const Fault& fault : brokenAnswers()) {
        SCOPED_TRACE(fault.name);
        server.onGetClass("CIM_Faulty", fault.reply);
        expectRun("Processing b...\n");
        EXPECT_EQ(firstFile(), "earlier");
    }
}

TEST_F(ServerFaultTest, AbandonsTheScriptAtAResetConnection) {
    server.onNext(Reply::reset());
    expectRun("Processing b...\n");
    EXPECT_EQ(firstFile(), "earlier");
}

TEST_F(ServerFaultTest, TakesAResetConnectionForTheInstancesAsNone) {
    server.onNext(Reply::ok(namedClass("CIM_Faulty")));
    server.onNext(Reply::reset());
    expectRun("Processing a...\nProcessing b...\n");
    EXPECT_EQ(firstFile(), withoutFaultyInstances());
}

TEST_F(ServerFaultTest, AbandonsTheScriptWhenTheAnswerHoldsNoClass) {
    server.onGetClass("CIM_Faulty", Reply::empty());
    expectRun("Processing b...\n");
    EXPECT_EQ(firstFile(), "earlier");
}

TEST_F(ServerFaultTest, TakesAFaultInOneInstanceAsNoInstances) {
    server.onEnumerateInstances(
        "CIM_Faulty",
        Reply::ok(namedInstances("CIM_Faulty", {"x1"}) +
                  "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"CIM_Faulty\"/>"
                  "<INSTANCE CLASSNAME=\"CIM_Faulty\"><PROPERTY NAME=\"N\" TYPE=\"uint8\">"
                  "<VALUE>256</VALUE></PROPERTY></INSTANCE></VALUE.NAMEDINSTANCE>"));
    expectRun("Processing a...\nProcessing b...\n");
    EXPECT_EQ(firstFile(), withoutFaultyInstances());
}

TEST_F(ServerFaultTest, ReadsAnswersInAnyChunks) {
    server.onGetClass("CIM_Faulty", Reply::ok(namedClass("CIM_Faulty")).chunkSize(1));
    server.onEnumerateInstances("CIM_Faulty",
                                Reply::ok(namedInstances("CIM_Faulty", {"x1"})).contentLength());
    server.onGetClass("CIM_Fan", Reply::ok(namedClass("CIM_Fan")).thenClose());
    expectRun("Processing a...\nProcessing b...\n");
}

TEST_F(ServerFaultTest, DeletesWhenEveryInstanceRequestFails) {
    server.onEnumerateInstances("CIM_Faulty", Reply::http(500, {}));
    server.onEnumerateInstances("CIM_Fan", Reply::cimError(1, "failed"));
    const ProgramResult result = run("/SMS");
    EXPECT_EQ(result.exitStatus, 0);
    EXPECT_EQ(result.out, setup.start() + "Deleting a...\nDeleting b...\n");
    EXPECT_EQ(setup.mifNames(), Names{});
}

}  // namespace
