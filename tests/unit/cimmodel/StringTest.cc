#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>
#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <thread>
#include <vector>

namespace Pegasus {
namespace {

std::vector<Uint16> codesOf(const String& text) {
    return {text.getChar16Data(), text.getChar16Data() + text.size()};
}

std::string utf8Of(const String& text) {
    return static_cast<const char*>(text.getCString());
}

TEST(StringTest, StartsEmpty) {
    const String text;
    EXPECT_EQ(text.size(), 0U);
    EXPECT_EQ(text.getChar16Data()[0], 0);
    EXPECT_EQ(utf8Of(text), "");
    EXPECT_EQ(text, String::EMPTY);
}

TEST(StringTest, ReadsUtf8OfEveryLength) {
    EXPECT_EQ(codesOf("A\x7F"), (std::vector<Uint16>{0x41, 0x7F}));
    EXPECT_EQ(codesOf("\xC2\x80\xDF\xBF"), (std::vector<Uint16>{0x80, 0x7FF}));
    EXPECT_EQ(codesOf("\xE0\xA0\x80\xEF\xBF\xBF"), (std::vector<Uint16>{0x800, 0xFFFF}));
    EXPECT_EQ(codesOf("\xED\x9F\xBF\xEE\x80\x80"), (std::vector<Uint16>{0xD7FF, 0xE000}));
    EXPECT_EQ(codesOf("\xF0\x90\x80\x80"), (std::vector<Uint16>{0xD800, 0xDC00}));
    EXPECT_EQ(codesOf("\xF4\x8F\xBF\xBF"), (std::vector<Uint16>{0xDBFF, 0xDFFF}));
    EXPECT_EQ(codesOf("longer than eight \xC3\xA4").back(), 0xE4);
}

TEST(StringTest, RefusesBytesThatAreNotUtf8) {
    const char* const refused[] = {
        "\x80",              // a continuation without a lead
        "\xC0\x80",          // NUL in two bytes
        "\xC1\xBF",          // ASCII in two bytes
        "\xE0\x9F\xBF",      // two bytes' worth in three
        "\xF0\x8F\xBF\xBF",  // three bytes' worth in four
        "\xED\xA0\x80",      // the first surrogate
        "\xED\xBF\xBF",      // the last surrogate
        "\xF4\x90\x80\x80",  // above U+10FFFF
        "\xF5\x80\x80\x80",
        "\xFF",
        "\xC3",              // cut after the first byte
        "\xE2\x82",          // cut after the second
        "\xF0\x9F\x98",      // cut after the third
        "\xC3(",             // a lead without a continuation
        "twelve ASCII\xFE",  // found behind whole words of ASCII
    };
    for (const char* bytes : refused)
        EXPECT_THROW(String{bytes}, Exception) << bytes;
}

TEST(StringTest, TellsWhereTheBadByteIs) {
    try {
        String("abc\xFFxyz");
        FAIL();
    } catch (const Exception& error) {
        EXPECT_NE(error.getMessage().find("offset 3 of 7"), PEG_NOT_FOUND) << error.getMessage();
    }
}

TEST(StringTest, RefusesNullPointers) {
    EXPECT_THROW(String(static_cast<const char*>(nullptr)), Exception);
    EXPECT_THROW(String(static_cast<const Char16*>(nullptr)), Exception);
}

TEST(StringTest, TakesAPartOfItsSource) {
    const Char16 characters[] = {'x', 'y', 'z', 0};
    EXPECT_EQ(String(characters), "xyz");
    EXPECT_EQ(String(characters, 2), "xy");
    EXPECT_EQ(String("abcd", 3), "abc");
    EXPECT_EQ(String("a\0b", 3).size(), 3U);
    EXPECT_EQ(String(String("abcd"), 2), "ab");
    EXPECT_EQ(String(String("abcd"), 9), "abcd");
    EXPECT_THROW(String("\xC3\xA4", 1), Exception);
}

TEST(StringTest, WritesUtf8) {
    const Char16 pair[] = {0xD83D, 0xDE00};
    EXPECT_EQ(utf8Of(String(pair, 2)), "\xF0\x9F\x98\x80");
    const Char16 others[] = {'a', 0xE9, 0x20AC};
    EXPECT_EQ(utf8Of(String(others, 3)), "a\xC3\xA9\xE2\x82\xAC");
}

TEST(StringTest, WritesReplacementsForLoneSurrogates) {
    const Char16 high[] = {0xD800, 'a'};
    EXPECT_EQ(utf8Of(String(high, 2)),
              "\xEF\xBF\xBD"
              "a");
    const Char16 low[] = {0xDC00};
    EXPECT_EQ(utf8Of(String(low, 1)), "\xEF\xBF\xBD");
    const Char16 reversed[] = {0xDC00, 0xD800};
    EXPECT_EQ(utf8Of(String(reversed, 2)), "\xEF\xBF\xBD\xEF\xBF\xBD");
    const Char16 highThenPair[] = {0xD800, 0xD83D, 0xDE00};
    EXPECT_EQ(utf8Of(String(highThenPair, 3)), "\xEF\xBF\xBD\xF0\x9F\x98\x80");
}

TEST(StringTest, GivesBytesThatOutliveIt) {
    CString kept;
    {
        const String text("kept");
        kept = text.getCString();
    }
    const CString copy = kept;
    EXPECT_STREQ(copy, "kept");
}

TEST(StringTest, IndexesUpToTheNul) {
    String text("ab");
    const String& constText = text;
    EXPECT_EQ(text[1], 'b');
    EXPECT_EQ(text[2], 0);
    EXPECT_EQ(constText[2], 0);
    EXPECT_THROW(text[3], IndexOutOfBoundsException);
    EXPECT_THROW(constText[3], IndexOutOfBoundsException);
    EXPECT_THROW(String()[1], IndexOutOfBoundsException);
    EXPECT_EQ(String()[0], 0);
}

TEST(StringTest, ChangesOneCopyOnly) {
    String first("abc");
    String second = first;
    second[0] = 'x';
    EXPECT_EQ(first, "abc");
    EXPECT_EQ(second, "xbc");
    String third = first;
    third.append("d");
    String fourth = first;
    fourth.remove(0, 2);
    String fifth = first;
    fifth.toUpper();
    EXPECT_EQ(first, "abc");
    EXPECT_EQ(third, "abcd");
    EXPECT_EQ(fourth, "c");
    EXPECT_EQ(fifth, "ABC");
}

TEST(StringTest, AssignsItselfAndAppendsItself) {
    String text("abc");
    const String& alias = text;
    text = alias;
    EXPECT_EQ(text, "abc");
    text.append(text);
    EXPECT_EQ(text, "abcabc");
    text.append(text.getChar16Data() + 4, 2);
    EXPECT_EQ(text, "abcabcbc");
    text.assign(text.getChar16Data() + 1, 2);
    EXPECT_EQ(text, "bc");
}

TEST(StringTest, AppendsAndKeepsItsRoom) {
    String text;
    text.reserveCapacity(100);
    const Char16* const before = text.getChar16Data();
    for (int i = 0; i < 50; ++i)
        text.append('-').append(Char16('>'));
    EXPECT_EQ(text.getChar16Data(), before);
    EXPECT_EQ(text.size(), 100U);
    text.append("end").append(String());
    EXPECT_EQ(text.subString(98), "->end");
}

TEST(StringTest, AppendsManyCharacters) {
    String text;
    for (Uint32 i = 0; i < 100000; ++i)
        text.append(static_cast<Uint16>('a' + i % 26));
    EXPECT_EQ(text.size(), 100000U);
    EXPECT_EQ(text[99999], 'd');
}

TEST(StringTest, MovesFrom) {
    String first("abc");
    const String second = std::move(first);
    EXPECT_EQ(second, "abc");
    first = "new";
    EXPECT_EQ(first, "new");
}

TEST(StringTest, Removes) {
    String text("abcdef");
    text.remove(1, 2);
    EXPECT_EQ(text, "adef");
    text.remove(2);
    EXPECT_EQ(text, "ad");
    text.remove(2);
    text.remove(2, 0);
    EXPECT_EQ(text, "ad");
    EXPECT_THROW(text.remove(3), IndexOutOfBoundsException);
    EXPECT_THROW(text.remove(3, 0), IndexOutOfBoundsException);
    EXPECT_THROW(text.remove(1, 2), IndexOutOfBoundsException);
    EXPECT_THROW(text.remove(1, 0xFFFFFFFE), IndexOutOfBoundsException);
    EXPECT_EQ(text, "ad");
}

TEST(StringTest, GivesSubStrings) {
    const String text("abcdef");
    EXPECT_EQ(text.subString(2), "cdef");
    EXPECT_EQ(text.subString(2, 3), "cde");
    EXPECT_EQ(text.subString(4, 100), "ef");
    EXPECT_EQ(text.subString(0), "abcdef");
    EXPECT_EQ(text.subString(3, 0), "");
    EXPECT_EQ(text.subString(6), "");
    EXPECT_EQ(text.subString(7, 2), "");
}

TEST(StringTest, Finds) {
    const String text("abcabc");
    EXPECT_EQ(text.find('b'), 1U);
    EXPECT_EQ(text.find(2, 'b'), 4U);
    EXPECT_EQ(text.find(5, Char16('b')), PEG_NOT_FOUND);
    EXPECT_EQ(text.find(6, 'b'), PEG_NOT_FOUND);
    EXPECT_EQ(text.find(7, 'b'), PEG_NOT_FOUND);
    EXPECT_EQ(text.find(Char16('x')), PEG_NOT_FOUND);
    EXPECT_EQ(text.reverseFind('b'), 4U);
    EXPECT_EQ(text.reverseFind(Char16('a')), 3U);
    EXPECT_EQ(text.reverseFind('x'), PEG_NOT_FOUND);
    EXPECT_EQ(String().reverseFind('x'), PEG_NOT_FOUND);
    EXPECT_EQ(text.find("ca"), 2U);
    EXPECT_EQ(text.find("cb"), PEG_NOT_FOUND);
    EXPECT_EQ(text.find("abcabcd"), PEG_NOT_FOUND);
    EXPECT_EQ(text.find(""), 0U);
    EXPECT_EQ(String().find("a"), PEG_NOT_FOUND);
}

TEST(StringTest, ChangesTheCaseOfAsciiLetters) {
    String text("@AZ[`az{\xC3\x84");
    text.toLower();
    EXPECT_EQ(utf8Of(text), "@az[`az{\xC3\x84");
    text.toUpper();
    EXPECT_EQ(utf8Of(text), "@AZ[`AZ{\xC3\x84");
    String empty;
    empty.toLower();
    empty.toUpper();
    EXPECT_EQ(empty, "");
}

TEST(StringTest, ComparesByTheFirstDifference) {
    EXPECT_EQ(String::compare("a", "c"), -2);
    EXPECT_EQ(String::compare("xc", "xa"), 2);
    EXPECT_EQ(String::compare("abc", "abc"), 0);
    EXPECT_LT(String::compare("ab", "abc"), 0);
    EXPECT_GT(String::compare("abc", "ab"), 0);
    EXPECT_LT(String::compare("", "a"), 0);
    EXPECT_EQ(String::compare("a", "\xE2\x82\xAC"), 0x61 - 0x20AC);
    EXPECT_EQ(String::compare("abx", "aby", 2), 0);
    EXPECT_EQ(String::compare("abx", "aby", 3), -1);
    EXPECT_EQ(String::compare("ab", "abc", 2), 0);
    EXPECT_LT(String::compare("ab", "abc", 3), 0);
    EXPECT_EQ(String::compare("a", "b", 0), 0);
}

TEST(StringTest, ComparesIgnoringCase) {
    EXPECT_EQ(String::compareNoCase("ABC", "abc"), 0);
    EXPECT_EQ(String::compareNoCase("A", "c"), -2);
    EXPECT_EQ(String::compareNoCase("ABx", "aby", 2), 0);
    EXPECT_GT(String::compareNoCase("AB", "a"), 0);
    EXPECT_TRUE(String::equalNoCase("CIM_Process", "cim_PROCESS"));
    EXPECT_FALSE(String::equalNoCase("a", "ab"));
    EXPECT_FALSE(String::equalNoCase("\xC3\x84", "\xC3\xA4"));
    EXPECT_FALSE(String::equal("A", "a"));
}

TEST(StringTest, HasOperators) {
    const String text("b");
    EXPECT_TRUE(text == "b");
    EXPECT_TRUE("b" == text);
    EXPECT_TRUE(text != "a");
    EXPECT_TRUE(String("a") < text);
    EXPECT_FALSE(text < text);
    EXPECT_EQ("a" + text + "c", "abc");
    EXPECT_EQ(String() + String(), "");
    std::ostringstream out;
    out << String("\xE2\x82\xAC") << String("x");
    EXPECT_EQ(out.str(),
              "\xE2\x82\xAC"
              "x");
}

TEST(StringTest, ClearsWithoutTouchingCopies) {
    String text("abc");
    const String copy = text;
    text.clear();
    EXPECT_EQ(text.size(), 0U);
    EXPECT_EQ(copy, "abc");
}

TEST(StringTest, MayBeCopiedFromSeveralThreads) {
    const String shared("shared between the threads");
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i)
        threads.emplace_back([own = shared] {
            for (int round = 0; round < 10000; ++round) {
                String copy = own;
                copy[0] = 'S';
                EXPECT_EQ(copy[0], 'S');
            }
        });
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(shared, "shared between the threads");
}

TEST(Char16Test, ConvertsFromAndToItsCode) {
    const Char16 character(0x20AC);
    const Uint16 code = character;
    EXPECT_EQ(code, 0x20AC);
    EXPECT_EQ(Char16(), 0);
    EXPECT_TRUE(Char16('x') == 'x');
    EXPECT_TRUE(Char16('x') != Char16('y'));
}

}  // namespace
}  // namespace Pegasus
