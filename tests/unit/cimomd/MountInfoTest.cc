#include "system/storage/MountInfo.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

std::string listed(std::string_view table) {
    std::string points;
    for (const Mount& mount : localFileSystems(parseMountInfo(table)))
        points += mount.mountPoint + ";";
    return points;
}

TEST(MountInfo, readsALine) {
    const auto mounts = parseMountInfo(
        "36 35 98:0 /mnt1 /mnt\\0402\\134x ro,noatime master:1 shared:2 - ext3 /dev/root rw\n");
    ASSERT_EQ(mounts.size(), 1U);
    EXPECT_EQ(mounts[0].device, "98:0");
    EXPECT_EQ(mounts[0].fileSystemRoot, "/mnt1");
    EXPECT_EQ(mounts[0].mountPoint, "/mnt 2\\x");
    EXPECT_EQ(mounts[0].type, "ext3");
    EXPECT_EQ(mounts[0].source, "/dev/root");
    EXPECT_TRUE(mounts[0].readOnly);
}

TEST(MountInfo, findsReadOnlyInEitherOptions) {
    const auto mounts = parseMountInfo(
        "1 0 8:1 / /a rw,errors=ro - ext4 /dev/a rw\n"
        "2 0 8:2 / /b rw - iso9660 /dev/b ro,relatime\n");
    ASSERT_EQ(mounts.size(), 2U);
    EXPECT_FALSE(mounts[0].readOnly);
    EXPECT_TRUE(mounts[1].readOnly);
}

TEST(MountInfo, dropsIncompleteLines) {
    EXPECT_TRUE(parseMountInfo("").empty());
    EXPECT_TRUE(
        parseMountInfo("1 0 8:1 / /a rw\n1 0 8:1 / /a rw - ext4 /dev/a\n- - - -\n").empty());
}

TEST(MountInfo, listsAFileSystemOnceAndPrefersItsOwnMount) {
    EXPECT_EQ(listed("1 0 8:1 / / rw - ext4 /dev/a rw\n"
                     "2 1 8:1 /srv /export rw - ext4 /dev/a rw\n"
                     "3 1 8:2 /sub /bind rw - xfs /dev/b rw\n"
                     "4 1 8:2 / /data rw - xfs /dev/b rw\n"
                     "5 1 8:3 /only /bound rw - xfs /dev/c rw\n"),
              "/;/data;/bound;");
}

TEST(MountInfo, leavesOutWhatIsNotLocal) {
    EXPECT_EQ(listed("1 0 0:21 / /proc rw - proc proc rw\n"
                     "2 0 0:30 / / rw - overlay overlay rw\n"
                     "3 0 0:31 / /home rw - nfs4 server:/home rw\n"
                     "4 0 0:32 / /mnt/usb rw - fuseblk /dev/sdb1 rw\n"
                     "5 0 7:1 / /snap/core ro - squashfs /dev/loop1 ro\n"
                     "6 0 0:33 / /auto rw - autofs systemd-1 rw\n"),
              "");
}

TEST(MountInfo, leavesTheSystemsOwnTemporaryFileSystemsOut) {
    EXPECT_EQ(listed("1 0 0:25 / /dev/shm rw - tmpfs tmpfs rw\n"
                     "2 0 0:26 / /run rw - tmpfs tmpfs rw\n"
                     "3 0 0:27 / /runtime rw - tmpfs tmpfs rw\n"
                     "4 0 0:28 / /tmp rw - tmpfs tmpfs rw\n"),
              "/runtime;/tmp;");
}

TEST(MountInfo, leavesOutWhatALaterMountHides) {
    EXPECT_EQ(listed("1 0 8:1 / /mnt rw - ext4 /dev/a rw\n"
                     "2 0 8:2 / /mnt rw - ext4 /dev/b rw\n"),
              "/mnt;");
    EXPECT_EQ(listed("1 0 8:1 / /mnt rw - ext4 /dev/a rw\n"
                     "2 0 0:9 / /mnt rw - nfs server:/ rw\n"),
              "");
}

}  // namespace
}  // namespace cimomd
