#include "system/storage/Partition.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

class PartitionTest : public testing::Test {
  protected:
    void disk(const std::string& name) {
        tree.file("sys/class/block/" + name + "/size", "1000215216\n");
    }
    void partition(const std::string& name, int number, const std::string& sectors) {
        const std::string base = "sys/class/block/" + name;
        tree.file(base + "/partition", std::to_string(number) + "\n")
            .file(base + "/size", sectors + "\n");
    }

    /// "name on disk kind;" of each: P primary, E extended, L logical.
    std::string listed() const {
        std::string text;
        const auto partitions = readPartitions(tree.paths());
        for (const Partition& found : partitions.value()) {
            const char* kinds = "PEL";
            text += found.name + " on " + found.disk.value_or("nothing") + " " +
                    kinds[static_cast<int>(found.kind)] + ";";
        }
        return text;
    }

    RecordedTree tree;
};

TEST_F(PartitionTest, isOnTheDiskWhoseNameItBears) {
    disk("sda");
    partition("sda1", 1, "2048");
    partition("sda10", 10, "2048");
    disk("sdp");
    partition("sdp1", 1, "2048");
    disk("nvme0n1");
    partition("nvme0n1p2", 2, "2048");
    disk("mmcblk0");
    partition("mmcblk0p1", 1, "2048");
    disk("cciss!c0d0");
    partition("cciss!c0d0p3", 3, "2048");
    partition("sdz1", 1, "2048");
    EXPECT_EQ(listed(),
              "sda1 on sda P;sda10 on sda P;sdp1 on sdp P;sdz1 on nothing P;"
              "nvme0n1p2 on nvme0n1 P;mmcblk0p1 on mmcblk0 P;cciss/c0d0p3 on cciss/c0d0 P;");
}

TEST_F(PartitionTest, logicalOnesNeedAnExtendedOne) {
    disk("sda");
    partition("sda1", 1, "2048");
    partition("sda2", 2, "2");
    partition("sda5", 5, "2048");
    disk("sdb");
    partition("sdb1", 1, "2048");
    partition("sdb5", 5, "2048");
    EXPECT_EQ(listed(), "sda1 on sda P;sda2 on sda E;sda5 on sda L;sdb1 on sdb P;sdb5 on sdb P;");
}

TEST_F(PartitionTest, theExtendedOneShowsABlockOfTheDisk) {
    disk("sda");
    partition("sda1", 1, "8");
    partition("sda5", 5, "2048");
    EXPECT_EQ(listed(), "sda1 on sda P;sda5 on sda P;");
    tree.file("sys/class/block/sda/queue/logical_block_size", "4096\n");
    EXPECT_EQ(listed(), "sda1 on sda E;sda5 on sda L;");
}

TEST_F(PartitionTest, udevKnowsTheTable) {
    disk("sda");
    partition("sda1", 1, "2");
    partition("sda5", 5, "2048");
    tree.file("sys/class/block/sda1/dev", "8:1\n")
        .file("run/udev/data/b8:1",
              "E:ID_PART_ENTRY_SCHEME=gpt\nE:ID_PART_ENTRY_TYPE=21686148-6449\n");
    EXPECT_EQ(listed(), "sda1 on sda P;sda5 on sda P;");
    tree.file("run/udev/data/b8:1", "E:ID_PART_ENTRY_SCHEME=dos\nE:ID_PART_ENTRY_TYPE=0x83\n");
    EXPECT_EQ(listed(), "sda1 on sda P;sda5 on sda P;");
    for (const char* type : {"0x5", "0xf", "0x85"}) {
        tree.file("run/udev/data/b8:1", std::string("E:ID_PART_ENTRY_SCHEME=dos\n") +
                                            "E:ID_PART_ENTRY_TYPE=" + type + "\n");
        EXPECT_EQ(listed(), "sda1 on sda E;sda5 on sda L;") << type;
    }
}

TEST_F(PartitionTest, hasItsPlaceAndSize) {
    disk("sda");
    partition("sda1", 1, "1048576");
    tree.file("sys/class/block/sda1/start", "2048\n").file("sys/class/block/sda1/ro", "1\n");
    const auto partitions = readPartitions(tree.paths());
    ASSERT_EQ(partitions->size(), 1U);
    EXPECT_EQ(partitions->front().number, 1U);
    EXPECT_EQ(partitions->front().startSectors, 2048U);
    EXPECT_EQ(partitions->front().sizeSectors, 1048576U);
    EXPECT_EQ(partitions->front().isReadOnly, true);
}

TEST_F(PartitionTest, oddFilesGiveNothing) {
    disk("1");
    partition("7", 1, "");
    tree.file("sys/class/block/x/partition", "one\n")
        .file("sys/class/block/p1/partition", "1\n")
        .file("sys/class/block/p1/size", "99999999999999999999\n");
    EXPECT_EQ(listed(), "7 on nothing P;p1 on nothing P;");
    EXPECT_EQ(readPartitions(tree.paths())->back().sizeSectors, std::nullopt);
    EXPECT_EQ(readPartitions(RecordedTree().paths()).reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
