// File systems that answer, that fail, and that never answer.

#include "system/storage/FileSystemSizeGuard.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

#include "SilentFileSystem.h"

namespace cimomd {
namespace {

using std::chrono::milliseconds;
using Clock = std::chrono::steady_clock;

constexpr FileSystemSizeGuard::Limits kShort{milliseconds(100), milliseconds(60000), 3};

/// A path that begins with "/dead" hangs, "/end" ends the child, a number fails with it.
int scriptedSize(const char* mountPoint, FileSystemSize& size) {
    const std::string_view path(mountPoint);
    while (path.substr(0, 5) == "/dead")
        ::pause();
    if (path == "/end")
        ::_exit(0);
    if (path == "/forbidden")
        return EACCES;
    if (path == "/gone")
        return ENOENT;
    if (path == "/stale")
        return ESTALE;
    size = {4096, 100, 50, 20, 10};
    return 0;
}

/// How many of the descriptors 0 to 255 other than the one for the answer are open.
int countDescriptors(const char*, FileSystemSize& size) {
    for (int number = 0; number < 256; ++number) {
        struct stat status {};
        if (::fstat(number, &status) == 0)
            ++size.blocks;
    }
    return 0;
}

Absence reasonOf(const Fact<FileSystemSize>& size) {
    EXPECT_FALSE(size.has_value());
    return size.reason();
}

TEST(FileSystemSizeGuard, bringsTheAnswerOfTheChild) {
    FileSystemSizeGuard guard(scriptedSize);
    const auto size = guard.ask("0:40", "/srv");
    ASSERT_TRUE(size.has_value());
    EXPECT_EQ(*size, (FileSystemSize{4096, 100, 50, 20, 10}));
}

TEST(FileSystemSizeGuard, tellsWhyThereIsNoAnswer) {
    FileSystemSizeGuard guard(scriptedSize);
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/forbidden")), Absence::NeedsRoot);
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/gone")), Absence::Absent);
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/stale")), Absence::Unreadable);
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/end")), Absence::Unreadable);
    // None of these was silent: it is asked again.
    EXPECT_TRUE(guard.ask("0:40", "/srv").has_value());
}

TEST(FileSystemSizeGuard, givesUpAtTheDeadlineAndLeavesTheFileSystemAlone) {
    FileSystemSizeGuard guard(scriptedSize, kShort);
    const auto start = Clock::now();
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/dead")), Absence::TimedOut);
    const auto firstEnd = Clock::now();
    EXPECT_GE(firstEnd - start, milliseconds(100));
    EXPECT_LT(firstEnd - start, milliseconds(1900));
    for (int i = 0; i < 100; ++i)
        EXPECT_EQ(reasonOf(guard.ask("0:40", "/srv")), Absence::TimedOut);
    EXPECT_LT(Clock::now() - firstEnd, milliseconds(100));
    // Another file system is asked.
    EXPECT_TRUE(guard.ask("0:41", "/srv").has_value());
}

TEST(FileSystemSizeGuard, triesAgainAfterAWhile) {
    FileSystemSizeGuard guard(scriptedSize, {milliseconds(50), milliseconds(200), 3});
    EXPECT_EQ(reasonOf(guard.ask("0:40", "/dead")), Absence::TimedOut);
    EXPECT_FALSE(guard.ask("0:40", "/srv").has_value());
    std::this_thread::sleep_for(milliseconds(250));
    EXPECT_TRUE(guard.ask("0:40", "/srv").has_value());
}

TEST(FileSystemSizeGuard, asksNobodyWhileTooManyAreSilent) {
    FileSystemSizeGuard guard(scriptedSize, kShort);
    for (const char* device : {"0:1", "0:2", "0:3"})
        EXPECT_EQ(reasonOf(guard.ask(device, "/dead")), Absence::TimedOut);
    const auto start = Clock::now();
    EXPECT_EQ(reasonOf(guard.ask("0:4", "/dead")), Absence::TimedOut);
    EXPECT_EQ(reasonOf(guard.ask("0:5", "/srv")), Absence::TimedOut);
    EXPECT_LT(Clock::now() - start, milliseconds(100));
}

TEST(FileSystemSizeGuard, leavesNoChildBehindThatCanBeEnded) {
    FileSystemSizeGuard guard(scriptedSize, kShort);
    EXPECT_FALSE(guard.ask("0:40", "/dead").has_value());
    EXPECT_TRUE(guard.ask("0:41", "/srv").has_value());
    EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
    EXPECT_EQ(errno, ECHILD);
}

TEST(FileSystemSizeGuard, theChildKeepsNoDescriptor) {
    std::array<int, 2> inherited{};
    ASSERT_EQ(::pipe(inherited.data()), 0);
    FileSystemSizeGuard guard(countDescriptors);
    const auto size = guard.ask("0:40", "/");
    ASSERT_TRUE(size.has_value());
    EXPECT_EQ(size->blocks, 1U);
    ::close(inherited[0]);
    ::close(inherited[1]);
}

TEST(FileSystemSizeGuard, answersManyThreads) {
    FileSystemSizeGuard guard(scriptedSize, kShort);
    std::vector<std::thread> threads;
    std::array<bool, 8> answered{};
    for (std::size_t i = 0; i < answered.size(); ++i)
        threads.emplace_back([&guard, &answered, i] {
            answered[i] = guard.ask("0:" + std::to_string(i), "/srv").has_value();
        });
    for (std::thread& thread : threads)
        thread.join();
    for (const bool wasAnswered : answered)
        EXPECT_TRUE(wasAnswered);
}

TEST(FileSystemSizeGuard, readsTheSizeOfARealFileSystem) {
    FileSystemSize size;
    ASSERT_EQ(readFileSystemSize("/", size), 0);
    EXPECT_GT(size.fragmentBytes, 0U);
    EXPECT_GT(size.blocks, 0U);
    EXPECT_EQ(readFileSystemSize("/no/such/directory", size), ENOENT);
    FileSystemSizeGuard guard;
    const auto asked = guard.ask("0:1", "/");
    ASSERT_TRUE(asked.has_value());
    EXPECT_EQ(asked->fragmentBytes, size.fragmentBytes);
    EXPECT_EQ(asked->blocks, size.blocks);
}

// Root looked at what a user had mounted with sshfs and told of a size of 0: to all but its owner
// the kernel answers for such a file system, with nothing but zeros.
TEST(FileSystemSizeGuard, takesAnAnswerOfZerosForNone) {
    const SilentFileSystem ofAnother(12345);
    if (!ofAnother.obstacle().empty())
        GTEST_SKIP() << "no FUSE file system can be mounted here: " << ofAnother.obstacle();
    FileSystemSizeGuard guard;
    EXPECT_EQ(reasonOf(guard.ask("0:40", ofAnother.mountPoint())), Absence::Absent);
}

TEST(FileSystemSizeGuard, survivesAFileSystemWhoseProgramHangs) {
    const SilentFileSystem silent;
    if (!silent.obstacle().empty())
        GTEST_SKIP() << "no FUSE file system can be mounted here: " << silent.obstacle();
    FileSystemSizeGuard guard(readFileSystemSize, kShort);
    const auto start = Clock::now();
    EXPECT_EQ(reasonOf(guard.ask("0:40", silent.mountPoint())), Absence::TimedOut);
    EXPECT_GE(Clock::now() - start, milliseconds(100));
    EXPECT_LT(Clock::now() - start, milliseconds(1900));
    // The child that waits cannot be killed. It is there, and does not hold anything up.
    siginfo_t child{};
    EXPECT_EQ(::waitid(P_ALL, 0, &child, WEXITED | WNOHANG | WNOWAIT), 0);
    EXPECT_EQ(child.si_pid, 0);
    EXPECT_TRUE(guard.ask("0:41", "/").has_value());
}

}  // namespace
}  // namespace cimomd
