#include "report/Text.h"

#include <gtest/gtest.h>

namespace sennetctl {
namespace {

TEST(TextTest, NothingThatMovesACursorIsPrinted) {
    EXPECT_EQ(printable("a\x1B[2Jb\r\nc\td\x7F"), "a [2Jb  c d ");
    EXPECT_EQ(printable("a\xC2\x9B"
                        "2Jb"),
              "a 2Jb");
    EXPECT_EQ(printable("caf\xC3\xA9"), "caf\xC3\xA9");
    EXPECT_EQ(printable("caf\xE9"), "caf\xEF\xBF\xBD");
}

// Texts of a MIF file may be megabytes long: taking out each by itself never came to an end.
TEST(TextTest, ManyControlCharactersTakeNoLongerThanOthers) {
    constexpr std::size_t kMany = 2000000;
    std::string text;
    for (std::size_t i = 0; i < kMany; ++i) {
        text += "\xC2\x85";
    }
    EXPECT_EQ(printable(text), std::string(kMany, ' '));
}

TEST(TextTest, WidthCountsCharacters) {
    EXPECT_EQ(widthOf(""), 0U);
    EXPECT_EQ(widthOf("caf\xC3\xA9"), 4U);
}

TEST(TextTest, CutsBetweenCharacters) {
    EXPECT_EQ(shortened("abcd", 4), "abcd");
    EXPECT_EQ(shortened("abcde", 4), "abc\xE2\x80\xA6");
    EXPECT_EQ(shortened("\xC3\xA9\xC3\xA9\xC3\xA9", 2), "\xC3\xA9\xE2\x80\xA6");
    EXPECT_EQ(shortened("abcde", 0), "abcde");
}

TEST(TextTest, ReadsLatin1) {
    EXPECT_EQ(fromLatin1("M\xFCller"), "M\xC3\xBCller");
}

TEST(TextTest, CountsInWords) {
    EXPECT_EQ(counted(0, "row"), "0 rows");
    EXPECT_EQ(counted(1, "row"), "1 row");
    EXPECT_EQ(counted(2, "row"), "2 rows");
}

}  // namespace
}  // namespace sennetctl
