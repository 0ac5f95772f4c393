#include "providers/storage/DiskPackageProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class DiskPackageProviderTest : public testing::Test {
  protected:
    DiskPackageProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(DiskPackageProviderTest, whoMadeItAndWhichOneItIs) {
    tree.file("sys/block/sda/device/vendor", "SEAGATE\n")
        .file("sys/block/sda/device/model", "ST4000NM0025\n")
        .file("sys/block/sda/device/serial", "ZC1A2B3C\n")
        .file("sys/block/sda/device/rev", "N004\n")
        .file("sys/block/sda/device/wwid", "naa.5000c50085a1b2c3\n")
        .directory("sys/block/vda");
    const DiskPackageProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "Tag"), "/dev/sda");
    EXPECT_EQ(textOf(instances[0], "CreationClassName"), "Velmira_DiskPackage");
    EXPECT_EQ(textOf(instances[0], "Caption"), "ST4000NM0025");
    EXPECT_EQ(textOf(instances[0], "Manufacturer"), "SEAGATE");
    EXPECT_EQ(textOf(instances[0], "Model"), "ST4000NM0025");
    EXPECT_EQ(textOf(instances[0], "SerialNumber"), "ZC1A2B3C");
    EXPECT_EQ(textOf(instances[0], "Version"), "N004");
    EXPECT_EQ(textOf(instances[0], "OtherIdentifyingInfo"), "naa.5000c50085a1b2c3");
    EXPECT_EQ(textOf(instances[1], "Tag"), "/dev/vda");
    EXPECT_EQ(textOf(instances[1], "Caption"), "vda");
    for (const char* property : {"Manufacturer", "Model", "SerialNumber", "Version",
                                 "OtherIdentifyingInfo", "PartNumber", "SKU", "Removable"})
        EXPECT_EQ(textOf(instances[1], property), "null") << property;
}

TEST_F(DiskPackageProviderTest, saysWhyThereAreNone) {
    const auto stream = DiskPackageProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
