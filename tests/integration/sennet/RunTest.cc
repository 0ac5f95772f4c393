// Whole runs: which requests go out, which scripts are announced, which files appear.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "integration/sennet/CimXml.h"
#include "integration/sennet/MifFileFixture.h"
#include "support/Files.h"

namespace {

using support::ProgramResult;
using support::RecordedRequest;
using support::Reply;
using Names = std::vector<std::string>;

constexpr const char* kFanScript = "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n";

/// Whether the parameter of a request has this value, given as the XML inside its element.
bool hasParameter(const RecordedRequest& request, const std::string& name,
                  const std::string& value) {
    const size_t start = request.body.find("<IPARAMVALUE NAME=\"" + name + "\">");
    if (start == std::string::npos) {
        return false;
    }
    const size_t end = request.body.find("</IPARAMVALUE>", start);
    const std::string element = request.body.substr(start, end - start);
    return element.find(value) != std::string::npos;
}

class RunTest : public MifFileFixture {
  protected:
    RunTest() {
        server.onGetClass("CIM_Fan", Reply::ok(namedClass("CIM_Fan")));
        server.onEnumerateInstances("CIM_Fan", Reply::ok(namedInstances("CIM_Fan", {"f1"})));
    }

    /// Runs and expects these lines after the start of the run.
    void expectRun(const std::string& lines, const std::string& type = "/SMS") {
        const ProgramResult result = run(type);
        EXPECT_EQ(result.exitStatus, 0);
        EXPECT_EQ(result.out, setup.start() + lines);
        EXPECT_EQ(result.err, "");
    }
};

TEST_F(RunTest, AsksForClassAndInstancesInSlotOrder) {
    server.onGetClass("CIM_Card", Reply::ok(namedClass("CIM_Card")));
    server.onEnumerateInstances("CIM_Card", Reply::ok(""));
    setup.addScript("all.script.inv",
                    "[DEFAULT]\ndefaultnamespace=root/first\n"
                    "[CIM]\nG[5]=CIM_Card\nN[5]=/root/second\nG[1]=CIM_Fan\nA[1]=Name\n");
    // A class without properties has a place in the rows, one more than the group's attributes.
    expectUnreadable("all.mif", "27:17: row of more values than the 2 attributes of its group");
    expectRun("Processing all...\n");

    const std::vector<RecordedRequest> requests = server.requests();
    ASSERT_EQ(requests.size(), 4U);
    const char* expected[][3] = {{"GetClass", "CIM_Fan", "root/first"},
                                 {"EnumerateInstances", "CIM_Fan", "root/first"},
                                 {"GetClass", "CIM_Card", "root/second"},
                                 {"EnumerateInstances", "CIM_Card", "root/second"}};
    for (size_t i = 0; i < requests.size(); ++i) {
        EXPECT_EQ(requests[i].method, expected[i][0]);
        EXPECT_EQ(requests[i].className, expected[i][1]);
        EXPECT_EQ(requests[i].namespaceName, expected[i][2]);
        EXPECT_TRUE(hasParameter(requests[i], "LocalOnly", "<VALUE>FALSE</VALUE>"));
        EXPECT_TRUE(hasParameter(requests[i], "IncludeQualifiers", "<VALUE>TRUE</VALUE>"));
        EXPECT_TRUE(hasParameter(requests[i], "IncludeClassOrigin", "<VALUE>FALSE</VALUE>"));
        EXPECT_EQ(requests[i].body.find("PropertyList"), std::string::npos);
    }
    EXPECT_TRUE(hasParameter(requests[1], "DeepInheritance", "<VALUE>TRUE</VALUE>"));
    EXPECT_TRUE(hasParameter(requests[3], "DeepInheritance", "<VALUE>TRUE</VALUE>"));
}

TEST_F(RunTest, UsesTheDefaultNamespaceOfTheProduct) {
    setup.addScript("fan.script.inv", kFanScript);
    expectRun("Processing fan...\n");
    ASSERT_EQ(server.requests().size(), 2U);
    EXPECT_EQ(server.requests()[0].namespaceName, "root/velmira");
}

TEST_F(RunTest, AsksForNothingWithoutClasses) {
    setup.addScript("bare.script.inv", "[DEFAULT]\ntitle=Bare\n");
    expectRun("Deleting bare...\n");
    EXPECT_TRUE(server.requests().empty());
}

TEST_F(RunTest, WritesAFilePerScriptInByteOrder) {
    setup.addScript("b.script.inv", kFanScript);
    setup.addScript("a.script.inv", kFanScript);
    setup.addScript("C.Script.INV", kFanScript);
    setup.addScript("d.script.inv.bak", kFanScript);
    setup.addScript("e.inv", kFanScript);
    std::filesystem::create_directory(setup.scriptDirectory() + "/f.script.inv");
    expectRun("Processing C...\nProcessing a...\nProcessing b...\n");
    EXPECT_EQ(setup.mifNames(), (Names{"C.mif", "a.mif", "b.mif"}));
    EXPECT_EQ(support::readFile(setup.mifFile("a.mif")), namedMif("a", "f1"));
    EXPECT_EQ(support::readFile(setup.mifFile("b.mif")), namedMif("b", "f1"));
    EXPECT_EQ(support::readFile(setup.mifFile("C.mif")), namedMif("C", "f1"));
}

TEST_F(RunTest, NamesTheFilesOfEachProduct) {
    setup.addScript("fan.script.inv", kFanScript);
    expectRun("Processing fan...\n", "/CA");
    EXPECT_EQ(setup.mifNames(), Names{"kwvinv.mif"});
    std::filesystem::remove_all(setup.mifDirectory());
    expectRun("Processing fan...\n", "/LD");
    EXPECT_EQ(setup.mifNames(), Names{"fan.mif"});
    std::filesystem::remove_all(setup.mifDirectory());
    expectRun("Processing fan...\n", "/QVE");
    EXPECT_EQ(setup.mifNames(), (Names{"kwinvlumo.mif", "kwvinv.mif"}));
}

TEST_F(RunTest, ReplacesAndRemovesFilesOfAnEarlierRun) {
    server.onGetClass("CIM_Card", Reply::ok(namedClass("CIM_Card")));
    server.onEnumerateInstances("CIM_Card", Reply::ok(""));
    setup.addScript("card.script.inv", "[CIM]\nG[0]=CIM_Card\nA[0]=Name\n");
    setup.addScript("fan.script.inv", kFanScript);
    leaveMifFile("card.mif", "stale card");
    leaveMifFile("fan.mif", "stale fan, much longer than anything\r\n");
    leaveMifFile("other.mif", "not ours");
    expectRun("Deleting card...\nProcessing fan...\n");
    EXPECT_EQ(setup.mifNames(), (Names{"fan.mif", "other.mif"}));
    EXPECT_EQ(support::readFile(setup.mifFile("fan.mif")), namedMif("fan", "f1"));
    EXPECT_EQ(support::readFile(setup.mifFile("other.mif")), "not ours");
}

TEST_F(RunTest, RemovesTheCombinedFilesWhenNoScriptHasInstances) {
    server.onEnumerateInstances("CIM_Fan", Reply::ok(""));
    setup.addScript("fan.script.inv", kFanScript);
    leaveMifFile("kwvinv.mif", "stale");
    leaveMifFile("kwinvlumo.mif", "stale");
    expectRun("Deleting fan...\n", "/QVE");
    EXPECT_EQ(setup.mifNames(), Names{});
    leaveMifFile("kwvinv.mif", "stale");
    expectRun("Deleting fan...\n", "/CA");
    EXPECT_EQ(setup.mifNames(), Names{});
}

TEST_F(RunTest, LeavesARefusedClassOut) {
    setup.addScript("fan.script.inv", "[CIM]\nG[0]=CIM_Gone\nA[0]=Lost\nG[1]=CIM_Fan\nA[1]=Name\n");
    expectRun("Processing fan...\n");
    EXPECT_EQ(support::readFile(setup.mifFile("fan.mif")), namedMif("fan", "f1"));
    // No instances are asked for when the class is refused.
    ASSERT_EQ(server.requests().size(), 3U);
    EXPECT_EQ(server.requests()[1].method, "GetClass");
    EXPECT_EQ(server.requests()[1].className, "CIM_Fan");
}

TEST_F(RunTest, DeletesForAScriptWhoseClassesAreAllRefused) {
    setup.addScript("gone.script.inv", "[CIM]\nG[0]=CIM_Gone\nG[1]=CIM_Lost\n");
    leaveMifFile("gone.mif", "stale");
    expectRun("Deleting gone...\n");
    EXPECT_EQ(setup.mifNames(), Names{});
}

TEST_F(RunTest, AbandonsAScriptWithASlotOfTen) {
    setup.addScript("a.script.inv", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nG[10]=CIM_Fan\n");
    setup.addScript("b.script.inv", kFanScript);
    leaveMifFile("a.mif", "earlier");
    expectRun("Processing b...\n");
    EXPECT_EQ(support::readFile(setup.mifFile("a.mif")), "earlier");
    EXPECT_EQ(support::readFile(setup.mifFile("b.mif")), namedMif("b", "f1"));
}

TEST_F(RunTest, AbandonsAScriptThatIsNotUtf8) {
    setup.addScript("a.script.inv", "[DEFAULT]\ntitle=\xFF\n" + std::string(kFanScript));
    setup.addScript("b.script.inv", kFanScript);
    expectRun("Processing b...\n");
    EXPECT_EQ(setup.mifNames(), Names{"b.mif"});
}

TEST_F(RunTest, AbandonsAScriptWithAnIllegalNamespaceOrClassName) {
    setup.addScript("a.script.inv", std::string(kFanScript) + "N[0]=root//x\n");
    setup.addScript("b.script.inv", "[CIM]\nG[0] = CIM_Fan\n");
    setup.addScript("c.script.inv", kFanScript);
    leaveMifFile("a.mif", "earlier");
    expectRun("Processing c...\n");
    EXPECT_EQ(support::readFile(setup.mifFile("a.mif")), "earlier");
    EXPECT_EQ(setup.mifNames(), (Names{"a.mif", "c.mif"}));
}

TEST_F(RunTest, WritesOnlyTheGroupHeadForATrailingComma) {
    setup.addScript("a.script.inv", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name,\n");
    expectUnreadable("a.mif", "14:5: expected 'group', found 'component'");
    setup.addScript("b.script.inv", kFanScript);
    expectRun("Processing a...\nProcessing b...\n");
    EXPECT_EQ(support::readFile(setup.mifFile("a.mif")),
              "Start Component\r\n"
              "   Name = \"Machine\"\r\n"
              "\r\n"
              "   Start Group\r\n"
              "      Name = \"a\"\r\n"
              "      Class = \"Corvane-Velt|KWX MIF a|001\"\r\n"
              "      Key = 1\r\n"
              "      Start Attribute\r\n"
              "         Name = \"Index\"\r\n"
              "         Id = 1\r\n"
              "         Type = Integer\r\n"
              "         Value = 1\r\n"
              "      End Attribute\r\n"
              "End Component\r\n");
    EXPECT_EQ(support::readFile(setup.mifFile("b.mif")), namedMif("b", "f1"));
}

TEST_F(RunTest, KeepsTheWholePathOfAScriptWithoutAStem) {
    setup.addScript(".script.inv", kFanScript);
    const std::string listed = setup.scriptDirectory() + "/.script.inv";
    std::filesystem::create_directories(setup.mifDirectory() + setup.scriptDirectory());
    expectRun("Processing " + listed + "...\n");
    // Without a title key such a script's title is empty: nothing is left of the name.
    EXPECT_EQ(support::readFile(setup.mifDirectory() + "/" + listed + ".mif"), namedMif("", "f1"));
}

TEST_F(RunTest, GoesOnWhenAnOutputFileCannotBeWritten) {
    setup.addScript(".script.inv", kFanScript);
    setup.addScript("b.script.inv", kFanScript);
    std::filesystem::create_directories(setup.mifFile("b.mif/in the way"));
    expectRun("Processing " + setup.scriptDirectory() + "/.script.inv...\nProcessing b...\n");
    EXPECT_EQ(setup.mifNames(), Names{"b.mif"});
}

TEST_F(RunTest, TranslatesThroughTheResourceProperties) {
    setup.addScript("fan.script.inv", kFanScript);
    setup.setProperties("CIM_Fan.Name = Device\nCIM_Fan.Name.Size=8\n");
    expectRun("Processing fan...\n");
    std::string expected = namedMif("fan", "f1");
    const std::string attribute =
        "Name = \"Name\"\r\n         Id = 2\r\n         Type = String(64)";
    expected.replace(expected.find(attribute), attribute.size(),
                     "Name = \"Device\"\r\n         Id = 2\r\n         Type = String(8)");
    EXPECT_EQ(support::readFile(setup.mifFile("fan.mif")), expected);
}

TEST_F(RunTest, WritesAResourceTextThatIsNotUtf8WithAReplacement) {
    setup.addScript("fan.script.inv", kFanScript);
    setup.setProperties(
        "CIM_Fan.Name = L\xFC"
        "fter\n");
    expectRun("Processing fan...\n");
    std::string expected = namedMif("fan", "f1");
    const std::string attribute = "Name = \"Name\"\r\n         Id = 2";
    expected.replace(expected.find(attribute), attribute.size(),
                     "Name = \"L\xEF\xBF\xBD"
                     "fter\"\r\n         Id = 2");
    EXPECT_EQ(support::readFile(setup.mifFile("fan.mif")), expected);
}

TEST_F(RunTest, GivesTheSameFilesAgain) {
    setup.addScript("fan.script.inv", kFanScript);
    expectRun("Processing fan...\n");
    expectRun("Processing fan...\n");
    EXPECT_EQ(support::readFile(setup.mifFile("fan.mif")), namedMif("fan", "f1"));
    EXPECT_EQ(setup.mifNames(), Names{"fan.mif"});
}

}  // namespace
