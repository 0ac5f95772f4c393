#include "report/WholeFile.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <cstdio>
#include <thread>

#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

std::string failureOf(const std::string& path, std::size_t limit = kLargestFileOctets) {
    try {
        readWholeFile(path, limit);
    } catch (const CannotRun& failure) {
        return failure.what();
    }
    return "none";
}

std::string writeFailureOf(const std::string& path, std::size_t octets = 1) {
    try {
        writeWholeFile(path, std::string(octets, 'x'));
    } catch (const CannotRun& failure) {
        return failure.what();
    }
    return "none";
}

TEST(WholeFileTest, ReadsEveryOctet) {
    const support::TempDirectory directory;
    const std::string octets("a\0b\r\n\xFF", 6);
    EXPECT_EQ(readWholeFile(directory.write("file", octets)), octets);
    EXPECT_EQ(readWholeFile(directory.write("empty", "")), "");
    const std::string large(200000, 'x');
    EXPECT_EQ(readWholeFile(directory.write("large", large)), large);
}

TEST(WholeFileTest, TellsWhyAFileIsNotRead) {
    const support::TempDirectory directory;
    EXPECT_EQ(failureOf(directory.path("none")),
              directory.path("none") + ": there is no such file");
    EXPECT_EQ(failureOf(directory.path()), directory.path() + ": is no regular file");
    const std::string pipe = directory.path("pipe");
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_EQ(failureOf(pipe), pipe + ": is no regular file");
    const std::string large = directory.write("large", std::string((1 << 20) + 1, 'x'));
    EXPECT_EQ(failureOf(large, 1 << 20),
              large + ": is larger than 1 MiB, which is the most that sennetctl reads of it");
}

/// Puts a file and a pipe at a path, one after the other, and lets nobody who opens the pipe wait
/// for good: such a reader finds an empty file.
class Swapper {
  public:
    explicit Swapper(const support::TempDirectory& directory)
        : file(directory.write("original", "x")),
          pipe(directory.path("pipe")),
          spare(directory.path("spare")),
          path(directory.write("swapped", "x")) {
        EXPECT_EQ(mkfifo(pipe.c_str(), 0600), 0);
        thread = std::thread([this] {
            while (!done) {
                put(file);
                put(pipe);
                ::close(::open(pipe.c_str(), O_WRONLY | O_NONBLOCK | O_CLOEXEC));
            }
        });
    }
    ~Swapper() {
        done = true;
        thread.join();
    }
    Swapper(const Swapper&) = delete;
    Swapper& operator=(const Swapper&) = delete;

    const std::string& place() const { return path; }

  private:
    void put(const std::string& original) const {
        ::link(original.c_str(), spare.c_str());
        ::rename(spare.c_str(), path.c_str());
    }

    std::string file;
    std::string pipe;
    std::string spare;
    std::string path;
    std::atomic<bool> done = false;
    std::thread thread;
};

TEST(WholeFileTest, APipeThatTakesThePlaceOfAFileIsNotOpened) {
    const support::TempDirectory directory;
    const Swapper swapper(directory);
    int files = 0;
    int pipes = 0;
    while (files < 300 || pipes < 300) {
        try {
            ASSERT_EQ(readWholeFile(swapper.place()), "x");
            ++files;
        } catch (const CannotRun& failure) {
            ASSERT_EQ(failure.what(), swapper.place() + ": is no regular file");
            ++pipes;
        }
    }
}

TEST(WholeFileTest, WritesEveryOctet) {
    const support::TempDirectory directory;
    const std::string octets("a\0b\r\n\xFF", 6);
    writeWholeFile(directory.path("file"), octets);
    EXPECT_EQ(directory.read("file"), octets);
}

TEST(WholeFileTest, TellsWhyAFileIsNotWritten) {
    const support::TempDirectory directory;
    const std::string file = directory.write("file", "before");
    EXPECT_EQ(writeFailureOf(directory.path("none/file")),
              directory.path("none/file") + ": No such file or directory");
    EXPECT_EQ(writeFailureOf(file + "/below"), file + "/below: Not a directory");
    EXPECT_EQ(writeFailureOf(directory.path()), directory.path() + ": Is a directory");
}

// Only the end of a file or a full buffer of it shows that there is no room.
TEST(WholeFileTest, TellsThatThereIsNoRoom) {
    const support::TempDirectory directory;
    const std::string file = directory.write("file", "before");
    rlimit usual = {};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &usual), 0);
    const auto handler = std::signal(SIGXFSZ, SIG_IGN);
    const rlimit small = {10, usual.rlim_max};
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
    const std::string atTheEnd = writeFailureOf(file, 100);
    const std::string onTheWay = writeFailureOf(file, 1 << 20);
    setrlimit(RLIMIT_FSIZE, &usual);
    std::signal(SIGXFSZ, handler);
    EXPECT_EQ(atTheEnd, file + ": File too large");
    EXPECT_EQ(onTheWay, file + ": File too large");
    EXPECT_EQ(directory.read("file"), "before");
}

}  // namespace
}  // namespace sennetctl
