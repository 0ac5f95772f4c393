#include "text/NaturalOrder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace cimomd {
namespace {

TEST(NaturalOrder, comparesNumbersInNamesByTheirValue) {
    std::vector<std::string> names{"eth10", "eth2", "lo", "eth2.100", "eth2.20", "eth", ""};
    std::sort(names.begin(), names.end(), naturallyBefore);
    EXPECT_EQ(names,
              (std::vector<std::string>{"", "eth", "eth2", "eth2.20", "eth2.100", "eth10", "lo"}));
}

TEST(NaturalOrder, takesNumbersOfAnyLength) {
    EXPECT_TRUE(naturallyBefore("a18446744073709551616", "a18446744073709551617"));
    EXPECT_TRUE(naturallyBefore("a9", "a18446744073709551616"));
    EXPECT_FALSE(naturallyBefore("a18446744073709551616", "a9"));
}

TEST(NaturalOrder, isTotalWhereOnlyLeadingZerosDiffer) {
    EXPECT_TRUE(naturallyBefore("cpu01", "cpu1"));
    EXPECT_FALSE(naturallyBefore("cpu1", "cpu01"));
    EXPECT_FALSE(naturallyBefore("cpu1", "cpu1"));
    EXPECT_TRUE(naturallyBefore("cpu0", "cpu00"));
    EXPECT_FALSE(naturallyBefore("cpu00", "cpu0"));
}

TEST(NaturalOrder, comparesOtherBytesAsUnsigned) {
    EXPECT_TRUE(naturallyBefore("a", "\xC3\xA4"));
    EXPECT_FALSE(naturallyBefore("\xC3\xA4", "a"));
    EXPECT_TRUE(naturallyBefore("1", "a"));
}

}  // namespace
}  // namespace cimomd
