#include "script/OutputCheck.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>

#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

/// Root may write everywhere, so that it has to be somebody else for a while.
class OrdinaryUser {
  public:
    explicit OrdinaryUser(const std::string& home) {
        if (wasRoot) {
            isOne = ::chown(home.c_str(), kUser, kUser) == 0 && ::setresuid(kUser, kUser, 0) == 0;
        }
    }
    ~OrdinaryUser() {
        if (wasRoot && isOne) {
            EXPECT_EQ(::setresuid(0, 0, 0), 0);
        }
    }
    OrdinaryUser(const OrdinaryUser&) = delete;
    OrdinaryUser& operator=(const OrdinaryUser&) = delete;

    explicit operator bool() const { return isOne; }

  private:
    static constexpr uid_t kUser = 65534;
    const bool wasRoot = ::geteuid() == 0;
    bool isOne = !wasRoot;
};

class OutputCheckTest : public testing::Test {
  protected:
    static std::string told(const std::string& octets) {
        std::vector<Finding> findings;
        checkOutputDirectories("c", octets, findings);
        std::string text;
        for (const Finding& finding : findings) {
            text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                    nameOf(finding.severity) + ": " + finding.message + "\n";
        }
        return text;
    }

    support::TempDirectory directory;
    const std::string good = directory.path("");
    const std::string plain = directory.write("plain", "");
};

TEST_F(OutputCheckTest, DirectoriesThatAreThereOrCanBeMade) {
    EXPECT_EQ(
        told("mif.directory = " + good + "\nsql.directory.QVE = " + directory.path("a/b/c") + "\n"),
        "");
    EXPECT_EQ(told(""), "");
}

TEST_F(OutputCheckTest, APlainFile) {
    EXPECT_EQ(
        told("# x\nmif.directory.SMS = " + plain + "\n"),
        "2:21: error: sennet writes nothing into " + plain + ": " + plain + " is no directory\n");
}

TEST_F(OutputCheckTest, APlainFileAboveTheDirectory) {
    const std::string below = plain + "/a/b";
    EXPECT_EQ(told("mif.directory.LD=" + below), "1:18: error: sennet writes nothing into " +
                                                     below + ": " + plain + " is no directory\n");
}

TEST_F(OutputCheckTest, ALinkThatLeadsNowhere) {
    const std::string link = directory.path("link");
    std::filesystem::create_symlink(directory.path("gone"), link);
    EXPECT_EQ(told("mif.directory.CA=" + link), "1:18: error: sennet writes nothing into " + link +
                                                    ": " + link + ": No such file or directory\n");
}

TEST_F(OutputCheckTest, ADirectoryThatMayNotBeWritten) {
    const OrdinaryUser user(good);
    if (!user) {
        GTEST_SKIP() << "there is no other user";
    }
    const std::string closed = directory.path("closed");
    std::filesystem::create_directory(closed);
    std::filesystem::permissions(
        closed, std::filesystem::perms::owner_read | std::filesystem::perms::owner_exec);
    EXPECT_EQ(told("mif.directory.QVE=" + closed + "/a"),
              "1:19: warning: sennet writes nothing into " + closed + "/a: " + closed +
                  ": Permission denied\n");
    EXPECT_EQ(told("sql.directory=/usr"),
              "1:15: note: sennet writes nothing into /usr: /usr: Permission denied for this "
              "user\n")
        << "it is root's, and so may the inventory be";
}

// Those of the products win, and the last of equal keys.
TEST_F(OutputCheckTest, EntriesThatAreNotUsed) {
    const std::string products = "mif.directory.SMS=" + good + "\nmif.directory.LD=" + good +
                                 "\nmif.directory.CA=" + good + "\nmif.directory.QVE=" + good +
                                 "\n";
    EXPECT_EQ(told("mif.directory=" + plain + "\n" + products), "");
    EXPECT_EQ(told("mif.directory.SMS=" + plain + "\nmif.directory.SMS=" + good + "\n"), "");
    EXPECT_EQ(told("sql.directory.SMS=" + plain + "\nsennet.directory=" + plain + "\n"), "");
}

TEST_F(OutputCheckTest, OneThatServesSeveralProductsIsToldOnce) {
    EXPECT_EQ(
        told("mif.directory=" + plain + "\nmif.directory.SMS=\n"),
        "1:15: error: sennet writes nothing into " + plain + ": " + plain + " is no directory\n");
}

// They are told as such.
TEST_F(OutputCheckTest, RelativePathsArePassedOver) {
    EXPECT_EQ(told("mif.directory=plain/out\n"), "");
}

}  // namespace
}  // namespace sennetctl
