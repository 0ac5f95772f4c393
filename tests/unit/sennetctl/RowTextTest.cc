#include "mif/RowText.h"

#include <gtest/gtest.h>

#include <initializer_list>

namespace sennetctl {
namespace {

RowText row(std::initializer_list<std::string_view> values) {
    RowText text;
    std::size_t column = 0;
    for (const std::string_view value : values) {
        if (!value.empty()) {
            text.add(column, value);
        }
        ++column;
    }
    return text;
}

void expectOrder(const RowText& lower, const RowText& higher) {
    EXPECT_TRUE(lower < higher);
    EXPECT_FALSE(higher < lower);
}

TEST(RowTextTest, ValuesAreJoinedFromTheFirstThatIsNotEmpty) {
    EXPECT_EQ(row({"a", "b", "c"}).joined(3), "a, b, c");
    EXPECT_EQ(row({"", "a", "", "b"}).joined(4), "a, , b");
    EXPECT_EQ(row({"a", "", ""}).joined(3), "a, , ");
    EXPECT_EQ(row({"", ""}).joined(2), "");
}

TEST(RowTextTest, TheFirstDifferenceDecidesTheOrder) {
    expectOrder(row({"a", "c"}), row({"b", "b"}));
    expectOrder(row({"a", "b"}), row({"a", "c"}));
    expectOrder(row({"a"}), row({"a", "b"}));
    expectOrder(row({}), row({"a"}));
    EXPECT_FALSE(row({"a", "b"}) < row({"a", "b"}));
    EXPECT_FALSE(row({}) < row({}));
}

TEST(RowTextTest, AMissingValueIsBelowAnyOther) {
    expectOrder(row({"", "b"}), row({"a", ""}));
    expectOrder(row({"a", "", "z"}), row({"a", "b"}));
    expectOrder(row({"a", "", "c"}), row({"a", "b", "c"}));
}

}  // namespace
}  // namespace sennetctl
