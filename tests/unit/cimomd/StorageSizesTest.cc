#include "providers/storage/StorageSizes.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(StorageSizes, areRoundedDown) {
    EXPECT_EQ(mebibytesOf(1048575U), 0U);
    EXPECT_EQ(mebibytesOf(1048576U), 1U);
    EXPECT_EQ(mebibytesOf(8589934592U), 8192U);
    EXPECT_EQ(decimalMegabytesOf(999999U), 0U);
    EXPECT_EQ(decimalMegabytesOf(4000787030016U), 4000787U);
    EXPECT_EQ(bytesOfSectors(7814037168U), 4000787030016U);
}

TEST(StorageSizes, fit31Bits) {
    EXPECT_EQ(narrowed(2147483647U), 2147483647U);
    EXPECT_EQ(narrowed(2147483648U), std::nullopt);
    EXPECT_EQ(mebibytesOf(2251799813685247U), 2147483647U);
    EXPECT_EQ(mebibytesOf(2251799813685248U), std::nullopt);
    EXPECT_EQ(mebibytesOf(2251799813685248U).reason(), Absence::Filtered);
}

TEST(StorageSizes, keepTheReason) {
    const Fact<std::uint64_t> silent = Absence::TimedOut;
    EXPECT_EQ(mebibytesOf(silent).reason(), Absence::TimedOut);
    EXPECT_EQ(decimalMegabytesOf(silent).reason(), Absence::TimedOut);
    EXPECT_EQ(bytesOfSectors(silent).reason(), Absence::TimedOut);
    EXPECT_EQ(narrowed(silent).reason(), Absence::TimedOut);
}

}  // namespace
}  // namespace cimomd
