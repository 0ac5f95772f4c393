// The text forms of CIM values, type by type: what is taken for which value, and what is refused.

#include "xml/ScalarParser.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <limits>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "xml/XmlCharacters.h"

namespace Pegasus {
namespace {

template <typename T>
bool parse(std::string_view text, T& value) {
    return parseScalar(ElementText{text, trimXmlSpace(text)}, value);
}

template <typename T>
void expectValues(const std::vector<std::pair<std::string, T>>& accepted) {
    for (const auto& [text, expected] : accepted) {
        T value{};
        EXPECT_TRUE(parse(text, value)) << text;
        EXPECT_EQ(value, expected) << text;
    }
}

template <typename T>
void expectRefused(const std::vector<std::string>& refused) {
    for (const std::string& text : refused) {
        T value = 42;
        EXPECT_FALSE(parse(text, value)) << text;
        EXPECT_EQ(value, T{42}) << text;
    }
}

TEST(ScalarParser, Booleans) {
    expectValues<Boolean>({{"true", true},
                           {"TRUE", true},
                           {"True", true},
                           {" \n tRuE\t", true},
                           {"false", false},
                           {"FALSE", false},
                           {"fAlSe", false}});
    for (const char* text : {"", " ", "0", "1", "yes", "T", "truee", "tru", "true false"}) {
        Boolean value = true;
        EXPECT_FALSE(parse(text, value)) << text;
        EXPECT_TRUE(value);
    }
}

TEST(ScalarParser, Uint8) {
    expectValues<Uint8>(
        {{"0", 0}, {"255", 255}, {"0xff", 255}, {"0XFF", 255}, {"+7", 7}, {" 7 ", 7}, {"007", 7}});
    expectRefused<Uint8>({"", " ", "256", "0x100", "-1", "-0", "1.0", "1e1", "x", "0x", "0xG",
                          "1 2", "++1", "+-1", "+", "1010b"});
}

TEST(ScalarParser, Sint8) {
    expectValues<Sint8>(
        {{"127", 127}, {"-128", -128}, {"-0", 0}, {"0x7F", 127}, {"-0x80", -128}, {"+127", 127}});
    expectRefused<Sint8>({"128", "-129", "0x80", "-0x81", "-", "--1", "- 1"});
}

TEST(ScalarParser, Uint16) {
    expectValues<Uint16>({{"65535", 65535}, {"0xFFFF", 65535}, {"\t12\r\n", 12}});
    expectRefused<Uint16>({"65536", "-1", "abc", "unknown"});
}

TEST(ScalarParser, Sint16) {
    expectValues<Sint16>({{"32767", 32767}, {"-32768", -32768}});
    expectRefused<Sint16>({"32768", "-32769"});
}

TEST(ScalarParser, Uint32) {
    expectValues<Uint32>({{"4294967295", 4294967295U}, {"0xFFFFFFFF", 4294967295U}});
    expectRefused<Uint32>({"4294967296", "-1", "0x100000000"});
}

TEST(ScalarParser, Sint32) {
    expectValues<Sint32>({{"2147483647", 2147483647}, {"-2147483648", -2147483647 - 1}});
    expectRefused<Sint32>({"2147483648", "-2147483649"});
}

TEST(ScalarParser, Uint64) {
    expectValues<Uint64>({{"18446744073709551615", 18446744073709551615U},
                          {"0xFFFFFFFFFFFFFFFF", 18446744073709551615U},
                          {"00000000000000000000000000000001", 1}});
    expectRefused<Uint64>({"18446744073709551616", "0x10000000000000000", "-1",
                           "99999999999999999999999999999999999999999"});
}

TEST(ScalarParser, Sint64) {
    expectValues<Sint64>({{"9223372036854775807", std::numeric_limits<Sint64>::max()},
                          {"-9223372036854775808", std::numeric_limits<Sint64>::min()}});
    expectRefused<Sint64>({"9223372036854775808", "-9223372036854775809"});
}

TEST(ScalarParser, Real64) {
    expectValues<Real64>({{"1.5", 1.5},
                          {"-1.5", -1.5},
                          {"+1.5", 1.5},
                          {"2", 2.0},
                          {"2.", 2.0},
                          {".5", 0.5},
                          {" 1.5E+3 ", 1500.0},
                          {"1.5e-1", 0.15},
                          {"1.7976931348623157e308", 1.7976931348623157e308},
                          {"4.9406564584124654e-324", 4.9406564584124654e-324},
                          {"0e99999999999999999999", 0.0}});
    expectRefused<Real64>({"",
                           " ",
                           ".",
                           "e5",
                           "1e",
                           "1.5.5",
                           "1,5",
                           "0x10",
                           "INF",
                           "-INF",
                           "inf",
                           "infinity",
                           "NaN",
                           "nan",
                           "abc",
                           "1.5x",
                           "--1",
                           "+-1",
                           "1e400",
                           "-1e400",
                           "1e99999999999999999999",
                           "123456789012345678901234567890e300"});
}

TEST(ScalarParser, RealsTooSmallForTheTypeAreZero) {
    Real64 value = 42;
    EXPECT_TRUE(parse("1e-400", value));
    EXPECT_EQ(value, 0.0);
    EXPECT_TRUE(parse("-1e-99999999999999999999", value));
    EXPECT_EQ(value, 0.0);
    EXPECT_TRUE(std::signbit(value));
    EXPECT_TRUE(parse("0." + std::string(400, '0') + "1", value));
    EXPECT_EQ(value, 0.0);
    Real32 single = 42;
    EXPECT_TRUE(parse("1e-50", single));
    EXPECT_EQ(single, 0.0F);
}

TEST(ScalarParser, Real32) {
    expectValues<Real32>({{"0.1", 0.1F}, {"3.4028235e38", 3.4028235e38F}, {"-2", -2.0F}});
    expectRefused<Real32>({"1e39", "-1e39", "INF", ""});
}

TEST(ScalarParser, RealsDoNotDependOnTheLocale) {
    // Any locale with a decimal comma; where none is installed the C locale proves as much as it
    // can.
    const char* const changed = std::setlocale(LC_ALL, "de_DE.UTF-8");
    Real64 value = 0;
    EXPECT_TRUE(parse("1.25", value));
    EXPECT_EQ(value, 1.25);
    EXPECT_FALSE(parse("1,25", value));
    if (changed != nullptr) {
        std::setlocale(LC_ALL, "C");
    }
}

TEST(ScalarParser, Char16) {
    const std::vector<std::pair<std::string, Uint16>> accepted = {
        {"A", 'A'},         {" A\n", 'A'}, {"\xE2\x82\xAC", 0x20AC}, {" ", ' '}, {"\n", '\n'},
        {"\xC3\xA9", 0xE9}, {"\x01", 1}};
    for (const auto& [text, expected] : accepted) {
        Char16 value(0);
        EXPECT_TRUE(parse(text, value)) << text;
        EXPECT_EQ(Uint16(value), expected) << text;
    }
    // U+10348 needs two units of 16 bits.
    for (const char* text : {"", "AB", "  ", "A B", "\xF0\x90\x8D\x88"}) {
        Char16 value(42);
        EXPECT_FALSE(parse(text, value)) << text;
        EXPECT_EQ(Uint16(value), 42);
    }
}

TEST(ScalarParser, Strings) {
    const std::vector<std::pair<std::string, std::string>> accepted = {
        {"", ""},
        {"  ", ""},
        {" a b ", "a b"},
        {"\r\n\ta\t", "a"},
        {"\xC2\xA0"
         "a",
         "\xC2\xA0"
         "a"},
        {"\xF0\x90\x8D\x88", "\xF0\x90\x8D\x88"}};
    for (const auto& [text, expected] : accepted) {
        String value("before");
        EXPECT_TRUE(parse(text, value)) << text;
        EXPECT_EQ(std::string(value.getCString()), expected);
    }
}

TEST(ScalarParser, Datetimes) {
    const std::vector<std::pair<std::string, std::string>> accepted = {
        {"20261121104314.000000+000", "20261121104314.000000+000"},
        {" 20261121104314.123456-300\n", "20261121104314.123456-300"},
        {"00000001000000.000000:000", "00000001000000.000000:000"},
        {"20180911124613.128***+000", "20180911124613.128***+000"},
        {"", "00000000000000.000000:000"},
        {" \n", "00000000000000.000000:000"}};
    for (const auto& [text, expected] : accepted) {
        CIMDateTime value(String("19990101000000.000000+000"));
        EXPECT_TRUE(parse(text, value)) << text;
        EXPECT_EQ(std::string(value.toString().getCString()), expected);
    }
    for (const char* text :
         {"2026-11-21", "20261321104314.000000+000", "20261121104314.000000+00",
          "20260230104314.000000+000", "20180911124613.128***:000", "0", "yesterday"}) {
        CIMDateTime value;
        EXPECT_FALSE(parse(text, value)) << text;
    }
}

}  // namespace
}  // namespace Pegasus
