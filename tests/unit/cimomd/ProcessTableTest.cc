#include "system/software/ProcessTable.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

const std::string kNumbers =
    " S 1 412 411 34816 412 4194304 10 20 30 40 111 222 5 6 20 -5 3 0 9876";

TEST(ProcessTable, readsAStatusLine) {
    const auto status = parseProcessStatus("412 (bash)" + kNumbers + " 1000 200\n");
    ASSERT_TRUE(status);
    EXPECT_EQ(status->name, "bash");
    EXPECT_EQ(status->state, 'S');
    EXPECT_EQ(status->parentId, 1);
    EXPECT_EQ(status->groupId, 412);
    EXPECT_EQ(status->sessionId, 411);
    EXPECT_EQ(status->terminal, 34816);
    EXPECT_EQ(status->userTicks, 111U);
    EXPECT_EQ(status->kernelTicks, 222U);
    EXPECT_EQ(status->priority, 20);
    EXPECT_EQ(status->nice, -5);
    EXPECT_EQ(status->startTicks, 9876U);
}

TEST(ProcessTable, takesAnyName) {
    EXPECT_EQ(parseProcessStatus("5 (a) b (c)" + kNumbers)->name, "a) b (c");
    EXPECT_EQ(parseProcessStatus("5 (tmux: server)" + kNumbers)->name, "tmux: server");
    EXPECT_EQ(parseProcessStatus("5 ()" + kNumbers)->name, "");
    EXPECT_EQ(parseProcessStatus("5 (a\n) R 1)" + kNumbers)->name, "a\n) R 1");
}

TEST(ProcessTable, refusesWhatIsNoStatusLine) {
    for (const std::string text : {"", "5", "5 (bash", "5 )bash(", "5 (bash)", "5 (bash) S 1 2 3"})
        EXPECT_FALSE(parseProcessStatus(text)) << text;
    std::string text = "5 (bash)" + kNumbers;
    EXPECT_FALSE(parseProcessStatus(text.substr(0, text.rfind(' '))));
    EXPECT_FALSE(parseProcessStatus(text + "x"));
    EXPECT_FALSE(parseProcessStatus(text + "99999999999999999999"));
    text.replace(text.find(" 1 "), 3, " parent ");
    EXPECT_FALSE(parseProcessStatus(text));
}

TEST(ProcessTable, readsOwnerAndMemory) {
    const auto ownership =
        parseProcessOwnership("Name:\tbash\nUid:\t1000\t0\t0\t0\nVmRSS:\t    5120 kB\n");
    EXPECT_EQ(ownership.realUserId, 1000U);
    EXPECT_EQ(ownership.residentKB, 5120U);
    const auto odd = parseProcessOwnership("Uid:\nUid:\tnobody\nVmRSS:\t-1 kB\n");
    EXPECT_EQ(odd.realUserId, std::nullopt);
    EXPECT_EQ(odd.residentKB, std::nullopt);
    EXPECT_EQ(parseProcessOwnership("").residentKB.reason(), Absence::Absent);
}

using Words = std::vector<std::string>;

TEST(ProcessTable, takesCommandLinesApart) {
    using namespace std::string_view_literals;
    EXPECT_EQ(parseCommandLine("sh\0-c\0echo a b\0"sv), (Words{"sh", "-c", "echo a b"}));
    EXPECT_EQ(parseCommandLine("printf\0\0x\0"sv), (Words{"printf", "", "x"}));
    EXPECT_EQ(parseCommandLine("nginx: master process\0\0\0\0"sv),
              (Words{"nginx: master process"}));
    EXPECT_EQ(parseCommandLine("unfinished"), (Words{"unfinished"}));
    EXPECT_EQ(parseCommandLine(""), Words{});
    EXPECT_EQ(parseCommandLine("\0\0\0"sv), Words{});
}

TEST(ProcessTable, takesTheFirstWordsOfALongCommandLine) {
    std::string manyWords;
    for (int i = 0; i < 300; ++i)
        manyWords += std::string("w") + '\0';
    EXPECT_EQ(parseCommandLine(manyWords), Words(256, "w"));
    EXPECT_EQ(parseCommandLine(std::string(16384, '\0') + "x"), Words(256, ""));
}

TEST(ProcessTable, takesTheFirstCharactersOfALongCommandLine) {
    using namespace std::string_literals;
    const std::string path(3000, 'p');
    EXPECT_EQ(parseCommandLine(path + "\0"s + path + "\0x"s),
              (Words{path, std::string(1095, 'p')}));
    EXPECT_EQ(parseCommandLine(path + "\0"s + std::string(1095, 'p') + "\0"s),
              (Words{path, std::string(1095, 'p')}));
    const std::string whole(4095, 'p');
    EXPECT_EQ(parseCommandLine(whole + "\0xy"s), Words{whole});
    EXPECT_EQ(parseCommandLine(whole + "\u20ac\u20ac"), Words{whole + "\u20ac"});
    EXPECT_EQ(parseCommandLine(whole + "\U0001f427"), Words{whole});
}

TEST(ProcessTable, listsProcessesInTheOrderOfTheirNumbers) {
    RecordedTree tree;
    for (const char* name : {"10", "9", "100", "self", "1x", "01", "+2", "99999999999999999999"})
        tree.directory(std::string("proc/") + name);
    EXPECT_EQ(listProcesses(tree.root / "proc").value(), (std::vector<std::uint64_t>{9, 10, 100}));
    EXPECT_EQ(listProcesses(tree.root / "none").reason(), Absence::Absent);
}

TEST(ProcessTable, readsAProcess) {
    RecordedTree tree;
    tree.file("7/stat", "7 (bash)" + kNumbers);
    std::filesystem::create_symlink("/usr/bin/bash", tree.root / "7/exe");
    const auto process = readProcess(tree.root, 7, std::string("bash\0-l\0", 8));
    ASSERT_TRUE(process);
    EXPECT_EQ(process->status.name, "bash");
    EXPECT_EQ(process->executable, "/usr/bin/bash");
    EXPECT_EQ(*process->commandLine, (Words{"bash", "-l"}));
    EXPECT_EQ(readProcess(tree.root, 7, Absence::TimedOut)->commandLine.reason(),
              Absence::TimedOut);
    EXPECT_EQ(commandLineFile(tree.root, 7), tree.root / "7/cmdline");
    EXPECT_EQ(process->ownership.realUserId, std::nullopt);
    EXPECT_FALSE(readProcess(tree.root, 8, Absence::Absent));
    tree.file("9/stat", "9 (bash) Z");
    EXPECT_FALSE(readProcess(tree.root, 9, Absence::Absent));
}

}  // namespace
}  // namespace cimomd
