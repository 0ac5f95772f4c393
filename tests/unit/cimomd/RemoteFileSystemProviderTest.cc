#include "providers/storage/RemoteFileSystemProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "ScriptedSizes.h"

namespace cimomd {
namespace {

class RemoteFileSystemProviderTest : public testing::Test {
  protected:
    RemoteFileSystemProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    ScriptedSizes calls;
};

TEST_F(RemoteFileSystemProviderTest, ofOtherServers) {
    tree.file("proc/self/mountinfo",
              "20 1 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "21 20 0:41 / /home rw - nfs4 nas:/home rw\n"
              "22 20 0:42 / /win rw - cifs //files/win ro\n"
              "23 20 0:43 / /ssh rw - fuse.sshfs mia@shell.example.org: rw\n"
              "24 20 0:44 / /host rw - virtiofs share rw\n");
    calls.sizes["/win"] = FileSystemSize{4096, 2621440, 1310720, 0, 0};
    const RemoteFileSystemProvider provider(tree.paths(), calls);
    expectServesItsClass(provider);
    calls.askedInTime.clear();
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 3U);
    EXPECT_EQ(calls.askedInTime, (std::vector<std::string>{"0:42", "0:43", "0:44"}));
    const auto& files = instances[0];
    EXPECT_EQ(textOf(files, "Name"), "/win");
    EXPECT_EQ(textOf(files, "Device"), "//files/win");
    EXPECT_EQ(textOf(files, "ServerName"), "files");
    EXPECT_EQ(textOf(files, "FileSystemType"), "cifs");
    EXPECT_EQ(textOf(files, "FileSystemSize"), "10737418240");
    EXPECT_EQ(textOf(files, "FileSystemSizeMB"), "10240");
    EXPECT_EQ(textOf(files, "AvailableSpaceMB"), "5120");
    EXPECT_EQ(textOf(files, "ReadOnly"), "TRUE");
    EXPECT_EQ(textOf(instances[1], "ServerName"), "shell.example.org");
    EXPECT_EQ(textOf(instances[1], "FileSystemSize"), "null");
    EXPECT_EQ(textOf(instances[2], "ServerName"), "null");
}

TEST_F(RemoteFileSystemProviderTest, saysWhyThereAreNone) {
    const auto stream = RemoteFileSystemProvider(tree.paths(), calls).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
