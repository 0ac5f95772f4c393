// Each guard is tried in a child, whose exit status says what became of it.
#include "process/ProcessGuards.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <string>
#include <utility>

#include "support/TempDirectory.h"

namespace {

using testing::ExitedWithCode;

void setLimit(decltype(RLIMIT_AS) what, rlim_t bytes) {
    const rlimit limit{bytes, bytes};
    if (::setrlimit(what, &limit) != 0) {
        ::_exit(99);
    }
}

/// The number of the next file to be opened by a process that was started without these streams.
int nextDescriptorWithout(std::initializer_list<int> streams) {
    for (const int stream : streams) {
        ::close(stream);
    }
    return holdStandardStreams() ? ::open("/dev/null", O_RDONLY) : -1;
}

TEST(ProcessGuards, NoFileGetsTheNumberOfAStandardStream) {
    for (const auto streams :
         {std::initializer_list<int>{0}, {1}, {2}, {0, 1}, {0, 2}, {1, 2}, {0, 1, 2}, {}}) {
        EXPECT_EXIT(::_exit(nextDescriptorWithout(streams) > 2 ? 0 : 1), ExitedWithCode(0), "");
    }
}

TEST(ProcessGuards, WithoutThemAFileDoes) {
    EXPECT_EXIT(
        {
            ::close(1);
            ::_exit(::open("/dev/null", O_RDONLY));
        },
        ExitedWithCode(1), "");
}

TEST(ProcessGuards, AStreamThatIsThereIsLeftAlone) {
    const support::TempDirectory directory;
    const std::string path = directory.path("out");
    EXPECT_EXIT(
        {
            const int file = ::open(path.c_str(), O_WRONLY | O_CREAT, 0600);
            ::dup2(file, 1);
            ::close(0);
            holdStandardStreams();
            ::_exit(::write(1, "text", 4) == 4 ? 0 : 1);
        },
        ExitedWithCode(0), "");
    EXPECT_EQ(directory.read("out"), "text");
}

TEST(ProcessGuards, AFileBeyondTheLimitOfItsSizeIsAnErrorOfTheWrite) {
    const support::TempDirectory directory;
    const std::string path = directory.path("file");
    EXPECT_EXIT(
        {
            outliveFileSizeLimit();
            setLimit(RLIMIT_FSIZE, 1);
            const int file = ::open(path.c_str(), O_WRONLY | O_CREAT, 0600);
            const bool first = ::write(file, "ab", 2) == 1;
            const bool second = ::write(file, "b", 1) == -1 && errno == EFBIG;
            ::_exit(first && second ? 0 : 1);
        },
        ExitedWithCode(0), "");
}

TEST(ProcessGuards, OthersCannotWriteToNewFiles) {
    for (const auto& [before, after] : {std::pair{0, 02}, {022, 022}, {077, 077}, {07, 07}}) {
        EXPECT_EXIT(
            {
                ::umask(static_cast<mode_t>(before));
                keepOthersFromWriting();
                ::_exit(static_cast<int>(::umask(0)));
            },
            ExitedWithCode(after), "");
    }
}

TEST(ProcessGuards, LackOfMemoryEndsTheProcessWithAWord) {
#ifdef SENNET_TEST_SANITIZED
    GTEST_SKIP() << "the sanitizers have an allocator of their own";
#else
    constexpr rlim_t kLittleMemory = rlim_t{256} << 20;
    constexpr std::size_t kMuchMemory = std::size_t{1} << 30;
    EXPECT_EXIT(
        {
            endWhenMemoryIsShort("thrifty");
            setLimit(RLIMIT_AS, kLittleMemory);
            const std::string much(kMuchMemory, 'x');
            ::_exit(much.size() == kMuchMemory ? 0 : 2);
        },
        ExitedWithCode(1), "^thrifty: not enough memory\n$");
#endif
}

}  // namespace
