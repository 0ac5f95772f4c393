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

std::string told(KeySpelling& keys, const ScriptModel& model) {
    std::vector<Finding> findings;
    keys.check(model, findings);
    std::string text;
    for (const Finding& finding : findings) {
        text += finding.file + ":" + std::to_string(finding.line) + ":" +
                std::to_string(finding.column) + ": " + nameOf(finding.severity) + ": " +
                finding.message + "\n";
    }
    return text;
}

TEST(KeySpellingTest, KeysThatAreLookedUp) {
    KeySpelling keys("r", "CIM_Fan.DeviceID=Fan\nCIM_Fan.DeviceID.Size=9\nCIM_Fan.state=x\n");
    EXPECT_EQ(told(keys, fanScript()), "") << "the script does not list the state";
}

TEST(KeySpellingTest, ClassesAndPropertiesInOtherLetters) {
    KeySpelling keys("r", "#\n cim_fan.DeviceID=Fan\nCIM_Fan.DeviceId.Size=9\n");
    EXPECT_EQ(told(keys, fanScript()),
              "r:2:2: warning: line without effect: sennet looks for CIM_Fan.DeviceID\n"
              "r:3:1: warning: line without effect: sennet looks for CIM_Fan.DeviceID.Size\n");
    EXPECT_EQ(told(keys, fanScript()), "") << "once";
}

TEST(KeySpellingTest, TheRightKeyIsThereToo) {
    KeySpelling keys("r", "cim_fan.DeviceID=Fan\nCIM_Fan.DeviceID=Fan\n");
    EXPECT_EQ(told(keys, fanScript()), "");
}

TEST(KeySpellingTest, AClassOfWhichNoServerTold) {
    KeySpelling keys("r", "cim_fan.DeviceID=Fan\nCim_Fan.DeviceID=Fan\n");
    ScriptModel model = fanScript();
    model.slots[0].serverSpelling.clear();
    EXPECT_EQ(told(keys, model), "");
}

}  // namespace
}  // namespace sennetctl
