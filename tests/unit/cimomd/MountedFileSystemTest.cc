#include "system/storage/MountedFileSystem.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

std::string listed(std::string_view table, FileSystemKind kind = FileSystemKind::Local) {
    std::string points;
    for (const MountedFileSystem& found : mountedFileSystems(parseMountInfo(table), kind))
        points += found.mount.mountPoint + (found.mayWait ? "?;" : ";");
    return points;
}

TEST(MountedFileSystem, listsAFileSystemOnceAndPrefersItsOwnMount) {
    EXPECT_EQ(listed("1 0 8:1 / / rw - ext4 /dev/a rw\n"
                     "2 1 8:1 /srv /export rw - ext4 /dev/a rw\n"
                     "3 1 8:2 /sub /bind rw - xfs /dev/b rw\n"
                     "4 1 8:2 / /data rw - xfs /dev/b rw\n"
                     "5 1 8:3 /only /bound rw - xfs /dev/c rw\n"),
              "/;/data;/bound;");
}

TEST(MountedFileSystem, leavesOutWhatIsNotOfTheKind) {
    EXPECT_EQ(listed("1 0 0:21 / /proc rw - proc proc rw\n"
                     "2 0 0:30 / / rw - overlay overlay rw\n"
                     "3 0 0:31 / /home rw - nfs4 server:/home rw\n"
                     "4 0 0:32 / /mnt/phone rw - fuse.mtpfs phone rw\n"
                     "5 0 7:1 / /snap/core ro - squashfs /dev/loop1 ro\n"
                     "6 0 0:33 / /auto rw - autofs systemd-1 rw\n"),
              "");
}

TEST(MountedFileSystem, leavesTheSystemsOwnTemporaryFileSystemsOut) {
    EXPECT_EQ(listed("1 0 0:25 / /dev/shm rw - tmpfs tmpfs rw\n"
                     "2 0 0:26 / /run rw - tmpfs tmpfs rw\n"
                     "3 0 0:27 / /runtime rw - tmpfs tmpfs rw\n"
                     "4 0 0:28 / /tmp rw - tmpfs tmpfs rw\n"),
              "/runtime;/tmp;");
}

// Seen in a timer's inventory: the directory of modules, which systemd had made inaccessible, was
// listed with the size of /run.
TEST(MountedFileSystem, leavesOutWhatSystemdMakesInaccessible) {
    EXPECT_EQ(
        listed("100 1 8:1 / / ro,nosuid shared:1 - ext4 /dev/a rw\n"
               "114 100 0:48 / /run rw,nosuid shared:114 master:6 - tmpfs tmpfs rw,mode=755\n"
               "138 100 0:48 /systemd/inaccessible/dir /usr/lib/modules ro,nosuid,nodev,noexec "
               "shared:138 master:6 - tmpfs tmpfs rw,size=4936820k,mode=755\n"),
        "/;");
    // In a container the manager of containers has made the directory.
    EXPECT_EQ(
        listed("100 1 8:1 / / ro shared:1 - ext4 /dev/a rw\n"
               "138 100 0:48 /host/inaccessible/dir /usr/lib/modules ro master:6 - tmpfs tmpfs "
               "rw,mode=755\n"),
        "/;");
    // Of a service of a user.
    EXPECT_EQ(listed("100 1 8:1 / / ro shared:1 - ext4 /dev/a rw\n"
                     "139 100 0:52 /systemd/inaccessible/dir /home/mia/secret ro - tmpfs tmpfs "
                     "rw,uid=1000\n"),
              "/;");
    EXPECT_EQ(listed("100 1 8:1 / / ro shared:1 - ext4 /dev/a rw\n"
                     "139 100 0:53 /inaccessible/dir /srv ro - tmpfs tmpfs rw\n"
                     "140 100 8:2 /host/inaccessible/dir /data rw - ext4 /dev/b rw\n"),
              "/;/srv;/data;");
}

// A service with mounts of its own gets the same mounts in another order.
TEST(MountedFileSystem, namesAFileSystemAlikeInEveryOrder) {
    EXPECT_EQ(listed("20 1 8:1 / / rw - ext4 /dev/a rw\n"
                     "21 20 8:2 / /export rw - ext4 /dev/b rw\n"
                     "22 20 8:3 / /data rw - ext4 /dev/c rw\n"
                     "23 21 8:3 / /export/data rw - ext4 /dev/c rw\n"),
              "/;/export;/data;");
    EXPECT_EQ(listed("20 1 8:1 / / ro - ext4 /dev/a rw\n"
                     "21 20 8:2 / /export ro - ext4 /dev/b rw\n"
                     "23 21 8:3 / /export/data ro - ext4 /dev/c rw\n"
                     "22 20 8:3 / /data ro - ext4 /dev/c rw\n"),
              "/;/export;/data;");
    EXPECT_EQ(listed("20 1 8:1 / / ro - ext4 /dev/a rw\n"
                     "22 20 8:3 / /two ro - ext4 /dev/c rw\n"
                     "23 20 8:3 / /one ro - ext4 /dev/c rw\n"
                     "24 20 8:4 /b /bound/b ro - ext4 /dev/d rw\n"
                     "25 20 8:4 /a /bound/a ro - ext4 /dev/d rw\n"),
              "/;/one;/bound/a;");
}

TEST(MountedFileSystem, leavesOutWhatALaterMountHides) {
    EXPECT_EQ(listed("1 0 8:1 / /mnt rw - ext4 /dev/a rw\n"
                     "2 0 8:2 / /mnt rw - ext4 /dev/b rw\n"),
              "/mnt;");
    EXPECT_EQ(listed("1 0 8:1 / /mnt rw - ext4 /dev/a rw\n"
                     "2 0 0:9 / /mnt rw - nfs server:/ rw\n"),
              "");
}

TEST(MountedFileSystem, leavesOutWhatAMountAboveHides) {
    EXPECT_EQ(listed("20 1 8:1 / / rw - ext4 /dev/a rw\n"
                     "21 20 8:2 / /mnt/a rw - ext4 /dev/b rw\n"
                     "22 20 8:3 / /mnt rw - ext4 /dev/c rw\n"),
              "/;/mnt;");
}

TEST(MountedFileSystem, tellsTheKindsApart) {
    constexpr std::string_view kTable =
        "20 1 8:1 / / rw - ext4 /dev/a rw\n"
        "21 20 0:40 / /home rw - nfs4 server:/home rw\n"
        "22 20 0:41 / /old rw - nfs server:/old rw\n"
        "23 20 0:42 / /win rw - cifs //files/win rw\n"
        "24 20 0:43 / /ssh rw - fuse.sshfs mia@shell: rw\n"
        "25 20 0:44 / /gvfs rw - fuse.gvfsd-fuse gvfsd-fuse rw\n"
        "26 20 8:2 / /usb rw - fuseblk /dev/b rw\n"
        "27 20 0:45 / /host rw - virtiofs share rw\n"
        "28 20 0:40 / /again rw - nfs4 server:/home rw\n";
    EXPECT_EQ(listed(kTable), "/;/usb?;");
    EXPECT_EQ(listed(kTable, FileSystemKind::Nfs), "/home?;/old?;");
    EXPECT_EQ(listed(kTable, FileSystemKind::Remote), "/win?;/ssh?;/host?;");
}

TEST(MountedFileSystem, theWayDecidesWhetherItMayWait) {
    EXPECT_EQ(listed("20 1 0:50 / / rw - overlay overlay rw\n"
                     "21 20 8:1 / /data rw - ext4 /dev/a rw\n"
                     "22 20 0:40 / /boot rw - autofs systemd-1 rw\n"
                     "23 22 8:2 / /boot rw - vfat /dev/b rw\n"
                     "24 20 0:41 / /net rw - nfs server:/ rw\n"
                     "25 24 8:3 / /net/disk rw - xfs /dev/c rw\n"),
              "/data;/boot?;/net/disk?;");
}

}  // namespace
}  // namespace cimomd
