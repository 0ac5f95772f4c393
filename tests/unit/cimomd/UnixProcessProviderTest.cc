#include "providers/software/UnixProcessProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "WatchedSystemCalls.h"

namespace cimomd {
namespace {

using namespace std::string_view_literals;

class UnixProcessProviderTest : public testing::Test {
  protected:
    UnixProcessProviderTest() {
        tree.file("proc/sys/kernel/hostname", "node7\n")
            .file("proc/stat", "btime 1699990000\n")
            .file("etc/os-release", "NAME=\"Debian GNU/Linux\"\n")
            .file("etc/passwd", "anna:x:1000:1000::/home/anna:/bin/sh\n");
    }

    void process(const std::string& id, const std::string& status) {
        tree.file("proc/" + id + "/stat", id + " " + status);
    }

    RecordedTree tree;
    FixedSystemCalls calls;
    const UnixProcessProvider provider{tree.paths(), calls};
};

// One that hangs while it changes its memory held the whole list up.
TEST_F(UnixProcessProviderTest, listsProcessesWhoseCommandLineIsKeptBack) {
    WatchedSystemCalls watched;
    watched.silent = tree.root / "proc/101/cmdline";
    for (int id = 1; id <= 150; ++id) {
        process(std::to_string(id), "(p) S 1 1 1 0 -1 0 0 0 0 0 0 0 0 0 20 0 1 0 0 0");
        tree.file("proc/" + std::to_string(id) + "/cmdline", "p" + std::to_string(id));
    }
    const auto instances = all(UnixProcessProvider(tree.paths(), watched).enumerate());
    ASSERT_EQ(instances.size(), 150U);
    for (std::size_t i = 0; i < instances.size(); ++i) {
        const std::string id = std::to_string(i + 1);
        EXPECT_EQ(textOf(instances[i], "Handle"), id);
        EXPECT_EQ(textOf(instances[i], "Parameters"), id == "101" ? "null" : "p" + id + " ");
    }
    EXPECT_EQ(watched.sources, std::set{TextSource::Processes});
}

TEST_F(UnixProcessProviderTest, publishesAnOrdinaryProcess) {
    // 34817 is terminal 136:1; it was started 100 seconds after the machine.
    process("4711",
            "(tmux: server) S 1 4711 4700 34817 -1 0 0 0 0 0 250 150 0 0 20 10 1 0 10050 0");
    tree.file("proc/4711/status",
              "Name:\ttmux\nUid:\t1000\t1000\t1000\t1000\nVmRSS:\t 6291456 kB\n")
        .file("proc/4711/cmdline", "tmux\0new\0-s\0main work\0"sv);
    std::filesystem::create_symlink("/usr/bin/tmux", tree.root / "proc/4711/exe");
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 1U);
    const auto& tmux = instances[0];
    EXPECT_EQ(textOf(tmux, "Handle"), "4711");
    EXPECT_EQ(textOf(tmux, "Name"), "tmux: server");
    EXPECT_EQ(textOf(tmux, "Caption"), "tmux: server");
    EXPECT_EQ(textOf(tmux, "CSName"), "node7");
    EXPECT_EQ(textOf(tmux, "CSCreationClassName"), "Velmira_ComputerSystem");
    EXPECT_EQ(textOf(tmux, "OSName"), "Debian GNU/Linux");
    EXPECT_EQ(textOf(tmux, "OSCreationClassName"), "Velmira_OperatingSystem");
    EXPECT_EQ(textOf(tmux, "CreationClassName"), "Velmira_UnixProcess");
    EXPECT_EQ(textOf(tmux, "ParentProcessID"), "1");
    EXPECT_EQ(textOf(tmux, "ProcessGroupID"), "4711");
    EXPECT_EQ(textOf(tmux, "ProcessSessionID"), "4700");
    EXPECT_EQ(textOf(tmux, "ProcessTTY"), "pts/1");
    EXPECT_EQ(textOf(tmux, "RealUserID"), "1000");
    EXPECT_EQ(textOf(tmux, "UserName"), "anna");
    EXPECT_EQ(textOf(tmux, "ExecutionState"), "4");
    EXPECT_EQ(textOf(tmux, "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(tmux, "EnabledState"), "5");
    EXPECT_EQ(textOf(tmux, "Priority"), "20");
    EXPECT_EQ(textOf(tmux, "ProcessNiceValue"), "10");
    EXPECT_EQ(textOf(tmux, "Nice"), "10");
    // 1699990100 is 14 November 2023, 19:28:20 UTC.
    EXPECT_EQ(textOf(tmux, "CreationDate"), "20231114202820.000000+060");
    EXPECT_EQ(textOf(tmux, "UserModeTime"), "2500");
    EXPECT_EQ(textOf(tmux, "KernelModeTime"), "1500");
    // Two and a half and one and a half.
    EXPECT_EQ(textOf(tmux, "ProcessorSeconds"), "4");
    EXPECT_EQ(textOf(tmux, "WorkingSetSize"), "6442450944");
    EXPECT_EQ(textOf(tmux, "WorkingSetSizeKB"), "6291456");
    EXPECT_EQ(textOf(tmux, "ModulePath"), "/usr/bin/tmux");
    EXPECT_EQ(textOf(tmux, "Parameters"), "tmux new -s main work ");
    expectServesItsClass(provider);
}

TEST_F(UnixProcessProviderTest, leavesOutWhatDoesNotFit) {
    // A real-time priority is below 0, and so is a nice value that takes instead of giving way.
    process("9", "(rt) R 0 -1 -1 0 -1 0 0 0 0 0 18446744073709551615 300 0 0 -100 -20 1 0 1 0");
    tree.file("proc/9/status", "Uid:\t4242\nVmRSS:\t18446744073709551615 kB\n")
        .file("proc/9/cmdline", "");
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 1U);
    for (const char* property : {"Priority", "ProcessNiceValue", "UserModeTime", "ProcessorSeconds",
                                 "WorkingSetSize", "WorkingSetSizeKB", "ProcessGroupID",
                                 "ProcessSessionID", "ProcessTTY", "ModulePath", "UserName"})
        EXPECT_EQ(textOf(instances[0], property), "null") << property;
    EXPECT_EQ(textOf(instances[0], "Nice"), "-20");
    EXPECT_EQ(textOf(instances[0], "RealUserID"), "4242");
    EXPECT_EQ(textOf(instances[0], "Parameters"), "");
    EXPECT_EQ(textOf(instances[0], "ExecutionState"), "3");
}

TEST_F(UnixProcessProviderTest, translatesStates) {
    struct Case {
        const char* state;
        const char* execution;
        const char* operational;
    };
    const std::vector<Case> cases{{"R", "3", "2 "},  {"S", "4", "2 "},  {"D", "4", "2 "},
                                  {"I", "4", "2 "},  {"T", "8", "10 "}, {"t", "8", "10 "},
                                  {"Z", "7", "17 "}, {"X", "0", "0 "}};
    for (std::size_t i = 0; i < cases.size(); ++i)
        process(std::to_string(i + 1), std::string("(p) ") + cases[i].state +
                                           " 1 1 1 0 -1 0 0 0 0 0 0 0 0 0 20 0 1 0 0 0");
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), cases.size());
    for (std::size_t i = 0; i < cases.size(); ++i) {
        EXPECT_EQ(textOf(instances[i], "ExecutionState"), cases[i].execution) << cases[i].state;
        EXPECT_EQ(textOf(instances[i], "OperationalStatus"), cases[i].operational)
            << cases[i].state;
    }
}

TEST_F(UnixProcessProviderTest, namesTerminals) {
    struct Case {
        int device;
        const char* name;
    };
    // Major 4 has consoles 0 to 63, then serial lines; 5:1 is no terminal of a session.
    const std::vector<Case> cases{{0x401, "tty1"},     {0x440, "ttyS0"},      {0x8800, "pts/0"},
                                  {0x8900, "pts/256"}, {0x108800, "pts/256"}, {0x501, "null"}};
    for (std::size_t i = 0; i < cases.size(); ++i)
        process(std::to_string(i + 1), "(p) S 1 1 1 " + std::to_string(cases[i].device) +
                                           " -1 0 0 0 0 0 0 0 0 0 20 0 1 0 0 0");
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), cases.size());
    for (std::size_t i = 0; i < cases.size(); ++i)
        EXPECT_EQ(textOf(instances[i], "ProcessTTY"), cases[i].name) << cases[i].device;
}

TEST_F(UnixProcessProviderTest, skipsProcessesThatEndMeanwhile) {
    for (const char* id : {"1", "2", "10"})
        process(id, "(p) S 1 1 1 0 -1 0 0 0 0 0 0 0 0 0 20 0 1 0 0 0");
    const auto stream = provider.enumerate();
    std::filesystem::remove_all(tree.root / "proc/2");
    ProvidedInstance provided;
    ASSERT_TRUE(stream->next(provided));
    EXPECT_EQ(textOf(provided.instance, "Handle"), "1");
    ASSERT_TRUE(stream->next(provided));
    EXPECT_EQ(textOf(provided.instance, "Handle"), "10");
    EXPECT_FALSE(stream->next(provided));
}

TEST_F(UnixProcessProviderTest, hasNoDatesWithoutAStartOfTheMachine) {
    tree.file("proc/stat", "btime 9223372036854775807\n");
    process("1", "(p) S 1 1 1 0 -1 0 0 0 0 0 0 0 0 0 20 0 1 0 18446744073709551615 0");
    EXPECT_EQ(textOf(all(provider.enumerate()).at(0), "CreationDate"), "null");
    tree.file("proc/stat", "");
    EXPECT_EQ(textOf(all(provider.enumerate()).at(0), "CreationDate"), "null");
}

TEST_F(UnixProcessProviderTest, saysWhyThereAreNoProcesses) {
    const RecordedTree empty;
    EXPECT_EQ(UnixProcessProvider(empty.paths(), calls).enumerate()->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
