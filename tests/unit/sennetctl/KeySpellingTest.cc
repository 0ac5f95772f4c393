#include "script/KeySpelling.h"

#include <gtest/gtest.h>

namespace sennetctl {
namespace {

/// A script with CIM_Fan.DeviceID, of which the server told how the class is written.
ScriptModel fanScript() {
    ScriptModel model;
    model.slots[0].className = {"cim_fan", 4, 6};
    model.slots[0].serverSpelling = "CIM_Fan";
    model.slots[0].properties = {{"DeviceID", 5, 6}};
    return model;
}

std::string told(const KeySpelling& keys, bool areAll = true) {
    std::vector<Finding> findings;
    keys.tell(areAll, findings);
    std::string text;
    for (const Finding& finding : findings) {
        text += finding.file + ":" + std::to_string(finding.line) + ":" +
                std::to_string(finding.column) + ": " + nameOf(finding.severity) + ": " +
                finding.message + "\n";
    }
    return text;
}

std::string told(const std::string& octets, const ScriptModel& model) {
    KeySpelling keys("r", octets);
    keys.look(model);
    return told(keys);
}

TEST(KeySpellingTest, KeysThatAreLookedUp) {
    EXPECT_EQ(told("CIM_Fan.DeviceID=Fan\nCIM_Fan.DeviceID.Size=9\nCIM_Fan.state=x\n", fanScript()),
              "")
        << "the script does not list the state";
}

TEST(KeySpellingTest, ClassesAndPropertiesInOtherLetters) {
    KeySpelling keys("r", "#\n CIM_Fan.DeviceId.Size=9\ncim_fan.DeviceID=Fan\n");
    keys.look(fanScript());
    keys.look(fanScript());
    EXPECT_EQ(told(keys),
              "r:2:2: warning: line without effect: sennet looks for CIM_Fan.DeviceID.Size\n"
              "r:3:1: warning: line without effect: sennet looks for CIM_Fan.DeviceID\n");
}

TEST(KeySpellingTest, ScriptsThatWereNotLookedAt) {
    KeySpelling keys("r", "cim_fan.DeviceID=Fan\n");
    keys.look(fanScript());
    EXPECT_EQ(told(keys, false),
              "r:1:1: warning: line without effect on these scripts: sennet looks for "
              "CIM_Fan.DeviceID\n");
}

TEST(KeySpellingTest, TheRightKeyIsThereToo) {
    EXPECT_EQ(told("cim_fan.DeviceID=Fan\nCIM_Fan.DeviceID=Fan\n", fanScript()), "");
}

TEST(KeySpellingTest, AKeyThatAnotherScriptNeeds) {
    KeySpelling keys("r", "CIM_Fan.deviceid=Fan\nCIM_Fan.DEVICEID=Fan\n");
    ScriptModel other = fanScript();
    other.slots[0].properties = {{"deviceid", 5, 6}};
    keys.look(fanScript());
    keys.look(other);
    EXPECT_EQ(told(keys),
              "r:2:1: warning: line without effect: sennet looks for CIM_Fan.DeviceID\n");
}

TEST(KeySpellingTest, Titles) {
    ScriptModel model = fanScript();
    model.title = {"Fan List", 2, 7};
    EXPECT_EQ(told("title.fan_list=x\n", model),
              "r:1:1: warning: line without effect: sennet looks for title.Fan_List\n");
    EXPECT_EQ(told("title.Fan_List=x\ntitle.fan_list=x\n", model), "");
    model.title = {};
    model.file = "/d/fans.script.inv";
    EXPECT_EQ(told("title.Fans=x\n", model),
              "r:1:1: warning: line without effect: sennet looks for title.fans\n");
}

// What is wrong with them is told of each key, with and without a script.
TEST(KeySpellingTest, BeginningsAndEndsInOtherLetters) {
    ScriptModel model = fanScript();
    model.title = {"Fans", 2, 7};
    EXPECT_EQ(told("Title.Fans=x\nCIM_Fan.DeviceID.size=9\n", model), "");
}

TEST(KeySpellingTest, AClassOfWhichNoServerTold) {
    ScriptModel model = fanScript();
    model.slots[0].serverSpelling.clear();
    EXPECT_EQ(told("cim_fan.DeviceID=Fan\nCim_Fan.DeviceID=Fan\n", model), "");
}

}  // namespace
}  // namespace sennetctl
