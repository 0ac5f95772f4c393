#include "system/software/OsRelease.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(OsRelease, readsAnOrdinaryFile) {
    const OsRelease release = parseOsRelease(
        "PRETTY_NAME=\"Debian GNU/Linux 12 (bookworm)\"\nNAME=\"Debian GNU/Linux\"\n"
        "VERSION_ID=\"12\"\nVERSION=\"12 (bookworm)\"\nID=debian\n");
    EXPECT_EQ(release.prettyName, "Debian GNU/Linux 12 (bookworm)");
    EXPECT_EQ(release.name, "Debian GNU/Linux");
    EXPECT_EQ(release.versionId, "12");
    EXPECT_EQ(release.id, "debian");
}

TEST(OsRelease, undoesTheShellsQuoting) {
    EXPECT_EQ(parseOsRelease("NAME=\"A \\\"B\\\" \\$C \\\\ \\`\"").name, "A \"B\" $C \\ `");
    EXPECT_EQ(parseOsRelease("NAME='A \\ \"B\"'").name, "A \\ \"B\"");
    EXPECT_EQ(parseOsRelease("NAME=A\\ B").name, "A B");
    EXPECT_EQ(parseOsRelease("NAME=\"open").name, "open");
    EXPECT_EQ(parseOsRelease("NAME=end\\").name, "end\\");
}

TEST(OsRelease, takesTheLastOfEqualKeysAndDropsOtherLines) {
    const OsRelease release = parseOsRelease("# ID=no\nID=one\n\nnonsense\nID=two\r\nNAME=\n");
    EXPECT_EQ(release.id, "two");
    EXPECT_EQ(release.name, std::nullopt);
    EXPECT_EQ(release.versionId, std::nullopt);
}

}  // namespace
}  // namespace cimomd
