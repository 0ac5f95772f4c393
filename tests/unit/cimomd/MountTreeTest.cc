#include "system/storage/MountTree.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

/// The ids of the mounts on the way.
std::string way(std::string_view table, std::string_view path) {
    const std::vector<Mount> mounts = parseMountInfo(table);
    std::string ids;
    for (const Mount* mount : MountTree(mounts).wayTo(path))
        ids += mount->id + ";";
    return ids;
}

TEST(MountTree, leadsFromTheRootToTheMount) {
    constexpr std::string_view kTable =
        "20 1 8:1 / / rw - ext4 /dev/a rw\n"
        "21 20 0:40 / /net rw - nfs s:/ rw\n"
        "22 21 8:2 / /net/disk rw - xfs /dev/b rw\n"
        "23 20 8:3 / /network rw - xfs /dev/c rw\n";
    EXPECT_EQ(way(kTable, "/"), "20;");
    EXPECT_EQ(way(kTable, "/usr/bin"), "20;");
    EXPECT_EQ(way(kTable, "/net"), "20;21;");
    EXPECT_EQ(way(kTable, "/net/disk"), "20;21;22;");
    EXPECT_EQ(way(kTable, "/network"), "20;23;");
}

TEST(MountTree, theUppermostOfSeveralShows) {
    constexpr std::string_view kTable =
        "20 1 8:1 / / rw - ext4 /dev/a rw\n"
        "21 20 0:40 / /boot rw - autofs systemd-1 rw\n"
        "22 21 8:2 / /boot rw - vfat /dev/b rw\n";
    EXPECT_EQ(way(kTable, "/boot"), "20;21;22;");
}

TEST(MountTree, aMountOverADirectoryHidesWhatIsBelow) {
    constexpr std::string_view kTable =
        "20 1 8:1 / / rw - ext4 /dev/a rw\n"
        "21 20 8:2 / /mnt/a rw - ext4 /dev/b rw\n"
        "22 20 8:3 / /mnt rw - ext4 /dev/c rw\n";
    EXPECT_EQ(way(kTable, "/mnt/a"), "20;22;");
}

TEST(MountTree, survivesTablesThatContradictThemselves) {
    EXPECT_EQ(way("", "/a"), "");
    EXPECT_EQ(way("1 1 0:1 / / rw - rootfs rootfs rw\n", "/a"), "1;");
    EXPECT_EQ(way("1 0 8:1 / / rw - ext4 /dev/a rw\n", ""), "");
    EXPECT_EQ(way("1 0 8:1 / / rw - ext4 /dev/a rw\n", "(unreachable)/x"), "");
    // Each is the parent of the other, at one place.
    const std::string endless =
        way("1 0 8:1 / / rw - ext4 /dev/a rw\n2 3 8:2 / /x rw - ext4 /dev/b rw\n"
            "3 2 8:3 / /x rw - ext4 /dev/c rw\n2 1 8:2 / /x rw - ext4 /dev/b rw\n",
            "/x");
    EXPECT_LE(endless.size(), 2000U);
}

}  // namespace
}  // namespace cimomd
