// The road that is taken where the file system knows no nameless files; the other one is that of
// the TextFile tests wherever it does.
#include "velmclient/ReplacingFile.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <string>
#include <utility>
#include <vector>

#include "SyslogSpy.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using support::TempDirectory;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;

TEST(ReplacingFile, TheHiddenFileBecomesTheFile) {
    const TempDirectory directory;
    directory.write("a", "old");
    ReplacingFile file(directory.path("a"), ReplacingFile::Temporary::kHidden);
    ASSERT_TRUE(file.open());
    EXPECT_THAT(directory.names(),
                ElementsAre(MatchesRegex("\\.velm-[0-9a-f]+\\.tmp"), std::string("a")));
    EXPECT_TRUE(file.write("new"));
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_TRUE(file.commit());
    EXPECT_EQ(directory.read("a"), "new");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(ReplacingFile, TheHiddenFileGoesWithTheObject) {
    const TempDirectory directory;
    directory.write("a", "old");
    {
        ReplacingFile file(directory.path("a"), ReplacingFile::Temporary::kHidden);
        ASSERT_TRUE(file.open());
        EXPECT_TRUE(file.write(std::string(100000, 'x')));
    }
    EXPECT_EQ(directory.read("a"), "old");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(ReplacingFile, TheHiddenFileGoesWhenTheRenameFails) {
    const TempDirectory directory;
    ReplacingFile file(directory.path("a"), ReplacingFile::Temporary::kHidden);
    ASSERT_TRUE(file.open());
    ASSERT_EQ(::mkdir(directory.path("a").c_str(), 0700), 0);
    takeSyslog();
    EXPECT_FALSE(file.commit());
    EXPECT_THAT(directory.names(), ElementsAre("a"));
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].text, "cannot write " + directory.path("a") + ": Is a directory");
}

TEST(ReplacingFile, TwoWritersOfOneFileDoNotMeet) {
    const TempDirectory directory;
    ReplacingFile first(directory.path("a"), ReplacingFile::Temporary::kHidden);
    ReplacingFile second(directory.path("a"), ReplacingFile::Temporary::kHidden);
    ASSERT_TRUE(first.open());
    ASSERT_TRUE(second.open());
    EXPECT_TRUE(first.write("first"));
    EXPECT_TRUE(second.write("second"));
    EXPECT_TRUE(second.commit());
    EXPECT_EQ(directory.read("a"), "second");
    EXPECT_TRUE(first.commit());
    EXPECT_EQ(directory.read("a"), "first");
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(ReplacingFile, ANamelessFileIsNotSeenAtAll) {
    const TempDirectory directory;
    const int probe = ::open(directory.path().c_str(), O_TMPFILE | O_WRONLY, 0600);
    if (probe < 0) {
        GTEST_SKIP() << "no nameless files in " << directory.path();
    }
    ::close(probe);
    ReplacingFile file(directory.path("a"));
    ASSERT_TRUE(file.open());
    EXPECT_TRUE(file.write(std::string(100000, 'x')));
    EXPECT_THAT(directory.names(), IsEmpty());
    EXPECT_TRUE(file.commit());
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

unsigned int modeOf(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 ? status.st_mode & 07777U : 0U;
}

std::string modeOfReplacement(const std::string& path) {
    const mode_t umaskBefore = ::umask(022);
    ReplacingFile file(path);
    const bool replaced = file.open() && file.commit();
    ::umask(umaskBefore);
    char text[8];
    std::snprintf(text, sizeof text, "%04o", modeOf(path));
    return replaced ? text : "not replaced";
}

// Whoever may write into the directory once left a file there that all may write to, and could then
// change the inventory that root wrote over it.
TEST(ReplacingFile, AStrangersFileDoesNotGiveItsMode) {
    if (::geteuid() != 0) {
        GTEST_SKIP() << "only root can give a file to somebody else";
    }
    const TempDirectory directory;
    const std::string path = directory.write("a", "planted");
    ASSERT_EQ(::chown(path.c_str(), 12345, 12345), 0);
    ASSERT_EQ(::chmod(path.c_str(), 0666), 0);
    EXPECT_EQ(modeOfReplacement(path), "0644");
}

TEST(ReplacingFile, AFileOfTwoNamesDoesNotGiveItsMode) {
    const TempDirectory directory;
    const std::string elsewhere = directory.write("elsewhere", "open to all");
    ASSERT_EQ(::chmod(elsewhere.c_str(), 0666), 0);
    ASSERT_EQ(::link(elsewhere.c_str(), directory.path("a").c_str()), 0);
    EXPECT_EQ(modeOfReplacement(directory.path("a")), "0644");
    EXPECT_EQ(modeOf(elsewhere), 0666U);
    EXPECT_EQ(directory.read("elsewhere"), "open to all");
}

// Whoever could open it could lock it, and it would stay when the run is killed.
TEST(ReplacingFile, TheHiddenFileIsNobodyElsesUntilItsEnd) {
    const TempDirectory directory;
    const std::string path = directory.path("a");
    for (const auto& [mask, ending] : {std::pair<mode_t, unsigned int>{0, 0666}, {027, 0640}}) {
        const mode_t umaskBefore = ::umask(mask);
        ReplacingFile file(path, ReplacingFile::Temporary::kHidden);
        EXPECT_TRUE(file.open());
        ASSERT_EQ(directory.names().size(), 1U);
        EXPECT_EQ(modeOf(directory.path(directory.names()[0])), 0600U);
        EXPECT_TRUE(file.commit());
        EXPECT_EQ(::umask(umaskBefore), mask);
        EXPECT_EQ(modeOf(path), ending);
        ASSERT_EQ(::unlink(path.c_str()), 0);
    }
}

TEST(ReplacingFile, TheModeIsKeptOnBothRoads) {
    const TempDirectory directory;
    const std::string path = directory.write("a", "old");
    for (const auto temporary :
         {ReplacingFile::Temporary::kHidden, ReplacingFile::Temporary::kNamelessWherePossible}) {
        ASSERT_EQ(::chmod(path.c_str(), 0604), 0);
        ReplacingFile file(path, temporary);
        ASSERT_TRUE(file.open());
        ASSERT_TRUE(file.commit());
        EXPECT_EQ(modeOf(path), 0604U);
    }
}

}  // namespace
}  // namespace Velm
