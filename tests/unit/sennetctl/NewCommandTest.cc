#include "script/NewCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "CapturedOutput.h"
#include "FanServer.h"
#include "report/WholeFile.h"
#include "script/CheckCommand.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class NewCommandTest : public testing::Test {
  protected:
    std::string failureOf(const NewOptions& wanted) {
        try {
            writeNewScript(wanted, output.plain());
        } catch (const CannotRun& failure) {
            return failure.what();
        }
        return "none";
    }

    FanServer fans;
    support::TempDirectory directory;
    CapturedOutput output;
    NewOptions options{directory.path("coolers.script.inv"),
                       {"CIM_Fan"},
                       "root/cimv2",
                       "",
                       directory.path("texts")};
};

TEST_F(NewCommandTest, AServerThatDoesNotAnswerIsToldAsSuch) {
    fans.server.onNext(support::Reply::silence());
    options.timeoutSeconds = 1;
    EXPECT_EQ(failureOf(options), "the CIM server is connected, but does not answer within 1 s");
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST_F(NewCommandTest, WritesScriptAndProperties) {
    EXPECT_EQ(writeNewScript(options, output.plain()), 0);
    EXPECT_EQ(directory.read("coolers.script.inv"),
              "[DEFAULT]\n"
              "title=Coolers Inventory\n"
              "\n"
              "[CIM]\n"
              "G[0]=CIM_Fan\n"
              "N[0]=root/cimv2\n"
              "A[0]=DeviceID,State,Bytes\n");
    EXPECT_EQ(directory.read("coolers.properties"),
              "\n# coolers.script.inv\n"
              "title.Coolers_Inventory=Coolers\n"
              "CIM_Fan.DeviceID=Device ID\n"
              "CIM_Fan.State=State\n"
              "CIM_Fan.State.Size=64\n"
              "CIM_Fan.Bytes=Bytes\n");
    EXPECT_THAT(output.text(),
                HasSubstr("not listed: CIM_Fan.Spare: it has no value on this machine\n"));
}

TEST_F(NewCommandTest, ProgressIsTakenAwayAtTheEnd) {
    Output shown = output.plain();
    shown.progress = true;
    writeNewScript(options, shown);
    EXPECT_EQ(output.errors(), "\r\x1B[Kasking for CIM_Fan\r\x1B[K");
}

TEST_F(NewCommandTest, WhatItWritesIsWithoutFault) {
    options.classes = {"CIM_Fan"};
    options.title = "Fans";
    writeNewScript(options, output.plain());
    const Places places{directory.path("none"), false, "", directory.path("coolers.properties")};
    CapturedOutput checked;
    EXPECT_EQ(checkScripts({{options.script}, false, false, 10, false, places}, checked.plain()), 0)
        << checked.text();
}

TEST_F(NewCommandTest, ClassesWithoutInstancesListEverything) {
    fans.setFans("");
    EXPECT_EQ(writeNewScript(options, output.json()), 0);
    EXPECT_THAT(directory.read("coolers.script.inv"),
                HasSubstr("A[0]=DeviceID,State,Bytes,Spare\n"));
    EXPECT_EQ(output.document()["leftOut"].dump(), "[]");
}

TEST_F(NewCommandTest, LeavesOutWhatNoFileShows) {
    fans.server.onGetClass(
        "CIM_Fan",
        support::Reply::ok(
            R"(<CLASS NAME="CIM_Fan"><PROPERTY NAME="CreationClassName" TYPE="string"/>)"
            R"(<PROPERTY.REFERENCE NAME="Other"/><PROPERTY NAME="ID" TYPE="string"/></CLASS>)"));
    fans.setFans("");
    writeNewScript(options, output.json());
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("A[0]=ID\n"));
    EXPECT_EQ(output.document()["leftOut"].size(), 2U);
}

TEST_F(NewCommandTest, TitlesThatNoScriptCanHave) {
    for (const char* title : {"Rack 17\" A", "A = B", "A\tB", "C:\\temp", "A|B", "$(id)", "`id`"}) {
        options.title = title;
        EXPECT_EQ(failureOf(options),
                  "a title has none of the characters \" \\ $ ` = | and no control character");
    }
    for (const std::string& title : {std::string("M\xFCller"), std::string("M\xC3\xBCller"),
                                     std::string(" "), std::string(201, 'x')}) {
        options.title = title;
        EXPECT_EQ(failureOf(options), "a title is a text of 1 to 200 letters of ASCII");
    }
    options = {directory.path("a\"b.script.inv"), {"CIM_Fan"}, "root/cimv2", "", ""};
    EXPECT_EQ(failureOf(options),
              "a title has none of the characters \" \\ $ ` = | and no control character");
    EXPECT_THAT(directory.names(), ElementsAre());
}

TEST_F(NewCommandTest, TitlesThatWouldAlterTheMachinesOwnRecord) {
    for (const char* title : {"Identification", "ARCHITECTURE"}) {
        options.title = title;
        EXPECT_THAT(failureOf(options), HasSubstr(std::string("the title ") + title +
                                                  " is one of Configuration Manager's own"));
    }
    options = {directory.path("architecture.script.inv"), {"CIM_Fan"}, "root/cimv2", "", ""};
    EXPECT_THAT(failureOf(options), HasSubstr("the title Architecture is one of"))
        << "shown for the title Architecture Inventory";
    EXPECT_THAT(directory.names(), ElementsAre());
}

TEST_F(NewCommandTest, TitlesAreTrimmedAndShownShort) {
    options.title = " Coolers: all of them ";
    writeNewScript(options, output.plain());
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("title=Coolers: all of them\n"));
    EXPECT_THAT(directory.read("coolers.properties"),
                HasSubstr("\ntitle.Coolers\\:_all_of_them=Coo all of th\n"));
}

TEST_F(NewCommandTest, WhatIsNamedAlreadyIsNotNamedAgain) {
    directory.write("texts",
                    "title.Coolers_Inventory=Cold\nCIM_Fan.DeviceID=State\n"
                    "CIM_Fan.State.Size=8\n");
    writeNewScript(options, output.plain());
    EXPECT_EQ(directory.read("coolers.properties"),
              "\n# coolers.script.inv\nCIM_Fan.State=State 2\nCIM_Fan.Bytes=Bytes\n");
    const std::string in = "in " + options.resources + " already: ";
    EXPECT_THAT(output.text(), HasSubstr(in + "title.Coolers_Inventory\n" + in +
                                         "CIM_Fan.DeviceID\n" + in + "CIM_Fan.State.Size\n"));
}

TEST_F(NewCommandTest, ANameThatAnotherColumnHasLeavesThePropertyOut) {
    directory.write("texts", "CIM_Fan.DeviceID=Fan\nCIM_Fan.State=FAN\n");
    writeNewScript(options, output.json());
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("A[0]=DeviceID,Bytes\n"));
    EXPECT_EQ(output.document()["leftOut"][0],
              "CIM_Fan.State: its name FAN is that of another column");
    EXPECT_EQ(output.document()["present"].dump(), "[\"CIM_Fan.DeviceID\"]");
}

TEST_F(NewCommandTest, NumbersThatDoNotFitAreLeftOut) {
    fans.setFans(fanXml("a", "2", "2147483648"));
    writeNewScript(options, output.json());
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("A[0]=DeviceID,State\n"));
    EXPECT_EQ(output.document()["leftOut"][0],
              "CIM_Fan.Bytes: it has numbers beyond 32 bits with sign");
}

TEST_F(NewCommandTest, SizesHaveRoomForTheValues) {
    fans.setFans(fanXml(std::string(65, 'x'), "2", "1"));
    writeNewScript(options, output.plain());
    EXPECT_THAT(directory.read("coolers.properties"), HasSubstr("CIM_Fan.DeviceID.Size=128\n"));
}

TEST_F(NewCommandTest, ClassesWithoutInstancesComeLast) {
    fans.server.onGetClass(
        "CIM_None", support::Reply::ok(
                        R"(<CLASS NAME="CIM_None"><PROPERTY NAME="ID" TYPE="string"/></CLASS>)"));
    fans.server.onEnumerateInstances("CIM_None", support::Reply::ok(""));
    options.classes = {"CIM_None", "CIM_Fan"};
    writeNewScript(options, output.plain());
    EXPECT_THAT(output.text(), HasSubstr("warning: the classes have different numbers of instances "
                                         "(CIM_None 0, CIM_Fan 2), whose rows stand side by side"));
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("G[0]=CIM_Fan\n"));
    EXPECT_THAT(directory.read("coolers.script.inv"), HasSubstr("G[1]=CIM_None\n"));
}

TEST_F(NewCommandTest, AClassOfWhichNothingCanBeListed) {
    fans.server.onGetClass(
        "CIM_Fan",
        support::Reply::ok(R"(<CLASS NAME="CIM_Fan"><PROPERTY.REFERENCE NAME="Other"/></CLASS>)"));
    EXPECT_EQ(failureOf(options), "CIM_Fan has no property that a script can list");
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST_F(NewCommandTest, AClassThatIsGivenTwice) {
    options.classes = {"CIM_Fan", "CIM_None", "cim_fan"};
    EXPECT_EQ(failureOf(options), "the class cim_fan is given twice");
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST_F(NewCommandTest, NothingIsReplaced) {
    directory.write("coolers.properties", "mine");
    EXPECT_EQ(failureOf(options), directory.path("coolers.properties") + ": exists already");
    EXPECT_EQ(directory.read("coolers.properties"), "mine");
    EXPECT_THAT(directory.names(), ElementsAre("coolers.properties"));
}

TEST_F(NewCommandTest, NothingIsLeftBehindByAFailure) {
    options.classes = {"CIM_Fan", "CIM_None"};
    EXPECT_THAT(failureOf(options), HasSubstr("root/cimv2:CIM_None: CIM_ERR_NOT_FOUND (6)"));
    options.classes.assign(11, "CIM_None");
    EXPECT_EQ(failureOf(options), "a script has room for 10 classes");
    options.script = directory.path("fans.inv");
    EXPECT_EQ(failureOf(options),
              directory.path("fans.inv") + ": the name of a script ends in .script.inv");
    options.script = directory.path("none/fans.script.inv");
    options.classes = {"CIM_Fan"};
    EXPECT_EQ(failureOf(options),
              directory.path("none/fans.properties") + ": No such file or directory");
    EXPECT_THAT(directory.names(), IsEmpty());
}

}  // namespace
}  // namespace sennetctl
