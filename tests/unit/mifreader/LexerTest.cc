// Tokens: blanks, comments, integers, literals with their escapes, and what is none of them.

#include "mifreader/Lexer.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using namespace Mif;

/// All tokens as a message shows them, literals with their text; or the error.
std::string tokens(const std::string& text, Tolerances tolerances = {}) {
    std::string result;
    try {
        Lexer lexer(text, tolerances);
        for (Token token = lexer.next(); token.kind != Token::Kind::End; token = lexer.next()) {
            result += result.empty() ? "" : " ";
            result += token.kind == Token::Kind::Literal ? "<" + token.text + ">" : token.shown();
        }
    } catch (const Error& error) {
        return error.what();
    }
    return result;
}

TEST(LexerTest, SeparatesTokens) {
    EXPECT_EQ(tokens("Start\tEND\r\nRead-Only=*{1,}(2)"),
              "'start' 'end' 'read-only' '=' '*' '{' 1 ',' '}' '(' 2 ')'");
    EXPECT_EQ(tokens(" \t\r\n"), "");
}

TEST(LexerTest, SkipsComments) {
    EXPECT_EQ(tokens("a // b \"c\n/* d\n* / */e/**/f//"), "'a' 'e' 'f'");
    EXPECT_EQ(tokens("a\n /* b *"), "2:2: comment without end");
    EXPECT_EQ(tokens("/*/"), "1:1: comment without end");
    EXPECT_EQ(tokens("a / b"), "1:3: unexpected '/'");
}

TEST(LexerTest, ReadsIntegers) {
    EXPECT_EQ(tokens("0 123 0173 0x7B 0X7b -5 18446744073709551615"),
              "0 123 123 123 123 -5 18446744073709551615");
    EXPECT_EQ(tokens("18446744073709551616"), "1:1: integer beyond 64 bits");
    EXPECT_EQ(tokens("0x10000000000000000"), "1:1: integer beyond 64 bits");
    EXPECT_EQ(tokens("08"), "1:2: '8' in an integer");
    EXPECT_EQ(tokens("12a"), "1:3: 'a' in an integer");
    EXPECT_EQ(tokens("0xg"), "1:3: 'g' in an integer");
    EXPECT_EQ(tokens(" 0x "), "1:2: integer without digits");
    EXPECT_EQ(tokens("- 5"), "1:1: integer without digits");
    EXPECT_EQ(tokens("1-2"), "1:2: '-' in an integer");
    EXPECT_EQ(tokens("+5"), "1:1: unexpected '+'");
}

TEST(LexerTest, JoinsNeighbouringLiterals) {
    EXPECT_EQ(tokens("\"a\" \"b\"\r\n\"c\" // d\n\"e\",\"f\""), "<abce> ',' <f>");
    EXPECT_EQ(tokens("\"\""), "<>");
}

TEST(LexerTest, ResolvesEscapes) {
    EXPECT_EQ(tokens("\"\\a\\b\\f\\n\\r\\t\\v\\\\\\\"\""), "<\a\b\f\n\r\t\v\\\">");
    EXPECT_EQ(tokens("\"\\x4\\x4A\\x4a1\""), "<\x04JJ1>");
    EXPECT_EQ(tokens("\"\\7\\101\\1012\\3778\""),
              "<\aAA2\xFF"
              "8>");
    EXPECT_EQ(tokens("\"\\400\""), "1:3: escape beyond one octet");
    EXPECT_EQ(tokens("\"\\xg\""), "1:4: escape \\x without digits");
    EXPECT_EQ(tokens("\"a\\d\""), "1:3: unknown escape: a backslash before 'd'");
    EXPECT_EQ(tokens("\"a\\8\""), "1:3: unknown escape: a backslash before '8'");
}

TEST(LexerTest, RefusesWhatIsNoText) {
    EXPECT_EQ(tokens("\n\"abc"), "2:1: literal without end");
    EXPECT_EQ(tokens("\"abc\\"), "1:1: literal without end");
    EXPECT_EQ(tokens("\"abc\\\""), "1:1: literal without end");
    EXPECT_EQ(tokens("\"ab\ncd\""), "1:4: line end in a literal");
    EXPECT_EQ(tokens("\"ab\\\rcd\""), "1:5: line end in a literal");
    EXPECT_EQ(tokens("\"\x01\""), "1:2: octet 0x01 in a literal");
    EXPECT_EQ(tokens("\"\x9F\""), "1:2: octet 0x9F in a literal");
    EXPECT_EQ(tokens("\"\xA0\xFF\t\""), "<\xA0\xFF\t>");
    EXPECT_EQ(tokens(std::string("a\0b", 3)), "1:2: unexpected octet 0x00");
    EXPECT_EQ(tokens("\xEF\xBB\xBF"), "1:1: unexpected octet 0xEF");
    EXPECT_EQ(tokens("\xFE\xFF"), "1:1: two-octet Unicode is not read");
    EXPECT_EQ(tokens("_a"), "1:1: unexpected '_'");
}

TEST(LexerTest, TakesRawLineEndsBehindBackslashesWhenTold) {
    EXPECT_EQ(tokens("\"a\\\r\\\nb\\n\"", {Tolerance::RawLineEnds}), "<a\r\nb\n>");
    EXPECT_EQ(tokens("\"a\r\nb\"", {Tolerance::RawLineEnds}), "1:3: line end in a literal");
}

TEST(LexerTest, TakesBackslashesForThemselvesWhenTold) {
    EXPECT_EQ(tokens("\"C:\\new\\\\x\\\"y\"", {Tolerance::PlainBackslashes}), "<C:\\new\\\\x\"y>");
    EXPECT_EQ(tokens("\"a\\\rb\"", {Tolerance::PlainBackslashes}), "1:4: line end in a literal");
    EXPECT_EQ(tokens("\"a\\", {Tolerance::PlainBackslashes}), "1:1: literal without end");
}

TEST(LexerTest, CountsLinesAndColumns) {
    Lexer lexer("a\r\n  \"x\\ty\" b", {});
    lexer.next();
    const Token literal = lexer.next();
    EXPECT_EQ(literal.position.line, 2U);
    EXPECT_EQ(literal.position.column, 3U);
    const Token word = lexer.next();
    EXPECT_EQ(word.position.line, 2U);
    EXPECT_EQ(word.position.column, 10U);
    EXPECT_EQ(lexer.next().kind, Token::Kind::End);
    EXPECT_EQ(lexer.next().kind, Token::Kind::End);
}

}  // namespace
