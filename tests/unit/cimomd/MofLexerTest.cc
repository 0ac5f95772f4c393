#include "mof/MofLexer.h"

#include <gtest/gtest.h>

#include <vector>

namespace cimomd {
namespace {

std::vector<MofToken> tokensOf(std::string_view text, MofErrorLog& log) {
    MofLexer lexer(text, "t.mof", log);
    std::vector<MofToken> tokens;
    for (MofToken token = lexer.next(); token.kind != MofTokenKind::End; token = lexer.next())
        tokens.push_back(token);
    return tokens;
}

std::vector<MofToken> tokensOf(std::string_view text) {
    MofErrorLog log;
    std::vector<MofToken> tokens = tokensOf(text, log);
    log.raiseIfAny();
    return tokens;
}

std::string errorOf(std::string_view text) {
    try {
        tokensOf(text);
    } catch (const MofErrors& error) {
        return error.what();
    }
    return "no error";
}

TEST(MofLexer, dropsCommentsAndBlanksAndCountsPlacesInCharacters) {
    const auto tokens = tokensOf("\xEF\xBB\xBF// one\n/* t\xC3\xB6o\n */ a\t{\r\n\xC3\xA9t b");
    ASSERT_EQ(tokens.size(), 4U);
    EXPECT_EQ(tokens[0].text, "a");
    EXPECT_EQ(tokens[0].position.line, 3U);
    EXPECT_EQ(tokens[0].position.column, 5U);
    EXPECT_EQ(tokens[1].text, "{");
    EXPECT_EQ(tokens[1].position.column, 7U);
    EXPECT_EQ(tokens[2].text, "\xC3\xA9t");
    EXPECT_EQ(tokens[3].position.line, 4U);
    EXPECT_EQ(tokens[3].position.column, 4U);
}

TEST(MofLexer, staysAtTheEnd) {
    MofErrorLog log;
    MofLexer lexer("", "t.mof", log);
    EXPECT_EQ(lexer.next().kind, MofTokenKind::End);
    EXPECT_EQ(lexer.next().kind, MofTokenKind::End);
}

TEST(MofLexer, readsAliases) {
    const auto tokens = tokensOf("as $Disk_1;");
    ASSERT_EQ(tokens.size(), 3U);
    EXPECT_EQ(tokens[1].kind, MofTokenKind::Alias);
    EXPECT_EQ(tokens[1].characters, "Disk_1");
    EXPECT_EQ(tokens[1].text, "$Disk_1");
    EXPECT_EQ(errorOf("$1"), "t.mof:1:1: found '$', expected a declaration");
}

TEST(MofLexer, takesAnyBytesInComments) {
    EXPECT_EQ(tokensOf("a // \xE9\x01 \"\n /* \xFF\xC3 ' // * / */ b").size(), 2U);
}

TEST(MofLexer, goesOnAfterAMistake) {
    MofErrorLog log;
    const auto tokens = tokensOf("a @ \"b\\q\" #if c\n 08 'd", log);
    EXPECT_EQ(log.count(), 5U);
    ASSERT_EQ(tokens.size(), 4U);
    EXPECT_EQ(tokens[1].characters, "bq");
    EXPECT_EQ(tokens[2].kind, MofTokenKind::Integer);
    EXPECT_EQ(tokens[3].characters, "d");
}

TEST(MofLexer, takesTheMarksAfterAForgottenQuoteForMarks) {
    MofErrorLog log;
    const auto tokens = tokensOf("\"abc\xC3\xA9) ];\nd", log);
    EXPECT_EQ(log.count(), 1U);
    ASSERT_EQ(tokens.size(), 5U);
    EXPECT_EQ(tokens[0].kind, MofTokenKind::String);
    EXPECT_EQ(tokens[1].text, ")");
    EXPECT_EQ(tokens[1].position.column, 6U);
    EXPECT_EQ(tokens[3].text, ";");
    EXPECT_EQ(tokens[4].position.line, 2U);
}

TEST(MofLexer, readsEveryKindOfInteger) {
    struct Case {
        const char* text;
        bool negative;
        std::uint64_t magnitude;
    };
    const std::vector<Case> cases{
        {"0", false, 0},      {"+12", false, 12},
        {"-12", true, 12},    {"017", false, 15},
        {"00", false, 0},     {"101b", false, 5},
        {"-11B", true, 3},    {"0x1F", false, 31},
        {"0XaB", false, 171}, {"0x1b", false, 27},
        {"10", false, 10},    {"18446744073709551615", false, 18446744073709551615U}};
    for (const Case& expected : cases) {
        const auto tokens = tokensOf(expected.text);
        ASSERT_EQ(tokens.size(), 1U) << expected.text;
        EXPECT_EQ(tokens[0].kind, MofTokenKind::Integer) << expected.text;
        EXPECT_EQ(tokens[0].negative, expected.negative) << expected.text;
        EXPECT_EQ(tokens[0].magnitude, expected.magnitude) << expected.text;
    }
}

TEST(MofLexer, readsReals) {
    struct Case {
        const char* text;
        double value;
    };
    for (const Case& expected : std::vector<Case>{
             {"1.5", 1.5}, {".25", 0.25}, {"-2.0", -2.0}, {"+1.5e2", 150.0}, {"1.5E-1", 0.15}}) {
        const auto tokens = tokensOf(expected.text);
        ASSERT_EQ(tokens.size(), 1U) << expected.text;
        EXPECT_EQ(tokens[0].kind, MofTokenKind::Real) << expected.text;
        EXPECT_DOUBLE_EQ(tokens[0].real, expected.value) << expected.text;
    }
}

TEST(MofLexer, resolvesEscapes) {
    const auto tokens = tokensOf(R"("a\b\t\n\f\r\"\'\\z" "\x41\X20ac\x7g" '\x41')");
    ASSERT_EQ(tokens.size(), 3U);
    EXPECT_EQ(tokens[0].characters, "a\b\t\n\f\r\"'\\z");
    EXPECT_EQ(tokens[1].characters, "A\xE2\x82\xAC\x07g");
    EXPECT_EQ(tokens[2].kind, MofTokenKind::Char);
    EXPECT_EQ(tokens[2].characters, "A");
}

TEST(MofLexer, replacesBytesThatAreNotUtf8InTexts) {
    EXPECT_EQ(tokensOf("\"a\xE9z\"")[0].characters, "a\xEF\xBF\xBDz");
}

TEST(MofLexer, joinsTheHalvesOfCharactersBeyond16Bits) {
    EXPECT_EQ(tokensOf(R"("\xD83D\xDE00")")[0].characters, "\xF0\x9F\x98\x80");
    EXPECT_EQ(tokensOf(R"("\xD83D\x41")")[0].characters,
              "\xEF\xBF\xBD"
              "A");
    EXPECT_EQ(tokensOf(R"("\xD83D\n")")[0].characters, "\xEF\xBF\xBD\n");
    EXPECT_EQ(tokensOf(R"("\xDE00\xD83D")")[0].characters, "\xEF\xBF\xBD\xEF\xBF\xBD");
}

TEST(MofLexer, replacesControlCharactersInTexts) {
    EXPECT_EQ(tokensOf(std::string_view("\"a\0b\x01\tc\"", 8))[0].characters,
              "a\xEF\xBF\xBD"
              "b\xEF\xBF\xBD\tc");
}

TEST(MofLexer, tellsATextThatIsBrokenOverLinesOnce) {
    MofErrorLog log;
    const auto tokens = tokensOf("a \"one\n two; three\n four\" ) \"five", log);
    EXPECT_EQ(log.count(), 1U);
    ASSERT_EQ(tokens.size(), 4U);
    EXPECT_EQ(tokens[1].kind, MofTokenKind::String);
    EXPECT_EQ(tokens[2].text, ")");
    EXPECT_EQ(tokens[2].position.line, 3U);
}

TEST(MofLexer, saysWhereAWordIsWrong) {
    EXPECT_EQ(errorOf("a\n /* x"), "t.mof:2:2: found a comment without an end, expected '*/'");
    EXPECT_EQ(errorOf("\"abc"), "t.mof:1:1: found a text without an end, expected a closing \"");
    EXPECT_EQ(errorOf("\"abc\nd"), "t.mof:1:5: found the end of the line, expected a closing \"");
    EXPECT_EQ(
        errorOf("\"a\\q\""),
        "t.mof:1:3: found a backslash, expected one of \\b \\t \\n \\f \\r \\\" \\' \\\\ \\x");
    EXPECT_EQ(errorOf("\"\\x0\""),
              "t.mof:1:2: found '\\x', expected \\x with one to four hexadecimal digits, not 0");
    EXPECT_EQ(errorOf("  12ab"), "t.mof:1:3: found '12ab', expected a number");
    EXPECT_EQ(errorOf("18446744073709551616"),
              "t.mof:1:1: found '18446744073709551616', expected a number within 64 bits");
    EXPECT_EQ(errorOf("089"),
              "t.mof:1:1: found '089', expected digits from 0 to 7 after the leading 0");
    EXPECT_EQ(errorOf("1."), "t.mof:1:1: found '1.', expected a real number such as 1.5");
    EXPECT_EQ(errorOf("08b"), "t.mof:1:1: found '08b', expected a number");
    EXPECT_EQ(errorOf("0x"), "t.mof:1:1: found '0x', expected a number");
    EXPECT_EQ(errorOf("0x10000000000000000"),
              "t.mof:1:1: found '0x10000000000000000', expected a number within 64 bits");
    EXPECT_EQ(errorOf("1.5e999"),
              "t.mof:1:1: found '1.5e999', expected a number within the range of real64");
    EXPECT_EQ(errorOf("1.5x"), "t.mof:1:1: found '1.5x', expected a real number such as 1.5");
    EXPECT_EQ(errorOf("#define"), "t.mof:1:1: found '#define', expected '#pragma'");
    EXPECT_EQ(errorOf("a @"), "t.mof:1:3: found '@', expected a declaration");
    EXPECT_EQ(errorOf(std::string_view("\0", 1)),
              "t.mof:1:1: found the byte 0x00, expected a declaration");
}

}  // namespace
}  // namespace cimomd
