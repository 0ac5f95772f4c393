#include "providers/storage/CDROMDriveProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class CDROMDriveProviderTest : public testing::Test {
  protected:
    CDROMDriveProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(CDROMDriveProviderTest, abilities) {
    tree.file("sys/block/sr0/removable", "1\n")
        .file("sys/block/sr0/size", "1456128\n")
        .file("sys/block/sr0/queue/logical_block_size", "2048\n")
        .file("sys/block/sr0/device/vendor", "HL-DT-ST\n")
        .file("sys/block/sr0/device/model", "DVDRAM GH24NSD1\n")
        .file("sys/block/sr0/device/rev", "LG00\n")
        .file("sys/block/sr0/device/state", "running\n")
        .directory("sys/block/sr1")
        .file("proc/sys/dev/cdrom/info",
              "drive name:\tsr0\ndrive speed:\t48\nCan write CD-R:\t0\nCan write CD-RW:\t0\n"
              "Can read DVD:\t1\nCan write DVD-R:\t1\nCan write DVD-RAM:\t0\n");
    const CDROMDriveProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    const auto& drive = instances[0];
    EXPECT_EQ(textOf(drive, "DeviceID"), "sr0");
    EXPECT_EQ(textOf(drive, "Name"), "/dev/sr0");
    EXPECT_EQ(textOf(drive, "Capabilities"), "3 4 7 ");
    EXPECT_EQ(textOf(drive, "MaxMediaSize"), "null");
    EXPECT_EQ(textOf(drive, "DefaultBlockSize"), "2048");
    EXPECT_EQ(textOf(drive, "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(drive, "Manufacturer"), "HL-DT-ST");
    EXPECT_EQ(textOf(drive, "Model"), "DVDRAM GH24NSD1");
    EXPECT_EQ(textOf(drive, "FirmwareVersion"), "LG00");
    EXPECT_EQ(textOf(drive, "DriveSpeed"), "48");
    EXPECT_EQ(textOf(drive, "WritesCDR"), "FALSE");
    EXPECT_EQ(textOf(drive, "ReadsDVD"), "TRUE");
    EXPECT_EQ(textOf(drive, "WritesDVDR"), "TRUE");
    EXPECT_EQ(textOf(instances[1], "Capabilities"), "3 ");
    EXPECT_EQ(textOf(instances[1], "DriveSpeed"), "null");
    EXPECT_EQ(textOf(instances[1], "ReadsDVD"), "null");
}

TEST_F(CDROMDriveProviderTest, aSpeedOfZeroIsNone) {
    tree.directory("sys/block/sr0")
        .file("proc/sys/dev/cdrom/info", "drive name:\tsr0\ndrive speed:\t0\n");
    const auto instances = all(CDROMDriveProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "DriveSpeed"), "null");
}

TEST_F(CDROMDriveProviderTest, saysWhyThereAreNone) {
    const auto stream = CDROMDriveProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
