// Every provider on recorded machines: an ordinary one, an odd one, and one that gives nothing.

#include <gtest/gtest.h>

#include <algorithm>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "providers/CimTime.h"
#include "providers/ProviderList.h"
#include "providers/software/OperatingSystemProvider.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

class FixedSystemCalls : public SystemCalls {
  public:
    std::int64_t now() const override { return 1700000000; }
    int utcOffsetMinutes(std::int64_t time) const override { return time < 1690000000 ? 120 : 60; }
    Fact<FileSystemSize> fileSystemSize(const std::string&) const override { return std::nullopt; }
    std::optional<std::string> machine() const override { return "aarch64"; }
};

class ProvidersTest : public testing::Test {
  protected:
    ProvidersTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    FixedSystemCalls calls;
};

TEST_F(ProvidersTest, operatingSystem) {
    tree.file("etc/os-release",
              "ID=debian\nNAME=\"Debian GNU/Linux\"\nVERSION_ID=\"12\"\n"
              "PRETTY_NAME=\"Debian GNU/Linux 12 (bookworm)\"\n")
        .file("proc/sys/kernel/osrelease", "6.1.0-18-arm64\n")
        .file("proc/meminfo", "MemTotal: 8388608 kB\nMemFree: 100 kB\nSwapTotal: 0 kB\n")
        .file("proc/stat", "btime 1689999999\n")
        .directory("proc/1")
        .directory("proc/4711")
        .directory("proc/self")
        .file("run/utmp", "");
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    const CIMInstance& system = instances[0];
    EXPECT_EQ(textOf(system, "Name"), "Debian GNU/Linux");
    EXPECT_EQ(textOf(system, "Caption"), "Debian GNU/Linux 12 (bookworm)");
    EXPECT_EQ(textOf(system, "CSName"), "node7");
    EXPECT_EQ(textOf(system, "CSCreationClassName"), "Velmira_ComputerSystem");
    EXPECT_EQ(textOf(system, "OSType"), "96");
    EXPECT_EQ(textOf(system, "Version"), "12");
    EXPECT_EQ(textOf(system, "KernelRelease"), "6.1.0-18-arm64");
    EXPECT_EQ(textOf(system, "Architecture"), "aarch64");
    // 1689999999 is 22 July 2023, 04:26:39 UTC; 1700000000 is 14 November 2023, 22:13:20 UTC.
    EXPECT_EQ(textOf(system, "LastBootUpTime"), "20230722062639.000000+120");
    EXPECT_EQ(textOf(system, "LocalDateTime"), "20231114231320.000000+060");
    EXPECT_EQ(textOf(system, "CurrentTimeZone"), "60");
    EXPECT_EQ(textOf(system, "NumberOfProcesses"), "2");
    EXPECT_EQ(textOf(system, "NumberOfUsers"), "0");
    EXPECT_EQ(textOf(system, "TotalVisibleMemorySize"), "8388608");
    EXPECT_EQ(textOf(system, "FreePhysicalMemory"), "100");
    EXPECT_EQ(textOf(system, "TotalSwapSpaceSize"), "0");
}

TEST_F(ProvidersTest, operatingSystemOfAMachineThatTellsNothing) {
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "Name"), "Linux");
    EXPECT_EQ(textOf(instances[0], "OSType"), "101");
    for (const char* property : {"Version", "LastBootUpTime", "NumberOfUsers", "KernelRelease",
                                 "TotalVisibleMemorySize", "DistributionId"})
        EXPECT_EQ(textOf(instances[0], property), "null") << property;
}

TEST_F(ProvidersTest, operatingSystemFromTheVendorsFile) {
    tree.file("usr/lib/os-release", "ID=ubuntu\nNAME=Ubuntu\n")
        .file("proc/sys/kernel/arch", "i686\n");
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    EXPECT_EQ(textOf(instances[0], "Name"), "Ubuntu");
    EXPECT_EQ(textOf(instances[0], "OSType"), "93");
}

TEST(OperatingSystemProvider, knowsTheTypesOfDistributions) {
    struct Case {
        const char* id;
        std::uint16_t type64;
        std::uint16_t type32;
    };
    for (const Case& expected : std::vector<Case>{{"debian", 96, 95},
                                                  {"ubuntu", 94, 93},
                                                  {"rhel", 80, 79},
                                                  {"centos", 107, 106},
                                                  {"ol", 109, 108},
                                                  {"sles", 85, 84},
                                                  {"opensuse-leap", 83, 82},
                                                  {"arch", 101, 36}}) {
        EXPECT_EQ(OperatingSystemProvider::osTypeOf(expected.id, "x86_64"), expected.type64);
        EXPECT_EQ(OperatingSystemProvider::osTypeOf(expected.id, "armv7l"), expected.type32);
    }
    EXPECT_EQ(OperatingSystemProvider::osTypeOf(std::nullopt, "x86_64"), 101);
    EXPECT_EQ(OperatingSystemProvider::osTypeOf("debian", std::nullopt), std::nullopt);
}

TEST(CimTime, writesLocalTimeWithItsOffset) {
    EXPECT_EQ(utf8Of(cimTimeOf(0, 0)->toString()), "19700101000000.000000+000");
    EXPECT_EQ(utf8Of(cimTimeOf(0, -90)->toString()), "19691231223000.000000-090");
    EXPECT_EQ(utf8Of(cimTimeOf(253402300799, 0)->toString()), "99991231235959.000000+000");
    EXPECT_FALSE(cimTimeOf(253402300800, 0));
    EXPECT_FALSE(cimTimeOf(253402300799, 1));
    EXPECT_FALSE(cimTimeOf(INT64_MAX, 60));
    EXPECT_FALSE(cimTimeOf(0, 1000));
}

TEST_F(ProvidersTest, serveWhatTheSchemaDeclares) {
    tree.file("proc/cpuinfo", "processor: 0\n")
        .file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "2 1 0:41 / /home rw - nfs4 nas:/home rw\n"
              "3 1 0:42 / /win rw - cifs //files/win rw\n")
        .directory("sys/block/sda")
        .directory("sys/block/sr0")
        .directory("sys/block/dm-0/dm")
        .file("sys/class/block/sda1/partition", "1\n")
        .file("sys/class/net/eth0/type", "1\n")
        .directory("sys/class/net/eth0/device");
    for (const auto& provider : makeProviders(tree.paths(), calls)) {
        // Hardware that this machine lacks has tests of its own.
        if (!all(provider->enumerate()).empty())
            expectServesItsClass(*provider);
    }
}

}  // namespace
}  // namespace cimomd
