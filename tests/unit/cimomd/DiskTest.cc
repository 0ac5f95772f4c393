#include "system/storage/Disk.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

std::string namesOf(const RecordedTree& tree) {
    std::string names;
    const auto disks = readDisks(tree.paths());
    for (const Disk& disk : disks.value())
        names += disk.device.name + ";";
    return names;
}

TEST(Disk, isWhatKeepsDataOfItsOwn) {
    RecordedTree tree;
    for (const char* name :
         {"sda", "sdaa", "sdb", "vda", "xvda", "nvme0n1", "mmcblk0", "loop0", "ram0", "zram0",
          "dm-0", "md0", "md_d1", "sr0", "fd0", "zd16", "mtdblock0", "drbd1", "bcache0"})
        tree.file(std::string("sys/block/") + name + "/size", "2048\n");
    EXPECT_EQ(namesOf(tree), "sda;sdb;vda;nvme0n1;sdaa;xvda;mmcblk0;");
}

TEST(Disk, ofTheNetworkCountsWhileItHasAServer) {
    RecordedTree tree;
    tree.file("sys/block/nbd0/size", "0\n")
        .file("sys/block/nbd1/size", "2048\n")
        .directory("sys/block/nbd2");
    EXPECT_EQ(namesOf(tree), "nbd1;");
}

TEST(Disk, isNeitherAPartNorAPathOfAnother) {
    RecordedTree tree;
    tree.file("sys/block/mmcblk0/size", "61071360\n")
        .file("sys/block/mmcblk0boot0/size", "8192\n")
        .file("sys/block/mmcblk0boot0/device/size", "61071360\n")
        .file("sys/block/nvme0c0n1/hidden", "1\n")
        .file("sys/block/nvme0n1/hidden", "0\n");
    EXPECT_EQ(namesOf(tree), "nvme0n1;mmcblk0;");
}

TEST(Disk, hasTheNameBelowDev) {
    RecordedTree tree;
    tree.file("sys/block/cciss!c0d0/size", "2048\n");
    EXPECT_EQ(namesOf(tree), "cciss/c0d0;");
}

TEST(Disk, keepsOddNumbersOut) {
    RecordedTree tree;
    tree.file("sys/block/sda/size", "36028797018963968\n")  // 2^55 sectors are 2^64 bytes.
        .file("sys/block/sda/queue/logical_block_size", "0\n")
        .file("sys/block/sda/queue/rotational", "7\n")
        .file("sys/block/sda/ro", "-1\n")
        .file("sys/block/sda/removable", "")
        .file("sys/block/sdb/size", "36028797018963967\n");
    const auto disks = readDisks(tree.paths());
    ASSERT_EQ(disks->size(), 2U);
    const BlockDevice& device = disks->front().device;
    EXPECT_EQ(device.sizeSectors, std::nullopt);
    EXPECT_EQ(device.sizeSectors.reason(), Absence::Filtered);
    EXPECT_EQ(device.logicalBlockBytes, std::nullopt);
    EXPECT_EQ(device.isRotational, std::nullopt);
    EXPECT_EQ(device.isReadOnly, std::nullopt);
    EXPECT_EQ(device.isRemovable.reason(), Absence::Absent);
    EXPECT_EQ(disks->back().device.sizeSectors, 36028797018963967U);
}

TEST(Disk, needsTheKernelsList) {
    RecordedTree tree;
    EXPECT_EQ(readDisks(tree.paths()).reason(), Absence::Absent);
    tree.directory("sys/block");
    EXPECT_TRUE(readDisks(tree.paths())->empty());
}

}  // namespace
}  // namespace cimomd
