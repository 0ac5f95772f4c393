// The command line as a user sees it: messages, exit statuses, directories.

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <string>
#include <thread>

#include "integration/sennet/SennetSetup.h"
#include "support/Files.h"

namespace {

using namespace std::chrono_literals;
using support::FakeCimServer;
using support::ProgramResult;

constexpr const char* kInvalid =
    "Error -- invalid MIF type specified. This option is case sensitive. Your MIF type is: ";

class CommandLineTest : public ::testing::Test {
  protected:
    void expectInvalid(const std::string& type, const std::string& shown) const {
        const ProgramResult result = setup.runWithoutServer({type});
        EXPECT_EQ(result.exitStatus, 1);
        EXPECT_EQ(result.out, SennetSetup::banner() + kInvalid + shown + "\n");
        EXPECT_EQ(result.err, "");
        EXPECT_FALSE(std::filesystem::exists(setup.mifDirectory()));
    }

    SennetSetup setup;
};

TEST_F(CommandLineTest, PrintsTheUsageWithoutArguments) {
    const ProgramResult result = setup.runWithoutServer({});
    EXPECT_EQ(result.exitStatus, 1);
    EXPECT_EQ(result.out,
              "Corvane CIM to MIF Generator, version 5.20\n"
              "\n"
              "Usage: sennet </SMS | /CA | /QVE | /LD> [ <target directory> ]\n"
              "These options are case sensitive.\n");
    EXPECT_EQ(result.err, "");
}

TEST_F(CommandLineTest, RefusesOtherTypes) {
    expectInvalid("/sms", "/sms");
    expectInvalid("/Qve", "/Qve");
    expectInvalid("SMS", "SMS");
    expectInvalid("", "");
    expectInvalid("--help", "--help");
}

TEST_F(CommandLineTest, ShowsAWrongTypeLiterally) {
    expectInvalid("%s%n%d%%", "%s%n%d%%");
    expectInvalid("a b\tc\\", "a b\tc\\");
    expectInvalid("/SMS\xFF\xC3", "/SMS\xFF\xC3");
}

TEST_F(CommandLineTest, CutsALongWrongTypeToTheMessageBuffer) {
    // The fixed text has 86 characters; newline and terminator take two of the 256.
    expectInvalid(std::string(400, 'x'), std::string(168, 'x'));
    expectInvalid(std::string(169, 'x'), std::string(168, 'x'));
    expectInvalid(std::string(168, 'x'), std::string(168, 'x'));
    expectInvalid(std::string(167, 'x'), std::string(167, 'x'));
    expectInvalid(std::string(100000, '%'), std::string(168, '%'));
}

TEST_F(CommandLineTest, EndsWithStatusOneWithoutAServer) {
    setup.addScript("cpu.script.inv", "[CIM]\nG[0]=CIM_Processor\n");
    for (const char* type : {"/SMS", "/CA", "/QVE", "/LD"}) {
        const ProgramResult result = setup.runWithoutServer({type});
        EXPECT_EQ(result.exitStatus, 1) << type;
        EXPECT_EQ(result.out, setup.start()) << type;
        EXPECT_EQ(result.err, "") << type;
    }
}

TEST_F(CommandLineTest, CreatesTheGivenDirectoryWithItsParents) {
    const std::string target = setup.path("deep/er/out");
    const ProgramResult result = setup.runWithoutServer({"/SMS", target});
    EXPECT_EQ(result.exitStatus, 1);
    EXPECT_EQ(result.out, SennetSetup::banner() + "Creating MIF files in " + target + "\n");
    EXPECT_TRUE(std::filesystem::is_directory(target));
    EXPECT_FALSE(std::filesystem::exists(setup.mifDirectory()));
    EXPECT_FALSE(std::filesystem::exists(setup.sqlDirectory()));
}

TEST_F(CommandLineTest, CreatesTheSqlDirectoryForQveOnly) {
    for (const char* type : {"/SMS", "/CA", "/LD"}) {
        setup.runWithoutServer({type, setup.path("m"), setup.path("s")});
        EXPECT_TRUE(std::filesystem::is_directory(setup.path("m"))) << type;
        EXPECT_FALSE(std::filesystem::exists(setup.path("s"))) << type;
        std::filesystem::remove(setup.path("m"));
    }
    setup.runWithoutServer({"/QVE", setup.path("m"), setup.path("s"), setup.path("t")});
    EXPECT_TRUE(std::filesystem::is_directory(setup.path("m")));
    EXPECT_TRUE(std::filesystem::is_directory(setup.path("s")));
    EXPECT_FALSE(std::filesystem::exists(setup.path("t")));
}

TEST_F(CommandLineTest, TakesTheDefaultSqlDirectoryBesideAGivenMifDirectory) {
    setup.runWithoutServer({"/QVE", setup.path("m")});
    EXPECT_TRUE(std::filesystem::is_directory(setup.path("m")));
    EXPECT_TRUE(std::filesystem::is_directory(setup.sqlDirectory()));
    EXPECT_FALSE(std::filesystem::exists(setup.mifDirectory()));
}

TEST_F(CommandLineTest, TakesTheDirectoryConfiguredForTheProduct) {
    setup.configure("mif.directory.LD=" + setup.path("landesk"));
    EXPECT_EQ(setup.runWithoutServer({"/LD"}).out,
              SennetSetup::banner() + "Creating MIF files in " + setup.path("landesk") + "\n");
    EXPECT_EQ(setup.runWithoutServer({"/SMS"}).out, setup.start());
}

TEST_F(CommandLineTest, ShowsADirectoryLiterally) {
    const std::string target = setup.path(
        "100% gr\xC3\xB6\xC3\x9F"
        "er %s");
    EXPECT_EQ(setup.runWithoutServer({"/SMS", target}).out,
              SennetSetup::banner() + "Creating MIF files in " + target + "\n");
    EXPECT_TRUE(std::filesystem::is_directory(target));
}

TEST_F(CommandLineTest, GoesOnWhenTheDirectoryCannotBeCreated) {
    support::writeFile(setup.path("file"), "in the way");
    const FakeCimServer server;
    const ProgramResult result = setup.run({"/SMS", setup.path("file/out")}, server);
    EXPECT_EQ(result.exitStatus, 0);
    EXPECT_EQ(result.out,
              SennetSetup::banner() + "Creating MIF files in " + setup.path("file/out") + "\n");
    EXPECT_EQ(result.err, "");
}

// A program that only connects may have ended before the server takes note of it.
bool comesToHaveAConnection(const FakeCimServer& server) {
    const auto end = std::chrono::steady_clock::now() + 10s;
    while (server.connectionCount() == 0 && std::chrono::steady_clock::now() < end) {
        std::this_thread::sleep_for(1ms);
    }
    return server.connectionCount() > 0;
}

TEST_F(CommandLineTest, ConnectsEvenWithoutScripts) {
    const FakeCimServer server;
    const ProgramResult result = setup.run({"/SMS"}, server);
    EXPECT_EQ(result.exitStatus, 0);
    EXPECT_EQ(result.out, setup.start());
    EXPECT_EQ(result.err, "");
    EXPECT_TRUE(comesToHaveAConnection(server));
    EXPECT_TRUE(server.requests().empty());
    EXPECT_TRUE(std::filesystem::is_directory(setup.mifDirectory()));
}

TEST_F(CommandLineTest, TakesAMissingScriptDirectoryAsEmpty) {
    setup.configure("sennet.directory=" + setup.path("nowhere"));
    const FakeCimServer server;
    const ProgramResult result = setup.run({"/QVE"}, server);
    EXPECT_EQ(result.exitStatus, 0);
    EXPECT_EQ(result.out, setup.start());
}

TEST_F(CommandLineTest, NeedsNoResourceProperties) {
    setup.configure("sennet.resources=" + setup.path("nowhere"));
    const FakeCimServer server;
    EXPECT_EQ(setup.run({"/CA"}, server).exitStatus, 0);
}

}  // namespace
