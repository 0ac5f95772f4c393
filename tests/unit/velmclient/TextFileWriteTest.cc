#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <syslog.h>
#include <unistd.h>

#include <string>
#include <vector>

#include "ChildProcess.h"
#include "SyslogSpy.h"
#include "Velm/TextFile.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using support::TempDirectory;
using testing::ElementsAre;
using testing::IsEmpty;

int writeText(TextFile& file, const std::string& text) {
    return file.writeLine(text.data(), static_cast<int>(text.size()));
}

unsigned int modeOf(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 ? status.st_mode & 07777U : 0U;
}

std::vector<std::string> visibleNames(const TempDirectory& directory) {
    std::vector<std::string> names = directory.names();
    std::erase_if(names, [](const std::string& name) { return name[0] == '.'; });
    return names;
}

TEST(TextFileWrite, BytesAreWrittenAsGiven) {
    const TempDirectory directory;
    takeSyslog();
    TextFile file(directory.path("a.mif").c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(writeText(file, "Start Component\r\n"), 17);
    EXPECT_EQ(file.writeLine("", 0), 0);
    EXPECT_EQ(file.writeLine("a\0b and more", 3), 3);
    EXPECT_EQ(writeText(file, "\n"), 1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a.mif"), std::string("Start Component\r\na\0b\n", 21));
    EXPECT_THAT(takeSyslog(), IsEmpty());
    EXPECT_THAT(directory.names(), ElementsAre("a.mif"));
}

TEST(TextFileWrite, NothingWrittenMakesAnEmptyFile) {
    const TempDirectory directory;
    directory.write("a.mif", "old");
    TextFile file(directory.path("a.mif").c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a.mif"), "");
}

TEST(TextFileWrite, PiecesOfAnySizeComeOutInOrder) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    ASSERT_EQ(file.open(1), 0);
    std::string expected;
    char letter = 'a';
    for (const std::size_t size : {1U, 65535U, 65536U, 65537U, 1U, 200000U, 3U, 40000U, 40000U}) {
        const std::string piece(size, letter++);
        EXPECT_EQ(writeText(file, piece), static_cast<int>(size));
        expected += piece;
    }
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a"), expected);
}

TEST(TextFileWrite, ThePreviousFileStandsUntilClose) {
    const TempDirectory directory;
    directory.write("a.mif", "old");
    TextFile file(directory.path("a.mif").c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(directory.read("a.mif"), "old");
    EXPECT_EQ(writeText(file, std::string(300000, 'x')), 300000);
    EXPECT_EQ(directory.read("a.mif"), "old");
    EXPECT_THAT(visibleNames(directory), ElementsAre("a.mif"));
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a.mif"), std::string(300000, 'x'));
    EXPECT_THAT(directory.names(), ElementsAre("a.mif"));
}

TEST(TextFileWrite, AReaderOfThePreviousFileKeepsIt) {
    const TempDirectory directory;
    TextFile reader(directory.write("a", "old\n").c_str());
    ASSERT_EQ(reader.open(0), 0);
    TextFile writer(directory.path("a").c_str());
    ASSERT_EQ(writer.open(1), 0);
    writeText(writer, "new\n");
    EXPECT_EQ(writer.close(), 0);
    char line[4] = {};
    EXPECT_EQ(reader.readLine(line, 3), 3);
    EXPECT_STREQ(line, "old");
}

TEST(TextFileWrite, WithoutCloseThePreviousFileStays) {
    const TempDirectory directory;
    directory.write("a", "old");
    {
        TextFile file(directory.path("a").c_str());
        ASSERT_EQ(file.open(1), 0);
        writeText(file, std::string(100000, 'x'));
    }
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, OpeningAgainDropsWhatWasWritten) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    ASSERT_EQ(file.open(1), 0);
    writeText(file, "first");
    ASSERT_EQ(file.open(1), 0);
    writeText(file, "second");
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a"), "second");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, OpeningOtherwiseDropsWhatWasWritten) {
    const TempDirectory directory;
    directory.write("a", "old\n");
    TextFile file(directory.path("a").c_str());
    for (const int mode : {0, 2}) {
        ASSERT_EQ(file.open(1), 0);
        writeText(file, "new");
        file.open(mode);
        EXPECT_EQ(writeText(file, "more"), -1);
        EXPECT_EQ(file.close(), 0);
        EXPECT_EQ(directory.read("a"), "old\n");
    }
}

TEST(TextFileWrite, AnOpenFileKeepsItsPath) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    ASSERT_EQ(file.open(1), 0);
    file.setFileName(directory.path("b").c_str());
    writeText(file, "text");
    EXPECT_EQ(file.close(), 0);
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, CloseThenRemoveLeavesNothing) {
    const TempDirectory directory;
    TextFile file(directory.write("a", "old").c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(file.remove(), 0);
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST(TextFileWrite, AClosedFileTakesNothingMore) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    EXPECT_EQ(writeText(file, "before"), -1);
    ASSERT_EQ(file.open(1), 0);
    writeText(file, "text");
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(writeText(file, "after"), -1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a"), "text");
}

TEST(TextFileWrite, BadArgumentsWriteNothing) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(file.writeLine(nullptr, 1), -1);
    EXPECT_EQ(file.writeLine("text", -1), -1);
    EXPECT_EQ(writeText(file, "b"), 1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("a"), "b");
}

TEST(TextFileWrite, ANewFileFollowsTheUmask) {
    const TempDirectory directory;
    const mode_t before = ::umask(027);
    TextFile file(directory.path("a").c_str());
    EXPECT_EQ(file.open(1), 0);
    EXPECT_EQ(file.close(), 0);
    ::umask(before);
    EXPECT_EQ(modeOf(directory.path("a")), 0640U);
}

TEST(TextFileWrite, TheModeOfThePreviousFileIsKept) {
    const TempDirectory directory;
    const std::string path = directory.write("a", "old");
    const mode_t before = ::umask(022);
    for (const unsigned int mode : {0600U, 0666U, 0751U, 0444U}) {
        ASSERT_EQ(::chmod(path.c_str(), mode), 0);
        TextFile file(path.c_str());
        EXPECT_EQ(file.open(1), 0);
        EXPECT_EQ(file.close(), 0);
        EXPECT_EQ(modeOf(path), mode);
    }
    ::umask(before);
}

TEST(TextFileWrite, ALinkIsReplacedAndItsTargetUntouched) {
    const TempDirectory directory;
    directory.write("target", "old");
    ASSERT_EQ(::symlink("target", directory.path("link").c_str()), 0);
    TextFile file(directory.path("link").c_str());
    ASSERT_EQ(file.open(1), 0);
    writeText(file, "new");
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("target"), "old");
    EXPECT_EQ(directory.read("link"), "new");
    struct stat status {};
    ASSERT_EQ(::lstat(directory.path("link").c_str(), &status), 0);
    EXPECT_TRUE(S_ISREG(status.st_mode));
}

TEST(TextFileWrite, ALinkIsReplacedWhateverItPointsAt) {
    const TempDirectory directory;
    for (const char* target : {"/dev/null", "/", "missing", "link"}) {
        SCOPED_TRACE(target);
        ::unlink(directory.path("link").c_str());
        ASSERT_EQ(::symlink(target, directory.path("link").c_str()), 0);
        TextFile file(directory.path("link").c_str());
        ASSERT_EQ(file.open(1), 0);
        writeText(file, "new");
        EXPECT_EQ(file.close(), 0);
        EXPECT_EQ(directory.read("link"), "new");
        EXPECT_THAT(directory.names(), ElementsAre("link"));
    }
}

TEST(TextFileWrite, OnlyFilesAreReplaced) {
    const TempDirectory directory;
    const std::string fifo = directory.path("fifo");
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    ASSERT_EQ(::mkdir(directory.path("directory").c_str(), 0700), 0);
    EXPECT_NE(TextFile(fifo.c_str()).open(1), 0);
    EXPECT_NE(TextFile(directory.path("directory").c_str()).open(1), 0);
    EXPECT_NE(TextFile(directory.path("directory/").c_str()).open(1), 0);
    EXPECT_NE(TextFile(directory.path("directory/.").c_str()).open(1), 0);
    EXPECT_NE(TextFile("/dev/null").open(1), 0);
    EXPECT_NE(TextFile("").open(1), 0);
    EXPECT_THAT(directory.names(), ElementsAre("directory", "fifo"));
}

TEST(TextFileWrite, AMissingDirectoryIsReportedAndTheRestIsHarmless) {
    const TempDirectory directory;
    const std::string path = directory.path("missing/a.mif");
    takeSyslog();
    TextFile file(path.c_str());
    EXPECT_NE(file.open(1), 0);
    EXPECT_EQ(writeText(file, "text"), -1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(file.remove(), 0);
    EXPECT_THAT(directory.names(), IsEmpty());
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].priority, LOG_ERR);
    EXPECT_EQ(log[0].text, "cannot write " + path + ": No such file or directory");
}

TEST(TextFileWrite, TheLongestNameCanBeWritten) {
    const TempDirectory directory;
    const std::string name(255, 'x');
    TextFile file(directory.path(name).c_str());
    ASSERT_EQ(file.open(1), 0);
    EXPECT_EQ(file.close(), 0);
    EXPECT_THAT(directory.names(), ElementsAre(name));
    EXPECT_NE(TextFile(directory.path(name + "x").c_str()).open(1), 0);
}

TEST(TextFileWrite, ARelativePathIsThatOfTheOpening) {
    const TempDirectory directory;
    const std::string result = runInChild([&] {
        if (::chdir(directory.path().c_str()) != 0) {
            return std::string("cannot change the directory");
        }
        TextFile file("a");
        if (file.open(1) != 0 || ::chdir("/") != 0) {
            return std::string("cannot open");
        }
        return std::to_string(file.close());
    });
    EXPECT_EQ(result, "0");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, AReadOnlyDirectoryIsReported) {
    const TempDirectory directory;
    directory.write("a", "old");
    ASSERT_EQ(::chmod(directory.path("a").c_str(), 0666), 0);
    ASSERT_EQ(::chmod(directory.path().c_str(), 0555), 0);
    const std::string result = runInChild([&] {
        if (::geteuid() == 0 && ::seteuid(65534) != 0) {
            return std::string("cannot change the user");
        }
        takeSyslog();
        const bool refused = TextFile(directory.path("a").c_str()).open(1) != 0;
        const auto log = takeSyslog();
        return refused && log.size() == 1 ? log[0].text : std::string("opened");
    });
    EXPECT_EQ(result, "cannot write " + directory.path("a") + ": Permission denied");
    EXPECT_EQ(directory.read("a"), "old");
}

// What a full disk does: a write that cannot be completed, here through a limit on file sizes.
std::string writeBeyondLimit(const std::string& path, std::size_t pieces) {
    return runInChild([&] {
        ::signal(SIGXFSZ, SIG_IGN);
        const rlimit limit{100000, 100000};
        TextFile file(path.c_str());
        if (::setrlimit(RLIMIT_FSIZE, &limit) != 0 || file.open(1) != 0) {
            return std::string("cannot prepare");
        }
        takeSyslog();
        const std::string piece(50001, 'x');
        std::string results;
        for (std::size_t i = 0; i < pieces; ++i) {
            results += std::to_string(writeText(file, piece)) + ' ';
        }
        results += std::to_string(file.close());
        for (const SyslogEntry& entry : takeSyslog()) {
            results += '\n' + entry.text;
        }
        return results;
    });
}

TEST(TextFileWrite, AFailedWriteKeepsThePreviousFile) {
    const TempDirectory directory;
    const std::string path = directory.write("a", "old");
    const std::string result = writeBeyondLimit(path, 6);
    EXPECT_THAT(result, testing::EndsWith(" -1 -1 -1\ncannot write " + path + ": File too large"));
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, AWriteThatFailsAtCloseKeepsThePreviousFile) {
    const TempDirectory directory;
    const std::string path = directory.write("a", "old");
    EXPECT_EQ(writeBeyondLimit(path, 2),
              "50001 50001 -1\ncannot write " + path + ": File too large");
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, AFailedWriteLeavesNoFileWhereNoneWas) {
    const TempDirectory directory;
    writeBeyondLimit(directory.path("a"), 6);
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST(TextFileWrite, ATargetThatBecomesADirectoryFailsAtClose) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    ASSERT_EQ(file.open(1), 0);
    writeText(file, "text");
    ASSERT_EQ(::mkdir(directory.path("a").c_str(), 0700), 0);
    takeSyslog();
    EXPECT_EQ(file.close(), -1);
    EXPECT_EQ(takeSyslog().size(), 1U);
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TextFileWrite, AFileFollowsADirectoryThatIsRenamed) {
    const TempDirectory directory;
    ASSERT_EQ(::mkdir(directory.path("old").c_str(), 0700), 0);
    TextFile file(directory.path("old/a").c_str());
    ASSERT_EQ(file.open(1), 0);
    ASSERT_EQ(::rename(directory.path("old").c_str(), directory.path("moved").c_str()), 0);
    EXPECT_EQ(file.close(), 0);
    EXPECT_THAT(directory.names(), ElementsAre("moved"));
    EXPECT_EQ(directory.read("moved/a"), "");
}

TEST(TextFileWrite, AKilledProcessLeavesThePreviousFileWhole) {
    const TempDirectory directory;
    directory.write("a", "old");
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    const pid_t child = ::fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
        TextFile file(directory.path("a").c_str());
        file.open(1);
        writeText(file, std::string(500000, 'x'));
        (void)!::write(ends[1], "w", 1);
        for (;;) {
            ::pause();
        }
    }
    char written = 0;
    EXPECT_EQ(::read(ends[0], &written, 1), 1);
    ::kill(child, SIGKILL);
    ::waitpid(child, nullptr, 0);
    ::close(ends[0]);
    ::close(ends[1]);
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_THAT(visibleNames(directory), ElementsAre("a"));
}

}  // namespace
}  // namespace Velm
