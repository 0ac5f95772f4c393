#include "utf8/Utf8.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <string_view>

namespace {

std::string replacements(int count) {
    std::string text;
    for (int i = 0; i < count; ++i) {
        text += "\xEF\xBF\xBD";
    }
    return text;
}

struct CharacterCase {
    std::string_view bytes;
    char32_t code;
};

// The first and the last character of each length, and those beside the surrogates.
constexpr std::array<CharacterCase, 10> kCharacters = {{
    {std::string_view("\0", 1), 0},
    {"\x7F", 0x7F},
    {"\xC2\x80", 0x80},
    {"\xDF\xBF", 0x7FF},
    {"\xE0\xA0\x80", 0x800},
    {"\xED\x9F\xBF", 0xD7FF},
    {"\xEE\x80\x80", 0xE000},
    {"\xEF\xBF\xBF", 0xFFFF},
    {"\xF0\x90\x80\x80", 0x10000},
    {"\xF4\x8F\xBF\xBF", 0x10FFFF},
}};

constexpr std::array<std::string_view, 12> kNoCharacters = {"\x80",
                                                            "\xBF",
                                                            "\xC0\x80",
                                                            "\xC1\xBF",
                                                            "\xC3(",
                                                            "\xE0\x9F\xBF",
                                                            "\xED\xA0\x80",
                                                            "\xE2\x82(",
                                                            "\xF0\x8F\xBF\xBF",
                                                            "\xF4\x90\x80\x80",
                                                            "\xF8\x88\x80\x80\x80",
                                                            "\xF0\x9F\x98z"};

TEST(Utf8, KnowsCharactersOfEveryLength) {
    for (const CharacterCase& test : kCharacters) {
        SCOPED_TRACE(static_cast<unsigned>(test.code));
        const std::string bytes = std::string(test.bytes) + "z";
        EXPECT_EQ(utf8::characterLength(test.bytes), test.bytes.size());
        EXPECT_EQ(utf8::characterLength(bytes), test.bytes.size());
        EXPECT_EQ(utf8::decode(bytes, test.bytes.size()), test.code);
        EXPECT_FALSE(utf8::isCutCharacter(bytes));
    }
}

TEST(Utf8, WritesCharactersOfEveryLength) {
    for (const CharacterCase& test : kCharacters) {
        SCOPED_TRACE(static_cast<unsigned>(test.code));
        std::string out = "a";
        utf8::append(out, test.code);
        EXPECT_EQ(out, "a" + std::string(test.bytes));
    }
}

TEST(Utf8, WritesWhatIsNoCharacterAsReplacement) {
    std::string out;
    utf8::append(out, 0xD800);
    utf8::append(out, 0xDFFF);
    utf8::append(out, 0x110000);
    EXPECT_EQ(out, replacements(3));
}

TEST(Utf8, RefusesWhatIsNoCharacter) {
    for (const std::string_view bytes : kNoCharacters) {
        EXPECT_EQ(utf8::characterLength(bytes), 0U) << bytes;
        EXPECT_FALSE(utf8::isCutCharacter(bytes)) << bytes;
    }
}

TEST(Utf8, TellsACutCharacterFromAWrongOne) {
    for (const std::string_view bytes : {"\xC3", "\xE2", "\xE2\x82", "\xF0\x9F\x98"}) {
        EXPECT_TRUE(utf8::isCutCharacter(bytes)) << bytes;
        EXPECT_EQ(utf8::characterLength(bytes), 0U) << bytes;
    }
    EXPECT_FALSE(utf8::isCutCharacter("\xE0\x9F"));
    EXPECT_FALSE(utf8::isCutCharacter("\xF0\x9F("));
    EXPECT_FALSE(utf8::isCutCharacter("\xFF"));
    EXPECT_FALSE(utf8::isCutCharacter("a"));
}

TEST(Utf8, JoinsSurrogates) {
    EXPECT_EQ(utf8::joinSurrogates(0xD800, 0xDC00), 0x10000U);
    EXPECT_EQ(utf8::joinSurrogates(0xD83D, 0xDE00), 0x1F600U);
    EXPECT_EQ(utf8::joinSurrogates(0xDBFF, 0xDFFF), 0x10FFFFU);
    EXPECT_TRUE(utf8::isHighSurrogate(0xDBFF));
    EXPECT_FALSE(utf8::isHighSurrogate(0xDC00));
    EXPECT_TRUE(utf8::isLowSurrogate(0xDFFF));
    EXPECT_FALSE(utf8::isLowSurrogate(0xE000));
}

TEST(Utf8, CleanKeepsWellFormedText) {
    const std::string text = "a \xC3\xA9 \xE2\x82\xAC \xF0\x9F\x98\x80 \t\n\r\x01";
    EXPECT_EQ(utf8::clean(text), text);
    EXPECT_EQ(utf8::clean(""), "");
}

TEST(Utf8, CleanReplacesEveryByteThatIsNoCharacter) {
    EXPECT_EQ(utf8::clean("\xE9"), replacements(1));
    EXPECT_EQ(utf8::clean("\xC0\x80"), replacements(2));
    EXPECT_EQ(utf8::clean("\xED\xA0\x80"), replacements(3));
    EXPECT_EQ(utf8::clean("\xF4\x90\x80\x80"), replacements(4));
    EXPECT_EQ(utf8::clean("\xE2\x82"), replacements(2));
    EXPECT_EQ(utf8::clean("\xC3z"), replacements(1) + "z");
    EXPECT_EQ(utf8::clean("\xFF\xC3\xA9"), replacements(1) + "\xC3\xA9");
}

}  // namespace
