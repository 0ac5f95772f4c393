// The program itself: its command line and its exit statuses, with the object manager of this
// project on a recorded machine.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

#include "support/Files.h"
#include "support/RunProgram.h"
#include "support/TempDirectory.h"

namespace {

using support::ProgramResult;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class ProgramTest : public testing::Test {
  protected:
    /// The object manager starts as the program's child, on the recorded laptop.
    ProgramResult run(const std::vector<std::string>& arguments) const {
        return support::runProgram(TEST_BIN_DIR "/sennetctl", arguments,
                                   {{"CIM_COMMAND", command}});
    }

    ProgramResult runWithoutServer(const std::vector<std::string>& arguments) const {
        return support::runProgram(TEST_BIN_DIR "/sennetctl", arguments,
                                   {{"CIM_LOCAL_SOCKET", directory.path("none")}});
    }

    support::TempDirectory directory;

    std::string makeCommand() const {
        const std::string path = directory.write(
            "cimomd-on-laptop", "#!/bin/sh\nexec " TEST_BIN_DIR "/cimomd --root " TEST_SOURCE_DIR
                                "/machines/laptop \"$@\"\n");
        std::filesystem::permissions(path, std::filesystem::perms::owner_all);
        return path;
    }

    std::string command = makeCommand();
};

TEST_F(ProgramTest, HelpHasExamplesOnEveryLevel) {
    for (const std::vector<std::string>& arguments :
         std::vector<std::vector<std::string>>{{"--help"},
                                               {"server", "--help"},
                                               {"get", "--help"},
                                               {"check", "--help"},
                                               {"new", "--help"},
                                               {"mif", "--help"},
                                               {"mif", "check", "--help"},
                                               {"mif", "show", "--help"},
                                               {"mif", "json", "--help"},
                                               {"mif", "diff", "--help"},
                                               {"mif", "html", "--help"}}) {
        const ProgramResult result = runWithoutServer(arguments);
        EXPECT_EQ(result.exitStatus, 0);
        EXPECT_THAT(result.out, HasSubstr("Examples:\n  sennetctl "));
        EXPECT_THAT(result.err, IsEmpty());
    }
}

TEST_F(ProgramTest, AWrongCommandLineCannotRun) {
    EXPECT_EQ(runWithoutServer({}).exitStatus, 2);
    EXPECT_EQ(runWithoutServer({"nothing"}).exitStatus, 2);
    EXPECT_EQ(runWithoutServer({"get"}).exitStatus, 2);
    EXPECT_EQ(runWithoutServer({"server", "--wrong"}).exitStatus, 2);
}

TEST_F(ProgramTest, AWrongCommandIsNamed) {
    EXPECT_EQ(runWithoutServer({"chek"}).err,
              "sennetctl: 'chek' is no command: expected check, server, get, mif or new\n"
              "Run with --help for more information.\n");
    EXPECT_THAT(runWithoutServer({"mif", "shwo", "a.mif"}).err,
                HasSubstr("'shwo' is no command: expected check, show, json, diff or html\n"));
    EXPECT_THAT(runWithoutServer({"--json", "chek"}).err, HasSubstr("'chek' is no command"));
    EXPECT_THAT(runWithoutServer({}).err, HasSubstr("a command is missing: expected check, "));
    EXPECT_THAT(runWithoutServer({"--wrong"}).err, HasSubstr("'--wrong' is no option here: "));
}

TEST_F(ProgramTest, HelpNamesEachArgumentOnce) {
    EXPECT_THAT(runWithoutServer({"check", "--help"}).out, HasSubstr("\n  SCRIPT ...  "));
    EXPECT_THAT(runWithoutServer({"get", "--help"}).out, HasSubstr("\n  CLASS  "));
    EXPECT_THAT(runWithoutServer({"mif", "diff", "--help"}).out, HasSubstr("\n  OLD  "));
}

TEST_F(ProgramTest, AServerThatEndsAtItsStartIsToldWithWhatToDo) {
    const ProgramResult result =
        support::runProgram(TEST_BIN_DIR "/sennetctl", {"server"}, {{"CIM_COMMAND", "/bin/false"}});
    EXPECT_EQ(result.exitStatus, 1);
    EXPECT_THAT(result.out, HasSubstr("\nNo useful answer: the CIM server: "));
    EXPECT_THAT(result.out, HasSubstr("\nThe server was started for this command; see what it says "
                                      "when you start it: /bin/false --socket ./trial.socket\n"));
}

TEST_F(ProgramTest, APlaceThatIsNamedIsToldToBeTheOnlyOne) {
    EXPECT_THAT(runWithoutServer({"server"}).out,
                HasSubstr("The only place that is tried, which CIM_LOCAL_SOCKET names:\n"));
}

TEST_F(ProgramTest, ASizeThatTheProfileHasNotIsRefused) {
    for (const std::string profile : {"dmi", "ca", "landesk"}) {
        const ProgramResult result = runWithoutServer(
            {"mif", "check", "--profile", profile, "--max-kb", "1", directory.path("none")});
        EXPECT_EQ(result.exitStatus, 2);
        EXPECT_THAT(result.err, HasSubstr("--max-kb: only --profile sms has a largest size\n"));
    }
    const std::string large = directory.write("large.mif", std::string(1025, ' '));
    const ProgramResult result =
        runWithoutServer({"mif", "check", "--max-kb", "1", "--profile", "sms", large});
    EXPECT_THAT(result.out, HasSubstr("file of 2 KB: the site takes 1\n"));
}

TEST_F(ProgramTest, JsonSaysThatACommandCouldNotRun) {
    const std::string none = directory.path("none");
    EXPECT_EQ(runWithoutServer({"mif", "json", none}).out,
              "{\n  \"error\": {\n    \"file\": \"" + none +
                  "\",\n    \"message\": \"there is no such file\"\n  }\n}\n");
    const std::string broken = directory.write("broken.mif", "Start Component\nName = 7\n");
    const ProgramResult result = runWithoutServer({"mif", "diff", "--json", broken, broken});
    EXPECT_EQ(result.exitStatus, 2);
    EXPECT_THAT(result.out, HasSubstr("\"line\": 2,\n    \"column\": 8,\n    \"message\": "
                                      "\"expected a literal, found 7\""));
    EXPECT_EQ(result.err, "sennetctl: " + broken + ":2:8: expected a literal, found 7\n");
    EXPECT_THAT(runWithoutServer({"get", "CIM_Processor", "--json"}).out,
                HasSubstr("\"message\": \"Cannot connect to CIM server: "));
    EXPECT_THAT(runWithoutServer({"get", "--json"}).out,
                HasSubstr("\"message\": \"CLASS is required\""));
}

TEST_F(ProgramTest, OutputThatIsLostIsAFailure) {
    const std::string file = directory.write("x.script.inv", "[CIM]\n");
    const std::string check = "exec " TEST_BIN_DIR "/sennetctl check --offline " + file;
    const ProgramResult closed = support::runProgram("/bin/sh", {"-c", check + " >&-"}, {});
    EXPECT_EQ(closed.exitStatus, 2);
    EXPECT_EQ(closed.err, "sennetctl: standard output is closed\n");
    for (const std::string& command : {check, std::string(TEST_BIN_DIR "/sennetctl --help"),
                                       std::string(TEST_BIN_DIR "/sennetctl mif json none"),
                                       std::string(TEST_BIN_DIR "/sennetctl server --timeout 1")}) {
        const ProgramResult full =
            support::runProgram("/bin/sh", {"-c", command + " >/dev/full"},
                                {{"CIM_LOCAL_SOCKET", directory.path("none")}});
        EXPECT_EQ(full.exitStatus, 2) << command;
        EXPECT_THAT(full.err, HasSubstr("sennetctl: standard output: No space left on device\n"));
    }
}

TEST_F(ProgramTest, GetCannotRunWithoutAServer) {
    const ProgramResult result = runWithoutServer({"get", "CIM_Processor"});
    EXPECT_EQ(result.exitStatus, 2);
    EXPECT_THAT(result.err, HasSubstr("sennetctl: Cannot connect to CIM server: "));
    EXPECT_THAT(result.out, IsEmpty());
}

TEST_F(ProgramTest, ServerFindsNone) {
    const ProgramResult result = runWithoutServer({"server"});
    EXPECT_EQ(result.exitStatus, 1);
    EXPECT_THAT(result.out, HasSubstr(directory.path("none")));
}

TEST_F(ProgramTest, ChecksMifFilesByTheirProfile) {
    const std::string file = directory.write(
        "f.mif",
        "Start Component Name = \"a\" Start Group Name = \"b\" Class = \"c|b|1\" Id = 1\n"
        "Start Attribute Name = \"d\" Id = 1 Type = String(3) Value = 7 End Attribute\n"
        "End Group End Component");
    const ProgramResult strict = runWithoutServer({"mif", "check", file});
    EXPECT_EQ(strict.exitStatus, 1);
    EXPECT_THAT(strict.out, HasSubstr(file + ":2:60: error: integer where the type is a string\n"));
    const ProgramResult tolerant =
        runWithoutServer({"mif", "check", "--profile", "ca", "--json", file});
    EXPECT_THAT(tolerant.out, HasSubstr("no group of the class DMTF|ComponentID|001"));
    EXPECT_THAT(tolerant.out, HasSubstr("\"errors\": 0"));
    EXPECT_EQ(runWithoutServer({"mif", "check", "--profile", "other", file}).exitStatus, 2);
    EXPECT_EQ(runWithoutServer({"mif", "check", directory.path("none")}).exitStatus, 2);
    EXPECT_EQ(runWithoutServer({"mif", "diff", file, file}).exitStatus, 0);
    EXPECT_THAT(runWithoutServer({"mif", "json", file}).out, HasSubstr("\"component\": \"a\""));
    EXPECT_THAT(runWithoutServer({"mif", "show", file}).out, HasSubstr("Component a\n"));
}

TEST_F(ProgramTest, WritesAPageOfMifFiles) {
    const std::string file = directory.write(
        "f.mif",
        "Start Component Name = \"a\" Start Group Name = \"b\" Class = \"c|b|1\" Id = 1\n"
        "Start Attribute Name = \"d\" Id = 1 Type = Integer Value = 7 End Attribute\n"
        "End Group End Component");
    const std::string page = directory.path("page/inventory.html");
    const std::vector<std::string> arguments = {"mif", "html", file, "-o", directory.path("page")};
    const ProgramResult first = runWithoutServer(arguments);
    EXPECT_EQ(first.exitStatus, 0) << first.err;
    EXPECT_EQ(first.out, "Written: " + page + ", 1 table from 1 file with 1 row\n");
    const ProgramResult second = runWithoutServer(arguments);
    EXPECT_EQ(second.exitStatus, 2);
    EXPECT_EQ(second.err, "sennetctl: " + page + ": exists already\n");
    std::vector<std::string> forced = arguments;
    forced.insert(forced.end(), {"--force", "--json", "--title", "Machine 7"});
    EXPECT_THAT(runWithoutServer(forced).out, HasSubstr("\"page\": \"" + page + "\""));
    EXPECT_THAT(support::readFile(page), HasSubstr("<h1>Machine 7</h1>"));
    EXPECT_EQ(runWithoutServer({"mif", "html", file}).exitStatus, 2) << "there is no directory";
}

TEST_F(ProgramTest, TheShippedScriptsAreClean) {
    const std::string configuration = directory.write(
        "velm.properties", "sennet.directory=" INVENTORY_DIR "\nsennet.resources=" INVENTORY_DIR
                           "/sennet.properties\n");
    const ProgramResult result = support::runProgram(
        TEST_BIN_DIR "/sennetctl", {"check", "--translations"},
        {{"CIM_COMMAND", command}, {"VELM_CONFIG", configuration}}, std::chrono::seconds(240));
    EXPECT_EQ(result.exitStatus, 0) << result.out;
    EXPECT_THAT(result.out, HasSubstr(" files: 0 errors, 0 warnings\n"));
    EXPECT_THAT(result.out, HasSubstr("note: Velmira_OperatingSystem: 1 instance\n"));
}

TEST_F(ProgramTest, GetShowsTheMachine) {
    const ProgramResult result =
        run({"get", "CIM_OperatingSystem", "-p", "OSType,CSCreationClassName"});
    EXPECT_EQ(result.exitStatus, 0) << result.err;
    EXPECT_THAT(result.out, HasSubstr("OSType"));
    EXPECT_THAT(result.out, HasSubstr("1 instance\n"));
    EXPECT_EQ(result.out.find('\x1B'), std::string::npos) << "colour into a pipe";
}

TEST_F(ProgramTest, MessagesStandBehindTheTableThatTheyAreAbout) {
    const ProgramResult result = support::runProgram(
        "/bin/sh",
        {"-c", TEST_BIN_DIR "/sennetctl get CIM_OperatingSystem -p OSType,Nickname 2>&1"},
        {{"CIM_COMMAND", command}});
    EXPECT_EQ(result.exitStatus, 1);
    EXPECT_THAT(result.out,
                HasSubstr("1 instance\nsennetctl: CIM_OperatingSystem declares no property "
                          "Nickname\n"));
}

TEST_F(ProgramTest, ServerTellsTheStartedOne) {
    const ProgramResult result = run({"server"});
    EXPECT_EQ(result.exitStatus, 0) << result.err;
    EXPECT_THAT(result.out, HasSubstr("\n*  " + directory.path("cimomd-on-laptop")));
    EXPECT_THAT(result.out, HasSubstr("\nroot/cimv2  "));
}

}  // namespace
