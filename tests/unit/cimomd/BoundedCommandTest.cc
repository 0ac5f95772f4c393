#include "system/BoundedCommand.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>

#include "RecordedTree.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

const std::filesystem::path kShell = "/bin/sh";

Fact<std::string> shell(const std::string& script, const CommandLimits& limits = {}) {
    return outputOf(kShell, {"-c", script}, limits);
}

TEST(BoundedCommand, givesTheOutput) {
    EXPECT_EQ(outputOf("/bin/echo", {"two words", "*", "$HOME"}), "two words * $HOME\n");
    EXPECT_EQ(shell(""), "");
    EXPECT_EQ(shell("head -c 300000 /dev/zero").value().size(), 300000U);
}

TEST(BoundedCommand, givesTheProgramNothingOfThisProcess) {
    const int kept = ::open("/dev/null", O_RDONLY);
    ASSERT_GE(kept, 3);
    ASSERT_EQ(::setenv("CIMOMD_TEST_SECRET", "visible", 1), 0);
    EXPECT_EQ(shell("echo \"$CIMOMD_TEST_SECRET$LC_ALL\""), "C\n");
    EXPECT_EQ(shell("cat; echo end"), "end\n");
    // The list itself is read through a descriptor of its own, 3.
    EXPECT_EQ(outputOf("/bin/ls", {"/proc/self/fd"}), "0\n1\n2\n3\n");
    ::unsetenv("CIMOMD_TEST_SECRET");
    ::close(kept);
}

TEST(BoundedCommand, restoresSignalsThatThisProcessIgnores) {
    const auto before = std::signal(SIGTERM, SIG_IGN);
    EXPECT_EQ(shell("kill -TERM $$; echo survived").reason(), Absence::Unreadable);
    std::signal(SIGTERM, before);
}

TEST(BoundedCommand, saysWhyThereIsNothing) {
    RecordedTree tree;
    tree.file("notExecutable", "#!/bin/sh\n").file("noProgram", "\x7f text");
    std::filesystem::permissions(tree.root / "noProgram", std::filesystem::perms::owner_all);
    EXPECT_EQ(outputOf(tree.root / "none", {}).reason(), Absence::Absent);
    EXPECT_EQ(outputOf(tree.root / "notExecutable", {}).reason(), Absence::NeedsRoot);
    EXPECT_EQ(outputOf(tree.root / "noProgram", {}).reason(), Absence::Unreadable);
    EXPECT_EQ(shell("echo half; exit 3").reason(), Absence::Unreadable);
    EXPECT_EQ(shell("kill -SEGV $$").reason(), Absence::Unreadable);
    EXPECT_THROW(outputOf("sh", {}), std::logic_error);
}

TEST(BoundedCommand, endsAProgramThatWritesTooMuch) {
    CommandLimits limits;
    limits.maxOutputBytes = 4;
    EXPECT_EQ(shell("printf 1234", limits), "1234");
    EXPECT_EQ(shell("printf 12345", limits).reason(), Absence::Unreadable);
    EXPECT_EQ(outputOf("/usr/bin/yes", {}, limits).reason(), Absence::Unreadable);
}

bool isRunning(const std::string& id) {
    const auto status = readText("/proc/" + id + "/stat");
    return status && status->find(") Z") == std::string::npos;
}

TEST(BoundedCommand, endsAProgramThatDoesNotEnd) {
    RecordedTree tree;
    CommandLimits limits;
    limits.deadline = std::chrono::milliseconds(300);
    const std::string idFile = (tree.root / "id").string();
    // The first keeps its output open, the second has closed it.
    for (const std::string& script : {"sleep 600 & echo $! > " + idFile + "; wait",
                                      "echo $$ > " + idFile + "; exec sleep 600 >&-"}) {
        EXPECT_EQ(shell(script, limits).reason(), Absence::TimedOut) << script;
        const std::string id = readFact(idFile).value();
        // A killed grandchild belongs to the system's first process, which collects it in its time.
        for (int i = 0; i < 500 && isRunning(id); ++i)
            ::usleep(10000);
        EXPECT_FALSE(isRunning(id)) << script;
    }
}

TEST(BoundedCommand, endsAProgramWhoseCallerIsKilled) {
    RecordedTree tree;
    const std::string idFile = (tree.root / "id").string();
    const pid_t caller = ::fork();
    if (caller == 0) {
        shell("echo $$ > " + idFile + ".new; mv " + idFile + ".new " + idFile + "; exec sleep 600");
        ::_exit(0);
    }
    for (int i = 0; i < 1000 && !std::filesystem::exists(idFile); ++i)
        ::usleep(10000);
    const std::string id = readFact(idFile).value();
    EXPECT_TRUE(isRunning(id));
    ::kill(caller, SIGKILL);
    ::waitpid(caller, nullptr, 0);
    for (int i = 0; i < 500 && isRunning(id); ++i)
        ::usleep(10000);
    EXPECT_FALSE(isRunning(id));
}

}  // namespace
}  // namespace cimomd
