#include "Velm/DirectoryReader.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <syslog.h>
#include <unistd.h>

#include <string>
#include <vector>

#include "SyslogSpy.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using support::TempDirectory;
using testing::ElementsAre;
using testing::IsEmpty;

std::vector<std::string> filesOf(const DirectoryReader& reader) {
    std::vector<std::string> files;
    for (int i = 0; i < reader.getNumberOfFiles(); ++i) {
        files.emplace_back(reader.getFileName(i));
    }
    return files;
}

TEST(DirectoryReader, ListsNamesThatEndInThePatternIgnoringCase) {
    const TempDirectory directory;
    for (const char* name : {"cpu.script.inv", "DISK.SCRIPT.INV", "net.Script.Inv", ".script.inv",
                             "cpu.script.inv~", "cpu.script.in", "cpuscript.inv", "script.inv"}) {
        directory.write(name, "");
    }
    const DirectoryReader reader(directory.path().c_str(), ".script.inv");
    EXPECT_THAT(filesOf(reader),
                ElementsAre(directory.path(".script.inv"), directory.path("DISK.SCRIPT.INV"),
                            directory.path("cpu.script.inv"), directory.path("net.Script.Inv")));
}

TEST(DirectoryReader, CaseIsIgnoredForAsciiLettersOnly) {
    const TempDirectory directory;
    directory.write("a@", "");
    directory.write("b`", "");
    directory.write("c\xC3\x84", "");
    directory.write("d\xC3\xA4", "");
    EXPECT_THAT(filesOf(DirectoryReader(directory.path().c_str(), "@")),
                ElementsAre(directory.path("a@")));
    EXPECT_THAT(filesOf(DirectoryReader(directory.path().c_str(), "\xC3\xA4")),
                ElementsAre(directory.path("d\xC3\xA4")));
}

TEST(DirectoryReader, OrderIsThatOfTheBytes) {
    const TempDirectory directory;
    for (const char* name : {"b.x", "a.x", "B.x", "10.x", "9.x", "a1.x", "\xC3\xA9.x", "~.x"}) {
        directory.write(name, "");
    }
    const DirectoryReader reader(directory.path().c_str(), ".X");
    EXPECT_THAT(filesOf(reader),
                ElementsAre(directory.path("10.x"), directory.path("9.x"), directory.path("B.x"),
                            directory.path("a.x"), directory.path("a1.x"), directory.path("b.x"),
                            directory.path("~.x"), directory.path("\xC3\xA9.x")));
}

TEST(DirectoryReader, OnlyRegularFilesAreListedAndLinksAreFollowed) {
    const TempDirectory directory;
    directory.write("file.x", "");
    ASSERT_EQ(::mkdir(directory.path("directory.x").c_str(), 0700), 0);
    ASSERT_EQ(::mkfifo(directory.path("fifo.x").c_str(), 0600), 0);
    ASSERT_EQ(::symlink("file.x", directory.path("link.x").c_str()), 0);
    ASSERT_EQ(::symlink("missing", directory.path("dangling.x").c_str()), 0);
    ASSERT_EQ(::symlink("directory.x", directory.path("to-directory.x").c_str()), 0);
    ASSERT_EQ(::symlink("loop.x", directory.path("loop.x").c_str()), 0);
    const DirectoryReader reader(directory.path().c_str(), ".x");
    EXPECT_THAT(filesOf(reader), ElementsAre(directory.path("file.x"), directory.path("link.x")));
}

TEST(DirectoryReader, TheDirectoryIsKeptAsGiven) {
    const TempDirectory directory;
    directory.write("a.x", "");
    const std::string given = directory.path() + "/./";
    const DirectoryReader reader(given.c_str(), ".x");
    EXPECT_THAT(filesOf(reader), ElementsAre(given + "/a.x"));
}

TEST(DirectoryReader, AnEmptyPatternFitsEveryName) {
    const TempDirectory directory;
    directory.write("a", "");
    directory.write(".b", "");
    EXPECT_EQ(DirectoryReader(directory.path().c_str(), "").getNumberOfFiles(), 2);
    EXPECT_EQ(DirectoryReader(directory.path().c_str(), nullptr).getNumberOfFiles(), 2);
}

TEST(DirectoryReader, AnIndexOutOfRangeGivesNull) {
    const TempDirectory directory;
    directory.write("a.x", "");
    const DirectoryReader reader(directory.path().c_str(), ".x");
    EXPECT_NE(reader.getFileName(0), nullptr);
    EXPECT_EQ(reader.getFileName(1), nullptr);
    EXPECT_EQ(reader.getFileName(-1), nullptr);
}

TEST(DirectoryReader, AnEmptyDirectoryListsNothingAndReportsNothing) {
    const TempDirectory directory;
    takeSyslog();
    EXPECT_EQ(DirectoryReader(directory.path().c_str(), ".x").getNumberOfFiles(), 0);
    EXPECT_THAT(takeSyslog(), IsEmpty());
}

TEST(DirectoryReader, AMissingDirectoryListsNothingAndIsReported) {
    const TempDirectory directory;
    const std::string missing = directory.path("missing");
    takeSyslog();
    const DirectoryReader reader(missing.c_str(), ".x");
    EXPECT_EQ(reader.getNumberOfFiles(), 0);
    EXPECT_EQ(reader.getFileName(0), nullptr);
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].priority, LOG_ERR);
    EXPECT_EQ(log[0].text, "cannot list " + missing + ": No such file or directory");
}

TEST(DirectoryReader, AFileOrNothingInPlaceOfADirectoryListsNothing) {
    const TempDirectory directory;
    const std::string file = directory.write("a.x", "");
    EXPECT_EQ(DirectoryReader(file.c_str(), ".x").getNumberOfFiles(), 0);
    EXPECT_EQ(DirectoryReader("", ".x").getNumberOfFiles(), 0);
    EXPECT_EQ(DirectoryReader(nullptr, ".x").getNumberOfFiles(), 0);
}

}  // namespace
}  // namespace Velm
