#include "server/GetCommand.h"

#include <gtest/gtest.h>

#include "CapturedOutput.h"
#include "FanServer.h"
#include "report/WholeFile.h"

namespace sennetctl {
namespace {

using support::Reply;

class GetCommandTest : public testing::Test {
  protected:
    std::string failureOf(const GetOptions& options) {
        try {
            showInstances(options, output.plain());
        } catch (const CannotRun& failure) {
            return failure.what();
        }
        return "none";
    }

    FanServer fans;
    CapturedOutput output;
    GetOptions options{"CIM_Fan", "root/cimv2", {}};
};

TEST_F(GetCommandTest, AServerThatDoesNotAnswerIsToldAsSuch) {
    fans.server.onNext(Reply::silence());
    options.timeoutSeconds = 1;
    EXPECT_EQ(failureOf(options), "the CIM server is connected, but does not answer within 1 s");
}

TEST_F(GetCommandTest, ShowsWhatHasAValue) {
    EXPECT_EQ(showInstances(options, output.plain()), 0);
    EXPECT_EQ(output.text(),
              "DeviceID  State     Bytes\n"
              "fan1      Enabled   10\n"
              "fan2      Disabled  20\n"
              "2 instances\n");
}

TEST_F(GetCommandTest, ProgressIsTakenAwayAtTheEnd) {
    Output shown = output.plain();
    shown.progress = true;
    showInstances(options, shown);
    EXPECT_EQ(output.errors(), "\r\x1B[Kasking for CIM_Fan\r\x1B[K");
}

TEST_F(GetCommandTest, ShowsThePropertiesThatWereAskedFor) {
    options.properties = {"bytes", "DeviceID"};
    EXPECT_EQ(showInstances(options, output.plain()), 0);
    EXPECT_EQ(output.text(),
              "bytes  DeviceID\n"
              "10     fan1\n"
              "20     fan2\n"
              "2 instances\n");
}

TEST_F(GetCommandTest, APropertyThatTheClassLacksIsAFinding) {
    options.properties = {"DeviceID", "Colour"};
    EXPECT_EQ(showInstances(options, output.plain()), 1);
    EXPECT_EQ(output.errors(), "sennetctl: CIM_Fan declares no property Colour\n");
    CapturedOutput told;
    EXPECT_EQ(showInstances(options, told.json()), 1);
    EXPECT_EQ(told.document()["findings"].dump(),
              R"([{"severity":"warning","message":"CIM_Fan declares no property Colour"}])");
    EXPECT_EQ(told.document()["instances"][0]["Colour"], nullptr);
}

TEST_F(GetCommandTest, NoInstancesAreAFinding) {
    fans.setFans("");
    EXPECT_EQ(showInstances(options, output.plain()), 1);
    EXPECT_EQ(output.text(), "0 instances\n");
}

TEST_F(GetCommandTest, JsonHasNumbersAndNames) {
    fans.setFans(fanXml("fan1", "2", "18446744073709551615"));
    options.properties = {"DeviceID", "State", "Bytes", "Spare"};
    EXPECT_EQ(showInstances(options, output.json()), 0);
    EXPECT_EQ(output.document().dump(),
              R"({"class":"CIM_Fan","namespace":"root/cimv2","instances":[{"DeviceID":"fan1",)"
              R"("State":{"value":2,"text":"Enabled"},"Bytes":18446744073709551615,)"
              R"("Spare":null}],"findings":[]})");
}

TEST_F(GetCommandTest, TellsWhatTheServerRefuses) {
    options.className = "CIM_Nothing";
    EXPECT_EQ(failureOf(options),
              "root/cimv2:CIM_Nothing: CIM_ERR_NOT_FOUND (6): CIM_ERR_NOT_FOUND: CIM_Nothing");
    options.className = "CIM-Fan";
    EXPECT_EQ(failureOf(options), "'CIM-Fan' is no CIM name");
    options = {"CIM_Fan", "root//x", {}};
    EXPECT_EQ(failureOf(options), "'root//x' is no name of a namespace");
}

TEST_F(GetCommandTest, TellsThatTheServerIsBroken) {
    fans.server.onGetClass("CIM_Fan", Reply::closeAtOnce());
    EXPECT_EQ(failureOf(options).substr(0, 16), "the CIM server: ");
    fans.server.stop();
    EXPECT_NE(failureOf(options).find("sennetctl server tells each place"), std::string::npos);
}

}  // namespace
}  // namespace sennetctl
