#include "system/storage/OpticalDrive.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

constexpr std::string_view kTable =
    "CD-ROM information, Id: cdrom.c 3.20 2003/12/17\n\n"
    "drive name:\t\tsr1\tsr0\n"
    "drive speed:\t\t48\t24\n"
    "drive # of slots:\t1\t1\n"
    "Can close tray:\t\t1\t1\n"
    "Can write CD-R:\t\t1\t0\n"
    "Can write CD-RW:\t1\t0\n"
    "Can read DVD:\t\t1\t1\n"
    "Can write DVD-R:\t1\t0\n"
    "Can write DVD-RAM:\t0\t0\n\n\n";

TEST(CdromInfo, hasAColumnForEachDrive) {
    const auto drives = parseCdromInfo(kTable);
    ASSERT_EQ(drives.size(), 2U);
    EXPECT_EQ(drives.at("sr0").speed, 24U);
    EXPECT_EQ(drives.at("sr0").writesCdR, false);
    EXPECT_EQ(drives.at("sr0").readsDvd, true);
    EXPECT_EQ(drives.at("sr1").speed, 48U);
    EXPECT_EQ(drives.at("sr1").writesCdR, true);
    EXPECT_EQ(drives.at("sr1").writesCdRw, true);
    EXPECT_EQ(drives.at("sr1").writesDvdR, true);
    EXPECT_EQ(drives.at("sr1").writesDvdRam, false);
}

TEST(CdromInfo, canBeIncomplete) {
    EXPECT_TRUE(parseCdromInfo("").empty());
    EXPECT_TRUE(parseCdromInfo("drive name:\n").empty());
    const auto drives = parseCdromInfo(
        "drive name: sr0 sr1\ndrive speed: 24\nCan read DVD: 2 x\nCan write CD-R: -1 1\n");
    EXPECT_EQ(drives.at("sr0").readsDvd, std::nullopt);
    EXPECT_EQ(drives.at("sr0").writesCdR, std::nullopt);
    EXPECT_EQ(drives.at("sr1").speed, std::nullopt);
    EXPECT_EQ(drives.at("sr1").readsDvd, std::nullopt);
    EXPECT_EQ(drives.at("sr1").writesCdR, true);
}

TEST(OpticalDrive, isAnSr) {
    RecordedTree tree;
    tree.file("sys/block/sr1/device/model", "BD-RE BH16NS55\n")
        .file("sys/block/sr0/size", "0\n")
        .file("sys/block/sr10/size", "0\n")
        .file("sys/block/srx/size", "0\n")
        .file("sys/block/sda/size", "0\n")
        .file("proc/sys/dev/cdrom/info", kTable);
    const auto drives = readOpticalDrives(tree.paths());
    ASSERT_EQ(drives->size(), 3U);
    EXPECT_EQ((*drives)[0].device.name, "sr0");
    EXPECT_EQ((*drives)[0].abilities.speed, 24U);
    EXPECT_EQ((*drives)[1].identity.model, std::string("BD-RE BH16NS55"));
    EXPECT_EQ((*drives)[1].abilities.speed, 48U);
    EXPECT_EQ((*drives)[2].abilities.speed, std::nullopt);
    EXPECT_EQ(readOpticalDrives(RecordedTree().paths()).reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
