// Files that answer, that cannot be read, and that never answer.

#include "system/FileReadGuard.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <string_view>
#include <thread>

#include "RecordedTree.h"
#include "SilentFileSystem.h"

namespace cimomd {
namespace {

using std::chrono::milliseconds;
using Clock = std::chrono::steady_clock;
using Paths = std::vector<std::filesystem::path>;

constexpr SilenceLimits kShort{milliseconds(100), milliseconds(60000), 3};

/// A path that ends in "dead" hangs, one in "end" ends the child; the others hold their path.
FileStatus scriptedRead(const char* path, char* buffer, std::size_t capacity, std::size_t& length) {
    const std::string_view text(path);
    while (text.substr(text.rfind('/') + 1) == "dead")
        ::pause();
    if (text.substr(text.rfind('/') + 1) == "end")
        ::_exit(0);
    length = text.copy(buffer, capacity);
    return FileStatus::Read;
}

std::vector<std::string> told(const std::vector<Fact<std::string>>& texts) {
    std::vector<std::string> out;
    for (const auto& text : texts) {
        if (text)
            out.push_back(*text);
        else
            out.push_back(text.reason() == Absence::TimedOut ? "timed out" : "not told");
    }
    return out;
}

using Texts = std::vector<std::string>;

TEST(FileReadGuard, readsFilesInTheirOrder) {
    RecordedTree tree;
    tree.file("a", "one\n").file("b", "").file("c", std::string(100000, 'x')).directory("d");
    FileReadGuard guard;
    const auto texts = guard.read({tree.root / "c", tree.root / "a", tree.root / "b",
                                   tree.root / "d", tree.root / "none", tree.root / "a"});
    ASSERT_EQ(texts.size(), 6U);
    EXPECT_EQ(texts[0], std::string(32768, 'x'));
    EXPECT_EQ(texts[1], "one\n");
    EXPECT_EQ(texts[2], "");
    EXPECT_FALSE(texts[3].has_value());
    EXPECT_EQ(texts[3].reason(), Absence::Unreadable);
    EXPECT_FALSE(texts[4].has_value());
    EXPECT_EQ(texts[4].reason(), Absence::Absent);
    EXPECT_EQ(texts[5], "one\n");
    EXPECT_TRUE(guard.read({}).empty());
}

TEST(FileReadGuard, readsMoreFilesThanAPipeHolds) {
    RecordedTree tree;
    tree.file("a", std::string(30000, 'a'));
    FileReadGuard guard;
    const auto texts = guard.read(Paths(200, tree.root / "a"));
    ASSERT_EQ(texts.size(), 200U);
    for (const auto& text : texts)
        EXPECT_EQ(text, std::string(30000, 'a'));
}

TEST(FileReadGuard, leavesOutTheDirectoryOfAFileThatNeverAnswers) {
    FileReadGuard guard(scriptedRead, kShort);
    const auto start = Clock::now();
    EXPECT_EQ(told(guard.read({"/one/a", "/two/a", "/two/dead", "/two/b", "/three/a"})),
              (Texts{"/one/a", "/two/a", "timed out", "timed out", "/three/a"}));
    EXPECT_GE(Clock::now() - start, milliseconds(100));
    EXPECT_LT(Clock::now() - start, milliseconds(1900));
    const auto again = Clock::now();
    EXPECT_EQ(told(guard.read({"/two/a", "/one/a"})), (Texts{"timed out", "/one/a"}));
    EXPECT_LT(Clock::now() - again, milliseconds(100));
    // Neither child is left.
    EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
    EXPECT_EQ(errno, ECHILD);
}

TEST(FileReadGuard, asksAgainAfterAWhile) {
    FileReadGuard guard(scriptedRead, {milliseconds(50), milliseconds(200), 3});
    EXPECT_EQ(told(guard.read({"/one/dead"})), Texts{"timed out"});
    EXPECT_EQ(told(guard.read({"/one/a"})), Texts{"timed out"});
    std::this_thread::sleep_for(milliseconds(250));
    EXPECT_EQ(told(guard.read({"/one/a"})), Texts{"/one/a"});
}

TEST(FileReadGuard, asksNobodyWhileTooManyAreSilent) {
    FileReadGuard guard(scriptedRead, kShort);
    EXPECT_EQ(told(guard.read({"/1/dead", "/2/dead", "/3/dead", "/4/dead", "/5/a"})),
              (Texts{"timed out", "timed out", "timed out", "timed out", "timed out"}));
    const auto start = Clock::now();
    EXPECT_EQ(told(guard.read({"/6/a", "/7/dead"})), (Texts{"timed out", "timed out"}));
    EXPECT_LT(Clock::now() - start, milliseconds(100));
}

TEST(FileReadGuard, survivesTheEndOfTheChild) {
    FileReadGuard guard(scriptedRead, kShort);
    EXPECT_EQ(told(guard.read({"/1/a", "/1/end", "/1/b"})),
              (Texts{"/1/a", "not told", "not told"}));
    EXPECT_EQ(told(guard.read({"/1/b"})), Texts{"/1/b"});
}

TEST(FileReadGuard, survivesAFileSystemWhoseProgramHangs) {
    RecordedTree tree;
    tree.file("a", "one");
    FileReadGuard guard(readFileStart, kShort);
    {
        const SilentFileSystem silent;
        if (!silent.obstacle().empty())
            GTEST_SKIP() << "no FUSE file system can be mounted here: " << silent.obstacle();
        const auto start = Clock::now();
        EXPECT_EQ(told(guard.read({silent.mountPoint() + "/file", tree.root / "a"})),
                  (Texts{"timed out", "one"}));
        EXPECT_LT(Clock::now() - start, milliseconds(1900));
    }
    // Now the child goes that could not be killed.
    EXPECT_GT(::waitpid(-1, nullptr, 0), 0);
}

}  // namespace
}  // namespace cimomd
