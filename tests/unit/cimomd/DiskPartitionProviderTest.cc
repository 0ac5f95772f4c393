#include "providers/storage/DiskPartitionProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class DiskPartitionProviderTest : public testing::Test {
  protected:
    DiskPartitionProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(DiskPartitionProviderTest, placeAndKind) {
    tree.file("sys/class/block/sda/size", "7814037168\n")
        .file("sys/class/block/sda1/partition", "1\n")
        .file("sys/class/block/sda1/start", "2048\n")
        .file("sys/class/block/sda1/size", "7814033408\n")
        .file("sys/class/block/sda1/ro", "0\n")
        .file("sys/class/block/sda2/partition", "2\n")
        .file("sys/class/block/sda2/size", "2\n")
        .file("sys/class/block/sda5/partition", "5\n");
    const DiskPartitionProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 3U);
    const auto& first = instances[0];
    EXPECT_EQ(textOf(first, "DeviceID"), "sda1");
    EXPECT_EQ(textOf(first, "Name"), "/dev/sda1");
    EXPECT_EQ(textOf(first, "NameFormat"), "12");
    EXPECT_EQ(textOf(first, "Disk"), "sda");
    EXPECT_EQ(textOf(first, "PartitionNumber"), "1");
    EXPECT_EQ(textOf(first, "BlockSize"), "512");
    EXPECT_EQ(textOf(first, "NumberOfBlocks"), "7814033408");
    EXPECT_EQ(textOf(first, "StartingBlock"), "2048");
    EXPECT_EQ(textOf(first, "StartMB"), "1");
    // 3,815,446 * 2048 is 7,814,033,408.
    EXPECT_EQ(textOf(first, "SizeMB"), "3815446");
    EXPECT_EQ(textOf(first, "ReadOnly"), "FALSE");
    EXPECT_EQ(textOf(first, "PrimaryPartition"), "TRUE");
    EXPECT_EQ(textOf(first, "PartitionType"), "1");
    EXPECT_EQ(textOf(first, "ExtentStatus"), "2 ");
    EXPECT_EQ(textOf(instances[1], "PartitionType"), "2");
    EXPECT_EQ(textOf(instances[1], "PrimaryPartition"), "FALSE");
    EXPECT_EQ(textOf(instances[1], "SizeMB"), "0");
    EXPECT_EQ(textOf(instances[2], "PartitionType"), "3");
    EXPECT_EQ(textOf(instances[2], "NumberOfBlocks"), "null");
    EXPECT_EQ(textOf(instances[2], "SizeMB"), "null");
}

TEST_F(DiskPartitionProviderTest, saysWhyThereAreNone) {
    const auto stream = DiskPartitionProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
