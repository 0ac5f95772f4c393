#include "Velm/TextFile.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <syslog.h>
#include <unistd.h>

#include <string>

#include "ChildProcess.h"
#include "SyslogSpy.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using support::TempDirectory;
using testing::ElementsAre;
using testing::IsEmpty;

unsigned int modeOf(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 ? status.st_mode & 07777U : 0U;
}

bool isDirectory(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode);
}

TEST(TextFile, ExistsKnowsFilesDirectoriesAndLinks) {
    const TempDirectory directory;
    ASSERT_EQ(::symlink("file", directory.path("link").c_str()), 0);
    EXPECT_FALSE(TextFile(directory.path("file").c_str()).exists());
    EXPECT_FALSE(TextFile(directory.path("link").c_str()).exists());
    directory.write("file", "");
    EXPECT_TRUE(TextFile(directory.path("file").c_str()).exists());
    EXPECT_TRUE(TextFile(directory.path("link").c_str()).exists());
    EXPECT_TRUE(TextFile(directory.path().c_str()).exists());
    EXPECT_FALSE(TextFile("").exists());
    EXPECT_FALSE(TextFile(nullptr).exists());
}

TEST(TextFile, ThePathIsCopied) {
    const TempDirectory directory;
    std::string path = directory.write("a", "");
    TextFile file(path.c_str());
    path.assign(path.size(), 'x');
    EXPECT_TRUE(file.exists());
    std::string other = directory.write("b", "");
    file.setFileName(other.c_str());
    other.assign(other.size(), 'x');
    EXPECT_TRUE(file.exists());
}

TEST(TextFile, SetFileNamePointsTheHandleElsewhere) {
    const TempDirectory directory;
    TextFile file(directory.path("a").c_str());
    file.setFileName(directory.path("b").c_str());
    EXPECT_EQ(file.mkdir(1), 0);
    EXPECT_THAT(directory.names(), ElementsAre("b"));
}

TEST(TextFile, MkdirMakesParents) {
    const TempDirectory directory;
    takeSyslog();
    EXPECT_EQ(TextFile(directory.path("a//b/c/").c_str()).mkdir(1), 0);
    EXPECT_TRUE(isDirectory(directory.path("a/b/c")));
    EXPECT_THAT(takeSyslog(), IsEmpty());
}

TEST(TextFile, MkdirOfAnExistingDirectorySucceeds) {
    const TempDirectory directory;
    EXPECT_EQ(TextFile(directory.path().c_str()).mkdir(1), 0);
    EXPECT_EQ(TextFile((directory.path() + "/").c_str()).mkdir(1), 0);
    EXPECT_EQ(TextFile(directory.path().c_str()).mkdir(0), 0);
    EXPECT_EQ(TextFile("/").mkdir(1), 0);
    EXPECT_EQ(TextFile(".").mkdir(1), 0);
}

TEST(TextFile, MkdirWithoutParentsMakesOneDirectory) {
    const TempDirectory directory;
    EXPECT_NE(TextFile(directory.path("a/b").c_str()).mkdir(0), 0);
    EXPECT_FALSE(isDirectory(directory.path("a")));
    EXPECT_EQ(TextFile(directory.path("a").c_str()).mkdir(0), 0);
    EXPECT_TRUE(isDirectory(directory.path("a")));
}

TEST(TextFile, MkdirFollowsTheUmask) {
    const TempDirectory directory;
    const mode_t before = ::umask(027);
    EXPECT_EQ(TextFile(directory.path("a/b").c_str()).mkdir(1), 0);
    ::umask(before);
    EXPECT_EQ(modeOf(directory.path("a")), 0750U);
    EXPECT_EQ(modeOf(directory.path("a/b")), 0750U);
}

TEST(TextFile, MkdirWhereAFileStandsFailsAndIsReported) {
    const TempDirectory directory;
    const std::string path = directory.write("file", "text");
    takeSyslog();
    EXPECT_NE(TextFile(path.c_str()).mkdir(1), 0);
    EXPECT_NE(TextFile((path + "/below").c_str()).mkdir(1), 0);
    EXPECT_EQ(directory.read("file"), "text");
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 2U);
    EXPECT_EQ(log[0].priority, LOG_ERR);
    EXPECT_EQ(log[0].text, "cannot create directory " + path + ": Not a directory");
    EXPECT_EQ(log[1].text, "cannot create directory " + path + "/below: Not a directory");
}

TEST(TextFile, MkdirOfImpossiblePathsFails) {
    const TempDirectory directory;
    EXPECT_NE(TextFile("").mkdir(1), 0);
    EXPECT_NE(TextFile(directory.path(std::string(300, 'x')).c_str()).mkdir(1), 0);
    EXPECT_NE(TextFile(std::string(100000, '/').append("x").c_str()).mkdir(1), 0);
    ASSERT_EQ(::symlink("missing", directory.path("dangling").c_str()), 0);
    EXPECT_NE(TextFile(directory.path("dangling").c_str()).mkdir(1), 0);
}

TEST(TextFile, MkdirWithoutPermissionFails) {
    const TempDirectory directory;
    ASSERT_EQ(::chmod(directory.path().c_str(), 0555), 0);
    const std::string result = runInChild([&] {
        if (::geteuid() == 0 && ::seteuid(65534) != 0) {
            return std::string("cannot change the user");
        }
        return std::to_string(TextFile(directory.path("a").c_str()).mkdir(1));
    });
    EXPECT_EQ(result, "-1");
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST(TextFile, RemoveDeletesTheFile) {
    const TempDirectory directory;
    TextFile file(directory.write("a", "text").c_str());
    EXPECT_EQ(file.remove(), 0);
    EXPECT_THAT(directory.names(), IsEmpty());
}

TEST(TextFile, RemoveOfAMissingFileIsNoFailure) {
    const TempDirectory directory;
    takeSyslog();
    EXPECT_EQ(TextFile(directory.path("a").c_str()).remove(), 0);
    EXPECT_EQ(TextFile(directory.path("a/b").c_str()).remove(), 0);
    EXPECT_THAT(takeSyslog(), IsEmpty());
}

TEST(TextFile, RemoveDeletesALinkAndNotItsTarget) {
    const TempDirectory directory;
    directory.write("target", "text");
    ASSERT_EQ(::symlink("target", directory.path("link").c_str()), 0);
    EXPECT_EQ(TextFile(directory.path("link").c_str()).remove(), 0);
    EXPECT_THAT(directory.names(), ElementsAre("target"));
}

TEST(TextFile, RemoveLeavesADirectoryAndReportsIt) {
    const TempDirectory directory;
    ASSERT_EQ(::mkdir(directory.path("a").c_str(), 0700), 0);
    takeSyslog();
    EXPECT_NE(TextFile(directory.path("a").c_str()).remove(), 0);
    EXPECT_TRUE(isDirectory(directory.path("a")));
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].text, "cannot remove " + directory.path("a") + ": Is a directory");
}

TEST(TextFile, OtherModesAreRefused) {
    const TempDirectory directory;
    TextFile file(directory.write("a", "text").c_str());
    char c = 0;
    for (const int mode : {-1, 2, 1000}) {
        EXPECT_NE(file.open(mode), 0);
        EXPECT_EQ(file.readLine(&c, 1), -1);
        EXPECT_EQ(file.writeLine("x", 1), -1);
        EXPECT_EQ(file.close(), 0);
    }
    EXPECT_EQ(directory.read("a"), "text");
}

}  // namespace
}  // namespace Velm
