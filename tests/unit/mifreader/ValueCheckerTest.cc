// Values against types: ranges of integers, lengths of literals, dates, and the tolerances.

#include "mifreader/ValueChecker.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using namespace Mif;
using Base = Type::Base;

std::string verdict(const Value& value, const Type& type, Tolerances tolerances = {}) {
    try {
        ValueChecker(tolerances).check(value, type);
    } catch (const Error& error) {
        return error.what();
    }
    return "fits";
}

Value integer(std::uint64_t magnitude, bool negative = false) {
    Value value;
    value.kind = Value::Kind::Integer;
    value.magnitude = magnitude;
    value.negative = negative;
    value.position = {4, 7};
    return value;
}

Value literal(const std::string& text) {
    Value value;
    value.kind = Value::Kind::Text;
    value.text = text;
    value.position = {4, 7};
    return value;
}

const char* const kNotInteger = "4:7: integer beyond the type Integer, 32 bits with sign";
const char* const kNoDate = "4:7: no date of the form yyyymmddHHMMSS.uuuuuu+ooo";

TEST(ValueCheckerTest, LimitsIntegers) {
    EXPECT_EQ(verdict(integer(2147483647), {Base::Integer}), "fits");
    EXPECT_EQ(verdict(integer(2147483648), {Base::Integer}), kNotInteger);
    EXPECT_EQ(verdict(integer(2147483648, true), {Base::Integer}), "fits");
    EXPECT_EQ(verdict(integer(2147483649, true), {Base::Integer}), kNotInteger);
    EXPECT_EQ(verdict(integer(9223372036854775807U), {Base::Integer64}), "fits");
    EXPECT_EQ(verdict(integer(9223372036854775808U), {Base::Integer64}),
              "4:7: integer beyond the type Integer64, 64 bits with sign");
    EXPECT_EQ(verdict(integer(9223372036854775808U, true), {Base::Integer64}), "fits");
    for (const Base base : {Base::Gauge, Base::Counter}) {
        EXPECT_EQ(verdict(integer(4294967295), {base}), "fits");
        EXPECT_EQ(verdict(integer(4294967296), {base}),
                  "4:7: integer beyond the type Gauge or Counter, 32 bits without sign");
        EXPECT_EQ(verdict(integer(1, true), {base}),
                  "4:7: integer beyond the type Gauge or Counter, 32 bits without sign");
    }
    EXPECT_EQ(verdict(integer(18446744073709551615U), {Base::Counter64}), "fits");
    EXPECT_EQ(verdict(integer(1, true), {Base::Counter64}),
              "4:7: integer beyond the type Counter64, 64 bits without sign");
    EXPECT_EQ(verdict(integer(0, true), {Base::Counter64}), "fits");
}

TEST(ValueCheckerTest, TakesUnsignedIntegersWhenTold) {
    const Tolerances told = {Tolerance::UnsignedIntegers};
    EXPECT_EQ(verdict(integer(4294967295), {Base::Integer}, told), "fits");
    EXPECT_EQ(verdict(integer(4294967296), {Base::Integer}, told), kNotInteger);
    EXPECT_EQ(verdict(integer(2147483649, true), {Base::Integer}, told), kNotInteger);
}

TEST(ValueCheckerTest, LimitsLiterals) {
    for (const Base base : {Base::String, Base::DisplayString, Base::OctetString}) {
        EXPECT_EQ(verdict(literal(""), {base, 3}), "fits");
        EXPECT_EQ(verdict(literal("abc"), {base, 3}), "fits");
        EXPECT_EQ(verdict(literal("abcd"), {base, 3}),
                  "4:7: literal of 4 octets where the type allows 3");
        EXPECT_EQ(verdict(literal("abcd"), {base, 3}, {Tolerance::LongLiterals}), "fits");
    }
}

TEST(ValueCheckerTest, KeepsIntegersAndLiteralsApart) {
    EXPECT_EQ(verdict(literal("1"), {Base::Integer}), "4:7: literal where the type is an integer");
    EXPECT_EQ(verdict(literal("1"), {Base::Counter64}),
              "4:7: literal where the type is an integer");
    EXPECT_EQ(verdict(literal("1"), {Base::Integer}, {Tolerance::TextAsIntegers}), "fits");
    EXPECT_EQ(verdict(integer(1), {Base::String, 9}), "4:7: integer where the type is a string");
    EXPECT_EQ(verdict(integer(1), {Base::String, 9}, {Tolerance::IntegersAsText}), "fits");
    EXPECT_EQ(verdict(integer(1), {Base::Date}), kNoDate);
}

TEST(ValueCheckerTest, AcceptsValuesThatAreNotInTheFile) {
    for (const Value::Kind kind :
         {Value::Kind::Omitted, Value::Kind::Unsupported, Value::Kind::FromPath}) {
        Value value;
        value.kind = kind;
        value.text = "longer than one";
        EXPECT_EQ(verdict(value, {Base::String, 1}), "fits");
        EXPECT_EQ(verdict(value, {Base::Integer}), "fits");
        EXPECT_EQ(verdict(value, {Base::Date}), "fits");
    }
}

TEST(ValueCheckerTest, ChecksDates) {
    for (const char* text : {"20061231235960.999999+060", "00000101000000.000000-999",
                             "****1231******.******+***", "20061231235959.******+000"}) {
        EXPECT_EQ(verdict(literal(text), {Base::Date}), "fits") << text;
    }
    for (const char* text :
         {"", "20061231235959.000000+06", "20061231235959.000000+0600", "20061331235959.000000+060",
          "20060031235959.000000+060", "20060132235959.000000+060", "20060100235959.000000+060",
          "20061231245959.000000+060", "20061231236059.000000+060", "20061231235961.000000+060",
          "20061231235959,000000+060", "20061231235959.000000:060", "20061231235959.00000a+060",
          "2006123123*959.000000+060", "20061231235959.123***+060"}) {
        EXPECT_EQ(verdict(literal(text), {Base::Date}), kNoDate) << text;
    }
}

TEST(ValueCheckerTest, TakesEmptyDatesWhenTold) {
    EXPECT_EQ(verdict(literal(""), {Base::Date}, {Tolerance::EmptyDates}), "fits");
    EXPECT_EQ(verdict(literal(" "), {Base::Date}, {Tolerance::EmptyDates}), kNoDate);
}

}  // namespace
