#include "server/ServerCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "CapturedOutput.h"
#include "FanServer.h"
#include "report/WholeFile.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using support::Reply;
using ::testing::HasSubstr;
using ::testing::Not;

/// The server tells of one namespace, has one more of the usual ones, and no other.
class ServerCommandTest : public testing::Test {
  protected:
    ServerCommandTest() {
        fans.server.onNext(
            Reply::ok(instanceXml("CIM_Namespace", "n",
                                  "<PROPERTY NAME=\"Name\" TYPE=\"string\"><VALUE>root/own</VALUE>"
                                  "</PROPERTY>")));
        fans.server.onNext(Reply::cimError(3, "none"));
        fans.server.onNext(Reply::cimError(3, "none"));
        fans.server.onNext(
            Reply::ok("<CLASSNAME NAME=\"CIM_Fan\"/><CLASSNAME NAME=\"CIM_Card\"/>"));
        for (int i = 0; i < 5; ++i) {
            fans.server.onNext(Reply::cimError(3, "none"));
        }
    }

    FanServer fans;
    CapturedOutput output;
};

TEST_F(ServerCommandTest, TellsPlacesNamespacesAndClasses) {
    fans.server.onNext(Reply::ok("<CLASSNAME NAME=\"OWN_Thing\"/>"));
    EXPECT_EQ(showServer({}, output.json()), 0);
    const Json document = output.document();
    ASSERT_EQ(document["places"].size(), 1U);
    EXPECT_EQ(document["places"][0]["place"], fans.server.socketPath());
    EXPECT_EQ(document["places"][0]["result"], "connected");
    EXPECT_EQ(document["places"][0]["chosen"], true);
    EXPECT_EQ(document["placesReason"], "CIM_LOCAL_SOCKET names the only place that is tried");
    EXPECT_EQ(document["namespaces"].dump(),
              R"([{"namespace":"root/cimv2","classes":["CIM_Card","CIM_Fan"]},)"
              R"({"namespace":"root/own","classes":["OWN_Thing"]}])");
    EXPECT_GT(document["roundTripMilliseconds"], 0.0);
    EXPECT_LT(document["roundTripMilliseconds"], 5000.0);
}

TEST_F(ServerCommandTest, ListsClassesWhenAsked) {
    fans.server.onNext(Reply::cimError(7, "not here"));
    EXPECT_EQ(showServer({{}, true}, output.plain()), 0);
    EXPECT_THAT(output.text(), HasSubstr("NAMESPACE   CLASSES\n"
                                         "root/cimv2  2\n"
                                         "root/own    CIM_ERR_NOT_SUPPORTED (7): not here\n"
                                         "\nroot/cimv2:\n  CIM_Card\n  CIM_Fan\n"));
    EXPECT_THAT(output.text(), HasSubstr("*  " + fans.server.socketPath() + "  "));
}

TEST_F(ServerCommandTest, TellsThatAWantedNamespaceIsNotThere) {
    fans.server.onNext(Reply::cimError(3, "none"));
    fans.server.onNext(Reply::cimError(3, "none"));
    EXPECT_EQ(showServer({{"root/mine", "ROOT/CIMV2"}, false}, output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr("root/mine   the server has no such namespace\n"));
    EXPECT_THAT(output.text(), Not(HasSubstr("root/own")));
}

TEST(ServerCommandOfASilentServerTest, ThePlacesAreToldAndThatItDoesNotAnswer) {
    FanServer fans;
    ServerOptions options;
    options.timeoutSeconds = 1;
    for (int i = 0; i < 2; ++i) {
        fans.server.onNext(Reply::silence());
    }
    CapturedOutput output;
    EXPECT_EQ(showServer(options, output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr("*  " + fans.server.socketPath() + "  "));
    EXPECT_THAT(output.text(), HasSubstr("\nNo useful answer: the CIM server is connected, but "
                                         "does not answer within 1 s\n"));
    CapturedOutput json;
    EXPECT_EQ(showServer(options, json.json()), 1);
    EXPECT_EQ(json.document()["places"][0]["result"], "connected");
    EXPECT_EQ(json.document()["failure"],
              "the CIM server is connected, but does not answer within 1 s");
}

TEST_F(ServerCommandTest, WhatWasAnsweredBeforeTheFailureIsTold) {
    fans.server.onNext(Reply::closeAtOnce());
    EXPECT_EQ(showServer({}, output.plain()), 1);
    EXPECT_THAT(output.text(), HasSubstr("NAMESPACE   CLASSES\nroot/cimv2  2\n"));
    EXPECT_THAT(output.text(), HasSubstr("\nNo useful answer: the CIM server: "));
    EXPECT_THAT(output.text(), Not(HasSubstr("Round trip")));
}

TEST_F(ServerCommandTest, AWantedNamespaceHasALegalName) {
    EXPECT_THROW(showServer({{"root//mine"}, false}, output.plain()), CannotRun);
    EXPECT_EQ(output.text(), "");
}

TEST(ServerCommandOfAnOddServerTest, AToldNamespaceThatIsNoneIsPassedOver) {
    FanServer fans;
    fans.server.onNext(
        Reply::ok(instanceXml("CIM_Namespace", "n",
                              "<PROPERTY NAME=\"Name\" TYPE=\"string\"><VALUE>root//own</VALUE>"
                              "</PROPERTY>")));
    CapturedOutput output;
    EXPECT_EQ(showServer({}, output.plain()), 0);
    EXPECT_THAT(output.text(), Not(HasSubstr("root//own")));
}

TEST(ServerCommandWithoutServerTest, TellsEachPlaceAndTheReason) {
    const support::TempDirectory directory;
    const support::ScopedEnvironment place("CIM_LOCAL_SOCKET", directory.path("none"));
    CapturedOutput output;
    EXPECT_EQ(showServer({}, output.plain()), 1);
    EXPECT_THAT(output.text(),
                HasSubstr(directory.path("none") + "  -      No such file or directory\n"));
    EXPECT_THAT(output.text(), HasSubstr("No server is reached: "));
    CapturedOutput document;
    EXPECT_EQ(showServer({}, document.json()), 1);
    EXPECT_EQ(document.document()["places"][0]["owner"], nullptr);
    EXPECT_NE(document.document()["failure"], "");
}

}  // namespace
}  // namespace sennetctl
