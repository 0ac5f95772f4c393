#include "providers/storage/NFSProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "ScriptedSizes.h"

namespace cimomd {
namespace {

class NFSProviderTest : public testing::Test {
  protected:
    NFSProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    ScriptedSizes calls;
};

TEST_F(NFSProviderTest, sizesAndOptions) {
    tree.file("proc/self/mountinfo",
              "20 1 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "21 20 0:41 / /home rw,relatime - nfs4 nas:/export/home "
              "rw,vers=4.2,rsize=1048576,wsize=524288,hard,proto=tcp,timeo=600,retrans=2\n"
              "22 20 0:42 / /dead ro - nfs [2001:db8::1]:/x ro,vers=3,soft,noac,acregmin=0\n"
              "23 20 0:43 / /win rw - cifs //files/win rw\n");
    calls.sizes["/home"] = FileSystemSize{1048576, 8388608, 4194304, 0, 0};
    calls.sizes["/dead"] = Absence::TimedOut;
    const NFSProvider provider(tree.paths(), calls);
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    const auto& home = instances[0];
    EXPECT_EQ(textOf(home, "Name"), "/home");
    EXPECT_EQ(textOf(home, "CSName"), "node7");
    EXPECT_EQ(textOf(home, "Device"), "nas:/export/home");
    EXPECT_EQ(textOf(home, "ServerName"), "nas");
    EXPECT_EQ(textOf(home, "FileSystemType"), "nfs4");
    // 8,388,608 blocks of 1 MiB are 8 TiB.
    EXPECT_EQ(textOf(home, "FileSystemSize"), "8796093022208");
    EXPECT_EQ(textOf(home, "FileSystemSizeMB"), "8388608");
    EXPECT_EQ(textOf(home, "AvailableSpaceMB"), "4194304");
    EXPECT_EQ(textOf(home, "PersistenceType"), "2");
    EXPECT_EQ(textOf(home, "OperationalStatus"), "2 ");
    EXPECT_EQ(textOf(home, "NFSVersion"), "4.2");
    EXPECT_EQ(textOf(home, "TransportProtocol"), "tcp");
    EXPECT_EQ(textOf(home, "HardMount"), "TRUE");
    EXPECT_EQ(textOf(home, "RetransmissionAttempts"), "2");
    EXPECT_EQ(textOf(home, "RetransmissionTimeout"), "600");
    EXPECT_EQ(textOf(home, "ReadBufferSize"), "1048576");
    EXPECT_EQ(textOf(home, "WriteBufferSize"), "524288");
    EXPECT_EQ(textOf(home, "AttributeCaching"), "TRUE");
    EXPECT_EQ(textOf(home, "ServerCommunicationPort"), "null");
    const auto& dead = instances[1];
    EXPECT_EQ(textOf(dead, "ServerName"), "2001:db8::1");
    EXPECT_EQ(textOf(dead, "OperationalStatus"), "12 ");
    EXPECT_EQ(textOf(dead, "FileSystemSizeMB"), "null");
    EXPECT_EQ(textOf(dead, "ReadOnly"), "TRUE");
    EXPECT_EQ(textOf(dead, "HardMount"), "FALSE");
    EXPECT_EQ(textOf(dead, "AttributeCaching"), "FALSE");
    EXPECT_EQ(textOf(dead, "AttributeCachingForRegularFilesMin"), "0");
}

TEST_F(NFSProviderTest, asksOnlyInTime) {
    tree.file("proc/self/mountinfo", "21 20 0:41 / /home rw - nfs nas:/home rw\n");
    all(NFSProvider(tree.paths(), calls).enumerate());
    EXPECT_EQ(calls.askedInTime, std::vector<std::string>{"0:41"});
}

TEST_F(NFSProviderTest, anOrdinaryMachineHasNone) {
    tree.file("proc/self/mountinfo", "20 1 8:1 / / rw - ext4 /dev/sda1 rw\n");
    const auto stream = NFSProvider(tree.paths(), calls).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), std::nullopt);
}

TEST_F(NFSProviderTest, saysWhyThereAreNone) {
    const auto stream = NFSProvider(tree.paths(), calls).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
