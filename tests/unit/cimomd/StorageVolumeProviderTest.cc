#include "providers/storage/StorageVolumeProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class StorageVolumeProviderTest : public testing::Test {
  protected:
    StorageVolumeProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(StorageVolumeProviderTest, ofTheDeviceMapper) {
    tree.file("sys/block/dm-0/dm/name", "vg-root\n")
        .file("sys/block/dm-0/dm/uuid", "LVM-0FQJx\n")
        .file("sys/block/dm-0/dm/suspended", "0\n")
        .file("sys/block/dm-0/size", "41943040\n")
        .file("sys/block/dm-0/ro", "0\n")
        .directory("sys/block/dm-0/slaves/sda3")
        .file("sys/block/dm-1/dm/uuid", "-x\n");
    const StorageVolumeProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    const auto& root = instances[0];
    EXPECT_EQ(textOf(root, "DeviceID"), "dm-0");
    EXPECT_EQ(textOf(root, "Name"), "/dev/mapper/vg-root");
    EXPECT_EQ(textOf(root, "ElementName"), "vg-root");
    EXPECT_EQ(textOf(root, "NameFormat"), "12");
    EXPECT_EQ(textOf(root, "BlockSize"), "512");
    EXPECT_EQ(textOf(root, "NumberOfBlocks"), "41943040");
    EXPECT_EQ(textOf(root, "SizeMB"), "20480");
    EXPECT_EQ(textOf(root, "ReadOnly"), "FALSE");
    EXPECT_EQ(textOf(root, "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(root, "ExtentStatus"), "2 ");
    EXPECT_EQ(textOf(root, "VolumeType"), "LVM");
    EXPECT_EQ(textOf(root, "VolumeUUID"), "LVM-0FQJx");
    EXPECT_EQ(textOf(root, "Members"), "sda3 ");
    EXPECT_EQ(textOf(root, "RAIDLevel"), "null");
    EXPECT_EQ(textOf(root, "RAIDDisks"), "null");
    EXPECT_EQ(textOf(instances[1], "Name"), "/dev/dm-1");
    EXPECT_EQ(textOf(instances[1], "VolumeType"), "null");
    EXPECT_EQ(textOf(instances[1], "OperationalStatus"), "0 ");
}

TEST_F(StorageVolumeProviderTest, ofSoftwareRaid) {
    tree.file("sys/block/md0/md/level", "raid1\n")
        .file("sys/block/md0/md/array_state", "active\n")
        .file("sys/block/md0/md/sync_action", "recover\n")
        .file("sys/block/md0/md/raid_disks", "2\n")
        .file("sys/block/md0/md/degraded", "1\n")
        .directory("sys/block/md0/slaves/sdb1")
        .directory("sys/block/md0/slaves/sda1");
    const auto instances = all(StorageVolumeProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "Name"), "/dev/md0");
    EXPECT_EQ(textOf(instances[0], "VolumeType"), "MD");
    EXPECT_EQ(textOf(instances[0], "RAIDLevel"), "raid1");
    EXPECT_EQ(textOf(instances[0], "ArrayState"), "active");
    EXPECT_EQ(textOf(instances[0], "RAIDDisks"), "2");
    EXPECT_EQ(textOf(instances[0], "MissingDisks"), "1");
    EXPECT_EQ(textOf(instances[0], "Members"), "sda1 sdb1 ");
    EXPECT_EQ(textOf(instances[0], "OperationalStatus"), "3 ");
    EXPECT_EQ(textOf(instances[0], "EnabledState"), "2");
    EXPECT_EQ(textOf(instances[0], "ExtentStatus"), "6 11 ");
}

TEST_F(StorageVolumeProviderTest, saysWhyThereAreNone) {
    const auto stream = StorageVolumeProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
