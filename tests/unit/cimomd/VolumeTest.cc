#include "system/storage/Volume.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

TEST(Volume, ofTheDeviceMapper) {
    RecordedTree tree;
    tree.file("sys/block/dm-10/dm/name", "vg-swap\n")
        .file("sys/block/dm-2/dm/name", "vg-root\n")
        .file("sys/block/dm-2/dm/uuid", "LVM-0FQJx\n")
        .file("sys/block/dm-2/dm/suspended", "0\n")
        .file("sys/block/dm-2/size", "2048\n")
        .directory("sys/block/dm-2/slaves/sda10")
        .directory("sys/block/dm-2/slaves/sda2")
        .file("sys/block/sda/size", "4096\n");
    const auto volumes = readVolumes(tree.paths());
    ASSERT_EQ(volumes->size(), 2U);
    const Volume& root = volumes->front();
    EXPECT_EQ(root.device.name, "dm-2");
    EXPECT_FALSE(root.isRaid);
    EXPECT_EQ(root.mapperName, std::string("vg-root"));
    EXPECT_EQ(root.uuid, std::string("LVM-0FQJx"));
    EXPECT_EQ(root.isSuspended, false);
    EXPECT_EQ(root.members, (std::vector<std::string>{"sda2", "sda10"}));
    EXPECT_EQ(root.raid.level, std::nullopt);
    EXPECT_EQ(volumes->back().device.name, "dm-10");
    EXPECT_EQ(volumes->back().members.reason(), Absence::Absent);
}

TEST(Volume, ofSoftwareRaid) {
    RecordedTree tree;
    tree.file("sys/block/md127/md/level", "raid5\n")
        .file("sys/block/md127/md/array_state", "clean\n")
        .file("sys/block/md127/md/sync_action", "reshape\n")
        .file("sys/block/md127/md/raid_disks", "4 (3)\n")
        .file("sys/block/md127/md/degraded", "1\n");
    const auto volumes = readVolumes(tree.paths());
    ASSERT_EQ(volumes->size(), 1U);
    EXPECT_TRUE(volumes->front().isRaid);
    const RaidState& raid = volumes->front().raid;
    EXPECT_EQ(raid.level, std::string("raid5"));
    EXPECT_EQ(raid.arrayState, std::string("clean"));
    EXPECT_EQ(raid.syncAction, std::string("reshape"));
    EXPECT_EQ(raid.disks, 4U);
    EXPECT_EQ(raid.missingDisks, 1U);
}

// The kernel shows 0 sectors until the array is started.
TEST(Volume, thatIsNotRunningHasNoSize) {
    RecordedTree tree;
    tree.file("sys/block/md0/md/array_state", "inactive\n")
        .file("sys/block/md0/size", "0\n")
        .file("sys/block/md1/md/array_state", "clean\n")
        .file("sys/block/md1/size", "8\n")
        .file("sys/block/dm-0/dm/name", "vg-new\n")
        .file("sys/block/dm-0/size", "0\n");
    const auto volumes = readVolumes(tree.paths());
    ASSERT_EQ(volumes->size(), 3U);
    for (const Volume& volume : *volumes) {
        if (volume.device.name == "md1")
            EXPECT_EQ(volume.device.sizeSectors, 8U);
        else
            EXPECT_EQ(volume.device.sizeSectors.reason(), Absence::Absent) << volume.device.name;
        EXPECT_EQ(volume.device.sizeSectors.has_value(), volume.device.name == "md1");
    }
}

TEST(Volume, withOddFiles) {
    RecordedTree tree;
    tree.file("sys/block/md0/md/raid_disks", "many\n")
        .file("sys/block/md0/md/degraded", "-1\n")
        .file("sys/block/md1/md", "no directory")
        .file("sys/block/dm-0/dm/name", "\n");
    const auto volumes = readVolumes(tree.paths());
    ASSERT_EQ(volumes->size(), 2U);
    EXPECT_EQ(volumes->front().device.name, "md0");
    EXPECT_EQ(volumes->front().raid.disks, std::nullopt);
    EXPECT_EQ(volumes->front().raid.missingDisks, std::nullopt);
    EXPECT_EQ(volumes->back().mapperName, std::nullopt);
    EXPECT_EQ(readVolumes(RecordedTree().paths()).reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
