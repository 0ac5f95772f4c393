#include "system/Narrowing.h"

#include <gtest/gtest.h>

#include <cstdint>

#include "providers/Megabytes.h"

namespace cimomd {
namespace {

TEST(Narrowing, keepsWhatFits) {
    EXPECT_EQ(narrowedTo<std::uint16_t>(std::uint64_t{65535}), 65535);
    EXPECT_EQ(narrowedTo<std::uint16_t>(std::uint64_t{65536}), std::nullopt);
    EXPECT_EQ(narrowedTo<std::uint16_t>(std::int64_t{-1}), std::nullopt);
}

// 2147483648 was written as -2147483648.
TEST(Narrowing, takesNoCountThatASignedNumberCannotHold) {
    EXPECT_EQ(narrowedToCount(std::uint64_t{0}), 0U);
    EXPECT_EQ(narrowedToCount(std::uint64_t{2147483647}), 2147483647U);
    EXPECT_EQ(narrowedToCount(std::uint64_t{2147483648}), std::nullopt);
    EXPECT_EQ(narrowedToCount(std::int64_t{-1}), std::nullopt);
    EXPECT_EQ(narrowedToCount(UINT64_MAX), std::nullopt);
}

TEST(Megabytes, areRoundedDownAndFitASignedNumber) {
    EXPECT_EQ(megabytesOf(std::uint64_t{2097151}), 1U);
    EXPECT_EQ(megabytesOf((std::uint64_t{1} << 51) - 1), 2147483647U);
    const auto tooMany = megabytesOf(std::uint64_t{1} << 51);
    ASSERT_FALSE(tooMany);
    EXPECT_EQ(tooMany.reason(), Absence::Filtered);
}

}  // namespace
}  // namespace cimomd
