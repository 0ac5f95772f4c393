// The names of the tolerances, and sets of them.

#include "mifreader/Tolerance.h"

#include <gtest/gtest.h>

namespace {

using namespace Mif;

TEST(ToleranceTest, KnowsEveryName) {
    EXPECT_EQ(parseTolerance("raw-line-ends"), Tolerance::RawLineEnds);
    EXPECT_EQ(parseTolerance("bare-line-ends"), Tolerance::BareLineEnds);
    EXPECT_EQ(parseTolerance("wide-integers"), Tolerance::WideIntegers);
    EXPECT_EQ(parseTolerance("any-dates"), Tolerance::AnyDates);
    EXPECT_EQ(parseTolerance("plain-backslashes"), Tolerance::PlainBackslashes);
    EXPECT_EQ(parseTolerance("integers-as-text"), Tolerance::IntegersAsText);
    EXPECT_EQ(parseTolerance("text-as-integers"), Tolerance::TextAsIntegers);
    EXPECT_EQ(parseTolerance("unsigned-integers"), Tolerance::UnsignedIntegers);
    EXPECT_EQ(parseTolerance("empty-dates"), Tolerance::EmptyDates);
    EXPECT_EQ(parseTolerance("long-literals"), Tolerance::LongLiterals);
    EXPECT_EQ(parseTolerance("repeated-names"), Tolerance::RepeatedNames);
    EXPECT_EQ(parseTolerance("anything"), std::nullopt);
    EXPECT_EQ(parseTolerance(""), std::nullopt);
}

TEST(ToleranceTest, HoldsWhatWasAddedOnly) {
    Tolerances set = {Tolerance::EmptyDates};
    set.add(Tolerance::RepeatedNames);
    EXPECT_TRUE(set.has(Tolerance::EmptyDates));
    EXPECT_TRUE(set.has(Tolerance::RepeatedNames));
    EXPECT_FALSE(set.has(Tolerance::LongLiterals));
    EXPECT_FALSE(Tolerances().has(Tolerance::RawLineEnds));
}

}  // namespace
