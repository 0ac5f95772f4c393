#include "client/LocalAuthentication.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <optional>

#include "support/Files.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

using support::writeFile;
const std::optional<std::string> kNone;

TEST(LocalAuthenticationTest, WritesTheHeaderValues) {
    EXPECT_EQ(localAuthorization("ann"), "Local \"ann\"");
    EXPECT_EQ(localAuthorization("ann", "/var/tmp/x_1", "s3cret"),
              "Local \"ann:/var/tmp/x_1:s3cret\"");
}

TEST(LocalAuthenticationTest, NamesTheEffectiveUser) {
    const std::string name = effectiveUserName();
    if (geteuid() == 0) {
        EXPECT_EQ(name, "root");
    }
    EXPECT_FALSE(name.empty());
}

TEST(LocalAuthenticationTest, FindsTheFileOfAChallenge) {
    EXPECT_EQ(challengeFile("Local \"/var/tmp/x\""), "/var/tmp/x");
    EXPECT_EQ(challengeFile("  local\t \"/a b\" "), "/a b");
}

TEST(LocalAuthenticationTest, RefusesOtherChallenges) {
    for (const char* challenge :
         {"", "Local", "Local \"", "Local \"\"", "Local /var/tmp/x", "Local\"/var/tmp/x\"",
          "Localx \"/a\"", "Basic realm=\"x\"", "Local \"/a\" x", "Local \"/a\", Basic realm=\"b\"",
          "Local \"/a\nb\""}) {
        EXPECT_EQ(challengeFile(challenge), kNone) << challenge;
    }
}

class LocalSecretTest : public testing::Test {
  protected:
    std::optional<std::string> secretIn(const std::string& file) const {
        return readLocalSecret(file, {known.path()}, geteuid());
    }

    support::TempDirectory known;
    support::TempDirectory other;
};

TEST_F(LocalSecretTest, JoinsTheLines) {
    writeFile(known.file("s"), "abc\ndef\r\n123");
    EXPECT_EQ(secretIn(known.file("s")), "abcdef123");
}

TEST_F(LocalSecretTest, OnlyAFileDirectlyInAKnownDirectory) {
    writeFile(other.file("s"), "secret");
    mkdir(known.file("sub").c_str(), 0700);
    writeFile(known.file("sub/s"), "secret");
    writeFile(known.file("s"), "secret");
    const std::string parent = known.path().substr(0, known.path().rfind('/'));
    const std::string last = known.path().substr(known.path().rfind('/') + 1);
    for (const std::string& file :
         {other.file("s"), known.file("sub/s"), known.file("../" + last + "/s"), known.file("./s"),
          known.file("/s"), "/" + known.path() + "/s", parent + "/./" + last + "/s",
          known.file("sub/../s"), known.path(), known.path() + "/", known.file("."),
          known.file(".."), std::string("s"), std::string(""), std::string("/"),
          std::string("/etc/passwd")}) {
        EXPECT_EQ(secretIn(file), kNone) << file;
    }
}

TEST_F(LocalSecretTest, NoSymbolicLinkNorSecondName) {
    writeFile(other.file("s"), "secret");
    ASSERT_EQ(symlink(other.file("s").c_str(), known.file("soft").c_str()), 0);
    ASSERT_EQ(link(other.file("s").c_str(), known.file("hard").c_str()), 0);
    EXPECT_EQ(secretIn(known.file("soft")), kNone);
    EXPECT_EQ(secretIn(known.file("hard")), kNone);
}

TEST_F(LocalSecretTest, OnlyARegularFile) {
    ASSERT_EQ(mkfifo(known.file("fifo").c_str(), 0600), 0);
    mkdir(known.file("directory").c_str(), 0700);
    EXPECT_EQ(secretIn(known.file("fifo")), kNone);
    EXPECT_EQ(secretIn(known.file("directory")), kNone);
    EXPECT_EQ(secretIn(known.file("missing")), kNone);
}

TEST_F(LocalSecretTest, OnlyAFileOfATrustedOwner) {
    if (geteuid() != 0) {
        GTEST_SKIP() << "only root can give a file away";
    }
    constexpr uid_t kStranger = 12345;
    writeFile(known.file("s"), "secret");
    ASSERT_EQ(chown(known.file("s").c_str(), kStranger, kStranger), 0);
    EXPECT_EQ(secretIn(known.file("s")), kNone);
    EXPECT_EQ(readLocalSecret(known.file("s"), {known.path()}, kStranger), "secret");
}

TEST_F(LocalSecretTest, NoMoreThanFourKibibytes) {
    writeFile(known.file("full"), std::string(4096, 'x'));
    writeFile(known.file("over"), std::string(4097, 'x'));
    EXPECT_EQ(secretIn(known.file("full")), std::string(4096, 'x'));
    EXPECT_EQ(secretIn(known.file("over")), kNone);
}

TEST_F(LocalSecretTest, OnlyTextThatFitsIntoAHeader) {
    for (const std::string& content :
         {std::string(""), std::string("\n"), std::string("a\"b"), std::string("a\tb"),
          std::string("a\0b", 3), std::string("a\xC3\xA9")}) {
        writeFile(known.file("s"), content);
        EXPECT_EQ(secretIn(known.file("s")), kNone) << content;
    }
}

}  // namespace
}  // namespace Pegasus
