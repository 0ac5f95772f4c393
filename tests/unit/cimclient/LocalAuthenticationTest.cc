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
    writeFile(known.path("s"), "abc\ndef\r\n123");
    EXPECT_EQ(secretIn(known.path("s")), "abcdef123");
}

TEST_F(LocalSecretTest, OnlyAFileDirectlyInAKnownDirectory) {
    writeFile(other.path("s"), "secret");
    mkdir(known.path("sub").c_str(), 0700);
    writeFile(known.path("sub/s"), "secret");
    writeFile(known.path("s"), "secret");
    const std::string parent = known.path().substr(0, known.path().rfind('/'));
    const std::string last = known.path().substr(known.path().rfind('/') + 1);
    for (const std::string& file :
         {other.path("s"), known.path("sub/s"), known.path("../" + last + "/s"), known.path("./s"),
          known.path("/s"), "/" + known.path() + "/s", parent + "/./" + last + "/s",
          known.path("sub/../s"), known.path(), known.path() + "/", known.path("."),
          known.path(".."), std::string("s"), std::string(""), std::string("/"),
          std::string("/etc/passwd")}) {
        EXPECT_EQ(secretIn(file), kNone) << file;
    }
}

TEST_F(LocalSecretTest, NoSymbolicLinkNorSecondName) {
    writeFile(other.path("s"), "secret");
    ASSERT_EQ(symlink(other.path("s").c_str(), known.path("soft").c_str()), 0);
    ASSERT_EQ(link(other.path("s").c_str(), known.path("hard").c_str()), 0);
    EXPECT_EQ(secretIn(known.path("soft")), kNone);
    EXPECT_EQ(secretIn(known.path("hard")), kNone);
}

TEST_F(LocalSecretTest, OnlyARegularFile) {
    ASSERT_EQ(mkfifo(known.path("fifo").c_str(), 0600), 0);
    mkdir(known.path("directory").c_str(), 0700);
    EXPECT_EQ(secretIn(known.path("fifo")), kNone);
    EXPECT_EQ(secretIn(known.path("directory")), kNone);
    EXPECT_EQ(secretIn(known.path("missing")), kNone);
}

TEST_F(LocalSecretTest, OnlyAFileOfATrustedOwner) {
    if (geteuid() != 0) {
        GTEST_SKIP() << "only root can give a file away";
    }
    constexpr uid_t kStranger = 12345;
    writeFile(known.path("s"), "secret");
    ASSERT_EQ(chown(known.path("s").c_str(), kStranger, kStranger), 0);
    EXPECT_EQ(secretIn(known.path("s")), kNone);
    EXPECT_EQ(readLocalSecret(known.path("s"), {known.path()}, kStranger), "secret");
}

TEST_F(LocalSecretTest, NoMoreThanFourKibibytes) {
    writeFile(known.path("full"), std::string(4096, 'x'));
    writeFile(known.path("over"), std::string(4097, 'x'));
    EXPECT_EQ(secretIn(known.path("full")), std::string(4096, 'x'));
    EXPECT_EQ(secretIn(known.path("over")), kNone);
}

TEST_F(LocalSecretTest, OnlyTextThatFitsIntoAHeader) {
    for (const std::string& content :
         {std::string(""), std::string("\n"), std::string("a\"b"), std::string("a\tb"),
          std::string("a\0b", 3), std::string("a\xC3\xA9")}) {
        writeFile(known.path("s"), content);
        EXPECT_EQ(secretIn(known.path("s")), kNone) << content;
    }
}

}  // namespace
}  // namespace Pegasus
