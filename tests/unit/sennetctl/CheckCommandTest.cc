#include "script/CheckCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "CapturedOutput.h"
#include "FanServer.h"
#include "report/WholeFile.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::HasSubstr;

constexpr const char* kGood = "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID\n";

class CheckCommandTest : public testing::Test {
  protected:
    FanServer fans;
    support::TempDirectory directory;
    CapturedOutput output;
};

TEST_F(CheckCommandTest, FindingsStandInTheOrderOfTheLines) {
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID\nnonsense\n");
    EXPECT_EQ(checkScripts({{file}, false, false}, output.plain()), 1);
    EXPECT_EQ(output.text(),
              file + ":4:6: note: CIM_Fan: 2 instances\n" + file +
                  ":6:1: warning: line without effect: an entry is G[n]=class, N[n]=namespace or "
                  "A[n]=properties\n1 file: 0 errors, 1 warning\n");
}

TEST_F(CheckCommandTest, OfflineAsksNoServer) {
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts({{file}, true, false}, output.plain()), 0);
    EXPECT_EQ(output.text(), "1 file: 0 errors, 0 warnings\n");
    EXPECT_EQ(fans.server.connectionCount(), 0U);
}

TEST_F(CheckCommandTest, WithoutAServerTheScriptsAreChecked) {
    fans.server.stop();
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts({{file}, false, false}, output.plain()), 0);
    EXPECT_THAT(output.errors(), HasSubstr("only the scripts themselves are checked\n"));
}

TEST_F(CheckCommandTest, AServerIsNotAskedForAScriptThatIsGivenUp) {
    const std::string file =
        directory.write("x.script.inv", std::string(kGood) + "G[10]=CIM_Fan\n");
    EXPECT_EQ(checkScripts({{file}, false, false}, output.json()), 1);
    EXPECT_EQ(output.document()["errors"], 1);
    EXPECT_TRUE(fans.server.requests().empty());
}

// To tell why values are missing, the server looks at the whole machine.
TEST_F(CheckCommandTest, TheServerIsAskedOnceWhyValuesAreMissing) {
    const std::string text = "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=Spare\n";
    const std::string one = directory.write("one.script.inv", text);
    const std::string two = directory.write("two.script.inv", text);
    fans.server.onGetClass("Velmira_MissingValue",
                           support::Reply::ok("<CLASS NAME=\"Velmira_MissingValue\"/>"));
    fans.server.onEnumerateInstances("Velmira_MissingValue", support::Reply::ok(""));
    EXPECT_EQ(checkScripts({{one, two}, false, false}, output.plain()), 0);
    int asked = 0;
    for (const support::RecordedRequest& request : fans.server.requests()) {
        asked += request.className == "Velmira_MissingValue" ? 1 : 0;
    }
    EXPECT_EQ(asked, 2) << "the class, and its instances";
}

TEST_F(CheckCommandTest, AScriptThatCannotBeReadEndsTheCommand) {
    EXPECT_THROW(checkScripts({{directory.path("none")}, true, false}, output.plain()), CannotRun);
}

TEST_F(CheckCommandTest, ProgressIsTakenAwayAtTheEnd) {
    const std::string file = directory.write("x.script.inv", kGood);
    Output shown = output.plain();
    shown.progress = true;
    checkScripts({{file}, true, false}, shown);
    EXPECT_EQ(output.errors(), "\r\x1B[Kscript 1 of 1: " + file + "\r\x1B[K");
}

}  // namespace
}  // namespace sennetctl
