#include "system/storage/MountInfo.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(MountInfo, readsALine) {
    const auto mounts = parseMountInfo(
        "36 35 98:0 /mnt1 /mnt\\0402\\134x ro,noatime master:1 shared:2 - ext3 /dev/root rw\n");
    ASSERT_EQ(mounts.size(), 1U);
    EXPECT_EQ(mounts[0].id, "36");
    EXPECT_EQ(mounts[0].parentId, "35");
    EXPECT_EQ(mounts[0].device, "98:0");
    EXPECT_EQ(mounts[0].fileSystemRoot, "/mnt1");
    EXPECT_EQ(mounts[0].mountPoint, "/mnt 2\\x");
    EXPECT_EQ(mounts[0].type, "ext3");
    EXPECT_EQ(mounts[0].source, "/dev/root");
    EXPECT_FALSE(mounts[0].readOnly);
    EXPECT_TRUE(mounts[0].fileSystemOptions.has("rw"));
}

TEST(MountInfo, takesReadOnlyFromTheFileSystem) {
    const auto mounts = parseMountInfo(
        "1 0 8:1 / /a ro - ext4 /dev/a rw,errors=ro\n"
        "2 0 8:2 / /b rw - iso9660 /dev/b ro,relatime\n");
    ASSERT_EQ(mounts.size(), 2U);
    EXPECT_FALSE(mounts[0].readOnly);
    EXPECT_TRUE(mounts[1].readOnly);
}

TEST(MountInfo, takesAMountWithoutASource) {
    const auto mounts = parseMountInfo("2 1 0:55 / /scratch rw - tmpfs  rw,size=4k\n");
    ASSERT_EQ(mounts.size(), 1U);
    EXPECT_EQ(mounts[0].mountPoint, "/scratch");
    EXPECT_EQ(mounts[0].source, "");
    EXPECT_TRUE(mounts[0].fileSystemOptions.has("size=4k"));
}

TEST(MountInfo, dropsIncompleteLines) {
    EXPECT_TRUE(parseMountInfo("").empty());
    EXPECT_TRUE(
        parseMountInfo("1 0 8:1 / /a rw\n1 0 8:1 / /a rw - ext4 /dev/a\n- - - -\n").empty());
}

}  // namespace
}  // namespace cimomd
