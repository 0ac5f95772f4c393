#include "script/CheckCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

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
    /// With resource properties that say nothing.
    CheckOptions wanted(const std::vector<std::string>& scripts, bool offline = false,
                        bool translations = false) const {
        return {scripts, offline, translations, 10, false, places};
    }

    FanServer fans;
    support::TempDirectory directory;
    Places places{directory.path("none"), false, directory.path(""), directory.write("texts", "")};
    CapturedOutput output;
};

TEST_F(CheckCommandTest, FindingsStandInTheOrderOfTheLines) {
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID\nnonsense\n");
    EXPECT_EQ(checkScripts(wanted({file}, false, false), output.plain()), 1);
    EXPECT_EQ(output.text(),
              file + ":4:6: note: CIM_Fan: 2 instances\n" + file +
                  ":6:1: warning: line without effect: an entry is G[n]=class, N[n]=namespace or "
                  "A[n]=properties\n1 file: 0 errors, 1 warning\n");
}

TEST_F(CheckCommandTest, OfflineAsksNoServer) {
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}, true, false), output.plain()), 0);
    EXPECT_EQ(output.text(), "1 file: 0 errors, 0 warnings (no server was asked)\n");
    EXPECT_EQ(fans.server.connectionCount(), 0U);
}

// Such a name must not hide what is wrong with the others.
TEST_F(CheckCommandTest, AFileWhoseNameIsNotUtf8IsToldBesideTheOthers) {
    const std::string latin = directory.write(
        "l\xFC"
        "fter.script.inv",
        kGood);
    const std::string other = directory.write("x.script.inv", std::string(kGood) + "nonsense\n");
    EXPECT_EQ(checkScripts(wanted({latin, other}, true, false), output.plain()), 1);
    EXPECT_THAT(output.text(),
                HasSubstr("fter.script.inv: error: a file whose name is not UTF-8 is "
                          "passed over by sennet: rename it\n"));
    EXPECT_THAT(output.text(), HasSubstr(other + ":6:1: warning: "));
    EXPECT_THAT(output.text(), HasSubstr("2 files: 1 error, 1 warning"));
}

TEST_F(CheckCommandTest, WithoutAServerTheScriptsAreChecked) {
    fans.server.stop();
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}, false, false), output.plain()), 1);
    EXPECT_THAT(output.errors(), HasSubstr("only the scripts themselves are checked\n"));
    EXPECT_EQ(output.text(), "1 file: 0 errors, 0 warnings (no server was reached)\n");
}

TEST_F(CheckCommandTest, AServerThatDoesNotAnswerLeavesTheFindingsOfTheScripts) {
    fans.server.onNext(support::Reply::silence());
    const std::string file = directory.write("x.script.inv", std::string(kGood) + "nonsense\n");
    CheckOptions options = wanted({file});
    options.timeoutSeconds = 1;
    EXPECT_EQ(checkScripts(options, output.plain()), 1);
    EXPECT_EQ(output.errors(),
              "sennetctl: the CIM server is connected, but does not answer within 1 s\n"
              "sennetctl: only the scripts themselves are checked\n");
    EXPECT_THAT(output.text(), HasSubstr(file + ":6:1: warning: "));
    EXPECT_THAT(output.text(), HasSubstr("1 file: 0 errors, 1 warning (no server was reached)\n"));
}

// Whoever reads only the status or the JSON has to learn that "no errors" is half the truth.
TEST_F(CheckCommandTest, JsonSaysWhetherAServerWasAsked) {
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}, false, false), output.json()), 0);
    EXPECT_EQ(output.document()["server"], "asked");
    CapturedOutput offline;
    EXPECT_EQ(checkScripts(wanted({file}, true, false), offline.json()), 0);
    EXPECT_EQ(offline.document()["server"], "not asked");
    EXPECT_EQ(offline.document().count("serverReason"), 0U);
    fans.server.stop();
    CapturedOutput later;
    EXPECT_EQ(checkScripts(wanted({file}, false, false), later.json()), 1);
    EXPECT_EQ(later.document()["server"], "not reached");
    EXPECT_THAT(later.errors(),
                HasSubstr(later.document()["serverReason"].get<std::string>() + "\n"));
}

TEST_F(CheckCommandTest, AServerThatAnswersNonsenseIsNone) {
    const std::string file = directory.write("x.script.inv", kGood);
    const std::string page = "<html>no</html>";
    for (const std::string& answer :
         {"HTTP/1.1 200 OK\r\nContent-Type: text/html\r\nContent-Length: 15\r\n\r\n" + page,
          std::string("HTTP/1.1 401 Unauthorized\r\nContent-Length: 0\r\n\r\n")}) {
        fans.server.onNext(support::Reply::raw(answer));
        CapturedOutput told;
        EXPECT_EQ(checkScripts(wanted({file}), told.json()), 1) << answer;
        EXPECT_EQ(told.document()["server"], "not reached") << answer;
        EXPECT_EQ(told.document()["findings"].size(), 0U) << answer;
    }
}

TEST_F(CheckCommandTest, AChildThatDiesIsNoServer) {
    const support::ScopedEnvironment noPlace("CIM_LOCAL_SOCKET");
    const support::ScopedEnvironment embedded("CIM_EMBEDDED");
    const support::ScopedEnvironment child("CIM_COMMAND", "/bin/false");
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}), output.plain()), 1);
    EXPECT_EQ(output.text(), "1 file: 0 errors, 0 warnings (no server was reached)\n");
}

TEST_F(CheckCommandTest, AServerThatBreaksDownLeavesTheFindingsOfTheScripts) {
    fans.server.onGetClass("CIM_Fan", support::Reply::closeAtOnce());
    const std::string one = directory.write("one.script.inv", std::string(kGood) + "nonsense\n");
    const std::string two = directory.write("two.script.inv", std::string(kGood) + "nonsense\n");
    EXPECT_EQ(checkScripts(wanted({one, two}, false, false), output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr(one + ":6:1: warning"));
    EXPECT_THAT(output.text(), HasSubstr(two + ":6:1: warning"));
    EXPECT_THAT(output.text(), HasSubstr("3 warnings (the server was not asked about all)\n"));
    EXPECT_THAT(output.errors(), HasSubstr("from " + one + " on only the scripts"));
}

TEST_F(CheckCommandTest, AServerThatBreaksDownIsReasonEnough) {
    fans.server.onGetClass("CIM_Fan", support::Reply::closeAtOnce());
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}), output.json()), 1);
    EXPECT_EQ(output.document()["server"], "broke down");
    EXPECT_EQ(output.document()["warnings"], 0);
}

// The generator looks names up under the class as the server writes it.
TEST_F(CheckCommandTest, TranslationsAreThoseOfTheServersSpelling) {
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=cim_fan\nA[0]=DeviceID,State\n");
    EXPECT_EQ(checkScripts(wanted({file}, false, true), output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr("the resource properties have no CIM_Fan.State\n"));
}

TEST_F(CheckCommandTest, AKeyInOtherLettersIsToldOnceForAllScripts) {
    directory.write("texts", "#\ncim_fan.DeviceID=Fan\n");
    const std::string one = directory.write("one.script.inv", kGood);
    const std::string two = directory.write("two.script.inv",
                                            "[DEFAULT]\ntitle=Two\n[CIM]\nG[0]=CIM_Fan\n"
                                            "A[0]=DeviceID\n");
    EXPECT_EQ(checkScripts(wanted({one, two}), output.plain()), 1);
    EXPECT_EQ(output.text(),
              one + ":4:6: note: CIM_Fan: 2 instances\n" + two +
                  ":4:6: note: CIM_Fan: 2 instances\n" + places.resources +
                  ":2:1: warning: line without effect on these scripts: sennet looks "
                  "for CIM_Fan.DeviceID\n2 files: 0 errors, 1 warning\n");
    CapturedOutput all;
    EXPECT_EQ(checkScripts(wanted({}), all.plain()), 1);
    EXPECT_THAT(all.text(), HasSubstr(":2:1: warning: line without effect: sennet looks for "
                                      "CIM_Fan.DeviceID\n"))
        << "there is no other script";
}

// CIM leaves the case of letters to each script, the resource properties do not.
TEST_F(CheckCommandTest, AKeyThatAnotherScriptNeeds) {
    directory.write("texts", "CIM_Fan.deviceid=Fan\nCIM_Fan.deviceid.Size=10\n");
    directory.write("one.script.inv", kGood);
    directory.write("two.script.inv", "[DEFAULT]\ntitle=Two\n[CIM]\nG[0]=CIM_Fan\nA[0]=deviceid\n");
    EXPECT_EQ(checkScripts(wanted({}), output.plain()), 0);
    EXPECT_EQ(output.text().find("without effect"), std::string::npos) << output.text();
}

TEST_F(CheckCommandTest, AKeyOfATitleInOtherLetters) {
    directory.write("texts", "title.fans=F\ntitle.Other=O\n");
    directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({}, true), output.plain()), 1);
    EXPECT_EQ(output.text(), places.resources +
                                 ":1:1: warning: line without effect: sennet looks for title.Fans\n"
                                 "1 file: 0 errors, 1 warning (no server was asked)\n");
}

TEST_F(CheckCommandTest, WhatIsCalledAsAScriptAndIsNone) {
    directory.write("x.script.inv", kGood);
    std::filesystem::create_symlink("gone", directory.path("gone.script.inv"));
    EXPECT_EQ(checkScripts(wanted({}, true), output.plain()), 1);
    EXPECT_EQ(output.text(), directory.path("") +
                                 "/gone.script.inv: warning: a link that leads "
                                 "nowhere, which sennet passes over: files of an "
                                 "earlier run stay\n1 file: 0 errors, 1 warning "
                                 "(no server was asked)\n");
}

TEST_F(CheckCommandTest, AServerIsNotAskedForAScriptThatIsGivenUp) {
    const std::string file =
        directory.write("x.script.inv", std::string(kGood) + "G[10]=CIM_Fan\n");
    EXPECT_EQ(checkScripts(wanted({file}, false, false), output.json()), 1);
    EXPECT_EQ(output.document()["errors"], 1);
    for (const support::RecordedRequest& request : fans.server.requests()) {
        EXPECT_NE(request.className, "CIM_Fan");
    }
}

// The file breaks off, but what is right in the script can be checked.
TEST_F(CheckCommandTest, AnIllegalPropertyLeavesTheOthersToTheServer) {
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=Colour,Bad-Name\n");
    EXPECT_EQ(checkScripts(wanted({file}), output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr("no property Colour: the column stays empty\n"));
    EXPECT_THAT(output.text(), HasSubstr("'Bad-Name' is no name of a property"));
}

// To tell why values are missing, the server looks at the whole machine.
TEST_F(CheckCommandTest, TheServerIsAskedOnceWhyValuesAreMissing) {
    const std::string text = "[CIM]\nG[0]=CIM_Fan\nA[0]=Spare\n";
    const std::string one = directory.write("one.script.inv", text);
    const std::string two = directory.write("two.script.inv", text);
    fans.server.onGetClass("Velmira_MissingValue",
                           support::Reply::ok("<CLASS NAME=\"Velmira_MissingValue\"/>"));
    fans.server.onEnumerateInstances("Velmira_MissingValue", support::Reply::ok(""));
    EXPECT_EQ(checkScripts(wanted({one, two}, false, false), output.plain()), 0);
    int asked = 0;
    for (const support::RecordedRequest& request : fans.server.requests()) {
        asked += request.className == "Velmira_MissingValue" ? 1 : 0;
    }
    EXPECT_EQ(asked, 2) << "the class, and its instances";
}

TEST_F(CheckCommandTest, TwoScriptsOfOneTitle) {
    const std::string one = directory.write("one.script.inv", kGood);
    const std::string two = directory.write("two.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({one, two}, true, false), output.plain()), 1);
    EXPECT_EQ(output.text(), two + ":2:7: warning: " + one +
                                 " has the title Fans, too: both tables get the same MIF class\n"
                                 "2 files: 0 errors, 1 warning (no server was asked)\n");
}

TEST_F(CheckCommandTest, ATitleThatBreaksTheFile) {
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=17\" Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID\n");
    EXPECT_EQ(checkScripts(wanted({file}, true, false), output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr(file + ":2:7: error: the title 17\"_Fans has a double "
                                                "quote or a control character"));
}

TEST_F(CheckCommandTest, AScriptThatCannotBeReadLeavesTheFindingsOfTheOthers) {
    const std::string none = directory.path("none");
    const std::string file = directory.write("x.script.inv", std::string(kGood) + "nonsense\n");
    EXPECT_EQ(checkScripts(wanted({none, file}, true, false), output.plain()), 2);
    EXPECT_EQ(output.errors(), "sennetctl: " + none + ": there is no such file\n");
    EXPECT_THAT(output.text(), HasSubstr("1 file: 0 errors, 1 warning (no server was asked)\n"));
}

TEST_F(CheckCommandTest, NothingIsToldOfScriptsOfWhichNoneCanBeRead) {
    EXPECT_EQ(checkScripts(wanted({directory.path("none")}, true, false), output.plain()), 2);
    EXPECT_EQ(output.text(), "");
}

TEST_F(CheckCommandTest, AFaultOfTheResourcePropertiesIsToldOnce) {
    directory.write("texts",
                    "title.Fans=Fans\nCIM_Fan.State.Size=abc\nCIM_Fan.DeviceID=Fan\n"
                    "CIM_Fan.State=State\n");
    const std::string file = directory.write(
        "x.script.inv", "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID,State\n");
    EXPECT_EQ(checkScripts(wanted({file}, false, true), output.plain()), 1);
    EXPECT_EQ(output.text(),
              places.resources +
                  ":2:20: error: the size 'abc' is written as it is: readers refuse a MIF file "
                  "with String(abc), and databases the table\n" +
                  file + ":4:6: note: CIM_Fan: 2 instances\n1 file: 1 error, 0 warnings\n");
}

// Each name would be told otherwise.
TEST_F(CheckCommandTest, ResourcePropertiesThatCannotBeReadAreToldOnce) {
    places.resources = directory.path("none");
    const std::string file = directory.write(
        "x.script.inv",
        "[DEFAULT]\ntitle=Fans of this machine\n[CIM]\nG[0]=CIM_Fan\nA[0]=DeviceID,State\n");
    EXPECT_EQ(checkScripts(wanted({file}, false, true), output.plain()), 1);
    EXPECT_EQ(output.text(), places.resources +
                                 ": error: there is no such file: sennet shows titles and "
                                 "properties as the scripts have them\n" +
                                 file +
                                 ":4:6: note: CIM_Fan: 2 instances\n1 file: 1 error, 0 "
                                 "warnings\n");
}

TEST_F(CheckCommandTest, AConfigurationThatIsNamedAndNotThere) {
    places.isConfigured = true;
    const std::string file = directory.write("x.script.inv", kGood);
    EXPECT_EQ(checkScripts(wanted({file}, true), output.plain()), 1);
    EXPECT_EQ(output.text(), places.configuration +
                                 ": error: there is no such file: sennet takes its default "
                                 "places\n1 file: 1 error, 0 warnings (no server was asked)\n");
}

TEST_F(CheckCommandTest, VerboselyThePlacesAreTold) {
    places.outputs = {{"mif.directory.SMS", "/srv/sms"}, {"sql.directory.QVE", "/srv/sql"}};
    CheckOptions options = wanted({directory.write("x.script.inv", kGood)}, true);
    options.verbose = true;
    EXPECT_EQ(checkScripts(options, output.plain()), 0);
    EXPECT_EQ(output.text(), "configuration: " + places.configuration + "\ndirectory: " +
                                 places.scriptDirectory + "\nresources: " + places.resources +
                                 "\nmif.directory.SMS: /srv/sms\nsql.directory.QVE: /srv/sql\n"
                                 "1 file: 0 errors, 0 warnings (no server was asked)\n");
    CapturedOutput document;
    EXPECT_EQ(checkScripts(options, document.json()), 0);
    EXPECT_EQ(document.document()["configuration"], places.configuration);
    EXPECT_EQ(document.document()["directory"], places.scriptDirectory);
    EXPECT_EQ(document.document()["resources"], places.resources);
    EXPECT_EQ(document.document()["mif.directory.SMS"], "/srv/sms");
}

TEST_F(CheckCommandTest, ADirectoryThatCannotBeListed) {
    places.scriptDirectory = directory.write("file", "");
    EXPECT_EQ(checkScripts(wanted({}, true), output.json()), 2);
    const std::string reason =
        "the directory '" + places.scriptDirectory + "' of inventory scripts: Not a directory";
    EXPECT_EQ(output.errors(), "sennetctl: " + reason + "\n");
    EXPECT_EQ(output.document()["error"]["message"], reason);
}

TEST_F(CheckCommandTest, ADirectoryWithoutScripts) {
    EXPECT_EQ(checkScripts(wanted({}, true), output.plain()), 2);
    EXPECT_EQ(output.errors(),
              "sennetctl: there are no inventory scripts in '" + directory.path("") + "'\n");
    places.scriptDirectory = directory.path("none");
    places.isConfigured = true;
    CapturedOutput later;
    EXPECT_EQ(checkScripts(wanted({}, true), later.plain()), 2);
    EXPECT_EQ(later.errors(), "sennetctl: there is no directory '" + places.scriptDirectory +
                                  "' of inventory scripts\n");
    EXPECT_THAT(later.text(), HasSubstr("none: error: there is no such file"));
}

TEST_F(CheckCommandTest, ProgressIsTakenAwayAtTheEnd) {
    const std::string file = directory.write("x.script.inv", kGood);
    Output shown = output.plain();
    shown.progress = true;
    checkScripts(wanted({file}, true, false), shown);
    EXPECT_EQ(output.errors(), "\r\x1B[Kscript 1 of 1: " + file + "\r\x1B[K");
}

}  // namespace
}  // namespace sennetctl
