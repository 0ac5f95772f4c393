#include "text/Utf8.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

constexpr const char* kReplaced = "\xEF\xBF\xBD";

TEST(Utf8, keepsWellFormedText) {
    const std::string text = "a \xC3\xA9 \xE2\x82\xAC \xF0\x9F\x98\x80 \t\n\r";
    EXPECT_EQ(cleanText(text), text);
}

TEST(Utf8, replacesControlCharactersAndBytesThatAreNoCharacter) {
    EXPECT_EQ(cleanText(std::string_view("a\0b\x1F\x7F", 5)),
              std::string("a") + kReplaced + "b" + kReplaced + kReplaced);
    EXPECT_EQ(cleanText("\xE2\x82"), std::string(kReplaced) + kReplaced);
}

TEST(Utf8, cutsBetweenCharacters) {
    EXPECT_EQ(firstCharacters("abc", 2), "ab");
    EXPECT_EQ(firstCharacters("abc", 3), "abc");
    EXPECT_EQ(firstCharacters("\xC3\xA9\xC3\xA9", 1), "\xC3\xA9");
    // Outside the basic plane a character takes two of the 16-bit units that MaxLen counts.
    EXPECT_EQ(firstCharacters("\xF0\x9F\x98\x80z", 1), "");
    EXPECT_EQ(firstCharacters("\xF0\x9F\x98\x80z", 2), "\xF0\x9F\x98\x80");
}

TEST(Utf8, comparesAndTrims) {
    EXPECT_TRUE(equalsIgnoringCase("Root/CIMV2", "root/cimv2"));
    EXPECT_FALSE(equalsIgnoringCase("a", "ab"));
    EXPECT_FALSE(equalsIgnoringCase("[", "{"));
    EXPECT_EQ(trimmed(std::string_view(" \ta b\0\n", 7)), "a b");
    EXPECT_EQ(trimmed(" \n"), "");
}

}  // namespace
}  // namespace cimomd
