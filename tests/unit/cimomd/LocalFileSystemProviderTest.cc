#include "providers/storage/LocalFileSystemProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "ScriptedSizes.h"

namespace cimomd {
namespace {

class LocalFileSystemProviderTest : public testing::Test {
  protected:
    RecordedTree tree;
    ScriptedSizes calls;
};

TEST_F(LocalFileSystemProviderTest, sizesAndKinds) {
    calls.sizes["/"] = FileSystemSize{4096, 2621440, 1310720, 655360, 600000};
    calls.sizes["/huge"] = FileSystemSize{std::uint64_t{1} << 32, std::uint64_t{1} << 40, 1, 0, 0};
    tree.file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "2 1 8:2 / /huge rw - btrfs /dev/sdb rw\n"
              "3 1 11:0 / /media/my\\040cd ro - iso9660 /dev/sr0 ro\n"
              "4 1 0:40 / /tmp rw - tmpfs tmpfs rw\n"
              "5 1 0:41 / /home rw - nfs4 server:/home rw\n");
    const auto instances = all(LocalFileSystemProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 4U);
    EXPECT_TRUE(calls.askedInTime.empty());
    EXPECT_EQ(textOf(instances[0], "Name"), "/");
    EXPECT_EQ(textOf(instances[0], "Device"), "/dev/sda1");
    EXPECT_EQ(textOf(instances[0], "BlockSize"), "4096");
    EXPECT_EQ(textOf(instances[0], "FileSystemSize"), "10737418240");
    EXPECT_EQ(textOf(instances[0], "FileSystemSizeMB"), "10240");
    EXPECT_EQ(textOf(instances[0], "AvailableSpaceMB"), "5120");
    EXPECT_EQ(textOf(instances[0], "TotalInodes"), "655360");
    EXPECT_EQ(textOf(instances[0], "FreeInodes"), "600000");
    EXPECT_EQ(textOf(instances[0], "ReadOnly"), "FALSE");
    EXPECT_EQ(textOf(instances[0], "PersistenceType"), "2");
    // 2^72 bytes do not fit 64 bits, 4 GiB do.
    EXPECT_EQ(textOf(instances[1], "FileSystemSize"), "null");
    EXPECT_EQ(textOf(instances[1], "FileSystemSizeMB"), "null");
    EXPECT_EQ(textOf(instances[1], "AvailableSpaceMB"), "4096");
    EXPECT_EQ(textOf(instances[1], "TotalInodes"), "null");
    EXPECT_EQ(textOf(instances[2], "Name"), "/media/my cd");
    EXPECT_EQ(textOf(instances[2], "ReadOnly"), "TRUE");
    EXPECT_EQ(textOf(instances[2], "PersistenceType"), "4");
    EXPECT_EQ(textOf(instances[2], "FileSystemSize"), "null");
    EXPECT_EQ(textOf(instances[3], "PersistenceType"), "3");
}

TEST_F(LocalFileSystemProviderTest, asksInTimeWhatMayHang) {
    tree.file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "2 1 0:41 / /net rw - nfs4 server:/ rw\n"
              "3 2 8:2 / /net/disk rw - xfs /dev/sdb1 rw\n"
              "4 1 8:3 / /usb rw - fuseblk /dev/sdc1 rw\n");
    calls.sizes["/usb"] = Absence::TimedOut;
    const auto stream = LocalFileSystemProvider(tree.paths(), calls).enumerate();
    ProvidedInstance provided;
    std::string names;
    while (stream->next(provided))
        names += provided.identity + ";";
    EXPECT_EQ(names, "/;/net/disk;/usb;");
    EXPECT_EQ(calls.askedInTime, (std::vector<std::string>{"8:2", "8:3"}));
    EXPECT_EQ(textOf(provided.instance, "OperationalStatus"), "12 ");
    EXPECT_EQ(textOf(provided.instance, "FileSystemSize"), "null");
    std::string timedOut;
    for (const MissingValue& missing : provided.missing)
        timedOut += missing.reason == Absence::TimedOut ? std::string(missing.property) + ";" : "";
    EXPECT_EQ(timedOut,
              "BlockSize;FileSystemSize;AvailableSpace;FileSystemSizeMB;AvailableSpaceMB;"
              "TotalInodes;FreeInodes;");
}

// Whatever the reason for which the size could not be told, the status was OK.
TEST_F(LocalFileSystemProviderTest, areNotWellWhenTheyCannotBeRead) {
    tree.file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "2 1 8:2 / /broken rw - xfs /dev/sdb1 rw\n"
              "3 1 8:3 / /gone rw - xfs /dev/sdc1 rw\n"
              "4 1 8:4 / /private rw - xfs /dev/sdd1 rw\n"
              "5 1 8:5 / /silent rw - fuseblk /dev/sde1 rw\n");
    calls.sizes["/"] = FileSystemSize{4096, 100, 50, 20, 10};
    calls.sizes["/broken"] = Absence::Unreadable;
    calls.sizes["/gone"] = Absence::Absent;
    calls.sizes["/private"] = Absence::NeedsRoot;
    calls.sizes["/silent"] = Absence::TimedOut;
    std::string statuses;
    for (const auto& instance : all(LocalFileSystemProvider(tree.paths(), calls).enumerate()))
        statuses += textOf(instance, "Name") + " " + textOf(instance, "OperationalStatus") + ";";
    EXPECT_EQ(statuses, "/ 2 ;/broken 6 ;/gone 0 ;/private 0 ;/silent 12 ;");
}

TEST_F(LocalFileSystemProviderTest, saysWhyThereAreNone) {
    const auto stream = LocalFileSystemProvider(tree.paths(), calls).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

TEST_F(LocalFileSystemProviderTest, servesItsClass) {
    tree.file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n2 1 8:2 / /a rw - xfs /dev/sdb rw\n");
    calls.sizes["/"] = FileSystemSize{4096, 2621440, 1310720, 655360, 600000};
    expectServesItsClass(LocalFileSystemProvider(tree.paths(), calls));
}

}  // namespace
}  // namespace cimomd
