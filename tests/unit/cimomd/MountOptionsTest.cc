#include "system/storage/MountOptions.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(MountOptions, haveNamesAndValues) {
    const MountOptions options("rw,vers=4.2,hard,addr=,errors=ro,vers=3");
    EXPECT_TRUE(options.has("rw"));
    EXPECT_TRUE(options.has("hard"));
    EXPECT_FALSE(options.has("ro"));
    EXPECT_FALSE(options.has("har"));
    EXPECT_FALSE(options.has("vers"));
    EXPECT_EQ(options.valueOf("vers"), "4.2");
    EXPECT_EQ(options.valueOf("addr"), "");
    EXPECT_EQ(options.valueOf("ver"), std::nullopt);
    EXPECT_EQ(options.valueOf("rw"), std::nullopt);
}

TEST(MountOptions, canBeEmpty) {
    EXPECT_FALSE(MountOptions().has("rw"));
    EXPECT_FALSE(MountOptions(",,").has("rw"));
    EXPECT_EQ(MountOptions(",=,").valueOf("vers"), std::nullopt);
}

}  // namespace
}  // namespace cimomd
