#include "client/WireText.h"

#include <gtest/gtest.h>

#include "TestConnections.h"

namespace Pegasus {
namespace {

using testing_client::text;

TEST(WireTextTest, PercentEncodesAllButUnreservedCharacters) {
    EXPECT_EQ(percentEncoded("root/cimv2"), "root%2Fcimv2");
    EXPECT_EQ(percentEncoded("aZ09-._~"), "aZ09-._~");
    EXPECT_EQ(percentEncoded("a b\r\n%"), "a%20b%0D%0A%25");
    EXPECT_EQ(percentEncoded("\xC3\xA9"), "%C3%A9");
    EXPECT_EQ(percentEncoded(""), "");
}

TEST(WireTextTest, PercentDecodesBothCasesOfHexDigits) {
    EXPECT_EQ(percentDecoded("CIM_ERR_NOT_FOUND%3A%20X"), "CIM_ERR_NOT_FOUND: X");
    EXPECT_EQ(percentDecoded("%3a%2f"), ":/");
}

TEST(WireTextTest, KeepsPercentSignsThatEncodeNothing) {
    EXPECT_EQ(percentDecoded("100%"), "100%");
    EXPECT_EQ(percentDecoded("%4"), "%4");
    EXPECT_EQ(percentDecoded("%zz%41"), "%zzA");
    EXPECT_EQ(percentDecoded("%%41"), "%A");
}

TEST(WireTextTest, MakesTextPrintable) {
    EXPECT_EQ(text(printableText("plain")), "plain");
    EXPECT_EQ(text(printableText("a\x1B[2J\nb\x7F")), "a [2J b ");
    EXPECT_EQ(text(printableText(std::string_view("a\0b", 3))), "a b");
    EXPECT_EQ(text(printableText("\xC3\xA9")), "\xC3\xA9");
    EXPECT_EQ(text(printableText("\xC3(\xFF")), "?(?");
}

TEST(WireTextTest, ComparesAsciiLettersOnly) {
    EXPECT_TRUE(equalIgnoringCase("Content-TYPE", "content-type"));
    EXPECT_FALSE(equalIgnoringCase("Content-Typ", "content-type"));
    EXPECT_FALSE(equalIgnoringCase("@", "`"));
}

TEST(WireTextTest, TrimsBlanksAndTabs) {
    EXPECT_EQ(trimmed(" \ta b\t "), "a b");
    EXPECT_EQ(trimmed("  "), "");
    EXPECT_EQ(trimmed(""), "");
}

}  // namespace
}  // namespace Pegasus
