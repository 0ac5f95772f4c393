#include "velmclient/CharacterConversion.h"

#include <gtest/gtest.h>

#include <string>

namespace Velm {
namespace {

TEST(CharacterConversion, Latin1) {
    EXPECT_EQ(toUtf8("gr\xF6\xDF"
                     "er",
                     "ISO-8859-1"),
              "gr\xC3\xB6\xC3\x9F"
              "er");
    EXPECT_EQ(toUtf8("", "ISO-8859-1"), "");
}

TEST(CharacterConversion, Utf8IsCopied) {
    EXPECT_EQ(toUtf8("\xC3\xB6 \xFF \xC3", "UTF-8"), "\xC3\xB6 \xFF \xC3");
}

TEST(CharacterConversion, BytesOutsideAsciiAreKept) {
    EXPECT_EQ(toUtf8("a\xC3\xB6"
                     "b\xFF",
                     "ANSI_X3.4-1968"),
              "a\xC3\xB6"
              "b\xFF");
}

TEST(CharacterConversion, AnUnknownCharacterSetKeepsTheBytes) {
    EXPECT_EQ(toUtf8("a\xE9", "no-such-charset"), "a\xE9");
}

TEST(CharacterConversion, OnlyWhatCannotBeConvertedIsKept) {
    // 0xFF starts nothing in EUC-JP; A4 A2 is U+3042; a lone A4 at the end is half a letter.
    EXPECT_EQ(toUtf8("\xA4\xA2\xFF"
                     "a\xA4\xA2\xA4",
                     "EUC-JP"),
              "\xE3\x81\x82\xFF"
              "a\xE3\x81\x82\xA4");
}

TEST(CharacterConversion, ALetterHeldBackForACombiningMarkIsNotLost) {
    EXPECT_EQ(toUtf8("\xE0", "CP1255"), "\xD7\x90");
    EXPECT_EQ(toUtf8("\xE0\xE1", "CP1255"), "\xD7\x90\xD7\x91");
}

TEST(CharacterConversion, LongTextsAreConvertedWhole) {
    std::string expected;
    for (int i = 0; i < 100000; ++i) {
        expected += "\xC3\xA9";
    }
    EXPECT_EQ(toUtf8(std::string(100000, '\xE9'), "ISO-8859-1"), expected);
}

}  // namespace
}  // namespace Velm
