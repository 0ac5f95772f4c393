#include "providers/storage/DiskDriveProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class DiskDriveProviderTest : public testing::Test {
  protected:
    DiskDriveProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(DiskDriveProviderTest, sizesAndAbilities) {
    tree.file("sys/block/sda/size", "7814037168\n")
        .file("sys/block/sda/ro", "0\n")
        .file("sys/block/sda/removable", "0\n")
        .file("sys/block/sda/queue/rotational", "1\n")
        .file("sys/block/sda/queue/logical_block_size", "4096\n")
        .file("sys/block/sda/device/state", "running\n")
        .file("sys/block/sda/device/model", "ST4000NM0025\n")
        .file("sys/block/sda/device/serial", "ZC1A2B3C\n")
        .file("sys/block/sdb/size", "0\n")
        .file("sys/block/sdb/ro", "1\n")
        .file("sys/block/sdb/removable", "1\n")
        .file("sys/block/vda/queue/rotational", "1\n")
        .file("sys/block/nvme0n1/queue/rotational", "0\n");
    const DiskDriveProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 4U);
    const auto& disk = instances[0];
    EXPECT_EQ(textOf(disk, "SystemName"), "node7");
    EXPECT_EQ(textOf(disk, "DeviceID"), "sda");
    EXPECT_EQ(textOf(disk, "Name"), "/dev/sda");
    // 7,814,037,168 sectors are 4,000,787,030,016 bytes.
    EXPECT_EQ(textOf(disk, "MaxMediaSize"), "4000787030");
    EXPECT_EQ(textOf(disk, "MaxMediaSizeMB"), "4000787");
    EXPECT_EQ(textOf(disk, "DefaultBlockSize"), "4096");
    EXPECT_EQ(textOf(disk, "Capabilities"), "3 4 ");
    EXPECT_EQ(textOf(disk, "DiskType"), "2");
    EXPECT_EQ(textOf(disk, "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(disk, "EnabledState"), "2");
    EXPECT_EQ(textOf(disk, "Model"), "ST4000NM0025");
    EXPECT_EQ(textOf(disk, "SerialNumber"), "ZC1A2B3C");
    const auto& reader = instances[1];
    EXPECT_EQ(textOf(reader, "DeviceID"), "sdb");
    EXPECT_EQ(textOf(reader, "MaxMediaSize"), "null");
    EXPECT_EQ(textOf(reader, "MaxMediaSizeMB"), "null");
    EXPECT_EQ(textOf(reader, "Capabilities"), "3 7 ");
    EXPECT_EQ(textOf(reader, "OperationalStatus"), "0 ");
    EXPECT_EQ(textOf(reader, "EnabledState"), "null");
    EXPECT_EQ(textOf(instances[2], "DeviceID"), "vda");
    EXPECT_EQ(textOf(instances[2], "DiskType"), "0");
    EXPECT_EQ(textOf(instances[3], "DiskType"), "3");
}

// Most sticks do not say that they do not rotate, so that the kernel takes them for rotating.
TEST_F(DiskDriveProviderTest, takesNoStickForAHardDisk) {
    tree.file("sys/block/sda/removable", "1\n")
        .file("sys/block/sda/queue/rotational", "1\n")
        .file("sys/block/sdb/removable", "1\n")
        .file("sys/block/sdb/queue/rotational", "0\n")
        .file("sys/block/sdc/removable", "0\n")
        .file("sys/block/sdc/queue/rotational", "1\n")
        .file("sys/block/sdd/queue/rotational", "1\n");
    const auto instances = all(DiskDriveProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 4U);
    EXPECT_EQ(textOf(instances[0], "DiskType"), "1");
    EXPECT_EQ(textOf(instances[1], "DiskType"), "3");
    EXPECT_EQ(textOf(instances[2], "DiskType"), "2");
    EXPECT_EQ(textOf(instances[3], "DiskType"), "2");
}

TEST_F(DiskDriveProviderTest, saysWhyThereAreNone) {
    const auto stream = DiskDriveProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
