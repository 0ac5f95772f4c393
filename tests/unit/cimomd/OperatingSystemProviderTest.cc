#include "providers/software/OperatingSystemProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

class OperatingSystemProviderTest : public testing::Test {
  protected:
    OperatingSystemProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    FixedSystemCalls calls;
};

TEST_F(OperatingSystemProviderTest, readsAnOrdinaryMachine) {
    tree.file("etc/os-release",
              "ID=debian\nNAME=\"Debian GNU/Linux\"\nVERSION_ID=\"12\"\n"
              "PRETTY_NAME=\"Debian GNU/Linux 12 (bookworm)\"\n")
        .file("proc/sys/kernel/osrelease", "6.1.0-18-arm64\n")
        .file("proc/meminfo",
              "MemTotal: 8388608 kB\nMemFree: 1124 kB\nSwapTotal: 2048 kB\nSwapFree: 1000 kB\n")
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
    EXPECT_EQ(textOf(system, "FreePhysicalMemory"), "1124");
    EXPECT_EQ(textOf(system, "TotalSwapSpaceSize"), "2048");
    EXPECT_EQ(textOf(system, "TotalVirtualMemorySize"), "8390656");
    EXPECT_EQ(textOf(system, "FreeVirtualMemory"), "2124");
    EXPECT_EQ(textOf(system, "TotalVisibleMemorySizeMB"), "8192");
    EXPECT_EQ(textOf(system, "FreePhysicalMemoryMB"), "1");
    EXPECT_EQ(textOf(system, "TotalSwapSpaceSizeMB"), "2");
}

TEST_F(OperatingSystemProviderTest, leavesOutWhatTheMachineDoesNotTell) {
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "Name"), "Linux");
    EXPECT_EQ(textOf(instances[0], "OSType"), "101");
    for (const char* property : {"Version", "LastBootUpTime", "NumberOfUsers", "KernelRelease",
                                 "TotalVisibleMemorySize", "DistributionId"})
        EXPECT_EQ(textOf(instances[0], property), "null") << property;
}

TEST_F(OperatingSystemProviderTest, readsTheVendorsFile) {
    tree.file("usr/lib/os-release", "ID=ubuntu\nNAME=Ubuntu\n")
        .file("proc/sys/kernel/arch", "i686\n");
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    EXPECT_EQ(textOf(instances[0], "Name"), "Ubuntu");
    EXPECT_EQ(textOf(instances[0], "OSType"), "93");
}

TEST_F(OperatingSystemProviderTest, knowsTheTypesOfDistributions) {
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
                                                  {"sles_sap", 85, 84},
                                                  {"sled", 83, 82},
                                                  {"sle_hpc", 83, 82},
                                                  {"sle-micro", 83, 82},
                                                  {"sl-micro", 83, 82},
                                                  {"suse-microos", 83, 82},
                                                  {"opensuse", 83, 82},
                                                  {"opensuse-leap", 83, 82},
                                                  {"opensuse-tumbleweed", 83, 82},
                                                  {"opensuse-microos", 83, 82},
                                                  {"ubuntu-core", 94, 93},
                                                  {"olpc", 101, 36},
                                                  {"slestuff", 101, 36},
                                                  {"deb", 101, 36},
                                                  {"arch", 101, 36}}) {
        EXPECT_EQ(OperatingSystemProvider::osTypeOf(expected.id, "x86_64"), expected.type64);
        EXPECT_EQ(OperatingSystemProvider::osTypeOf(expected.id, "armv7l"), expected.type32);
    }
    EXPECT_EQ(OperatingSystemProvider::osTypeOf(std::nullopt, "x86_64"), 101);
    EXPECT_EQ(OperatingSystemProvider::osTypeOf("debian", std::nullopt), std::nullopt);
}

TEST_F(OperatingSystemProviderTest, knowsMachinesOf64Bits) {
    for (const char* machine :
         {"x86_64", "aarch64", "aarch64_be", "ppc64", "ppc64le", "s390x", "riscv64", "mips64",
          "loongarch64", "sparc64", "ia64", "parisc64", "alpha"})
        EXPECT_EQ(OperatingSystemProvider::osTypeOf("debian", machine), 96) << machine;
    for (const char* machine : {"i386", "i686", "armv6l", "armv7l", "armv8l", "ppc", "s390",
                                "riscv32", "mips", "sparc", "parisc", "m68k"})
        EXPECT_EQ(OperatingSystemProvider::osTypeOf("debian", machine), 95) << machine;
}

TEST_F(OperatingSystemProviderTest, printsMoreMemoryThan32BitsCountInMB) {
    // 6 TiB are 6442450944 KB, of which the low 32 bits would be 2147483648.
    tree.file("proc/meminfo", "MemTotal: 6442450944 kB\nMemFree: 18446744073709551615 kB\n");
    const auto instances = all(OperatingSystemProvider(tree.paths(), calls).enumerate());
    EXPECT_EQ(textOf(instances[0], "TotalVisibleMemorySize"), "6442450944");
    EXPECT_EQ(textOf(instances[0], "TotalVisibleMemorySizeMB"), "6291456");
    EXPECT_EQ(textOf(instances[0], "FreePhysicalMemory"), "18446744073709551615");
    EXPECT_EQ(textOf(instances[0], "FreePhysicalMemoryMB"), "null");
    EXPECT_EQ(textOf(instances[0], "FreeVirtualMemory"), "null");
}

TEST_F(OperatingSystemProviderTest, servesItsClass) {
    expectServesItsClass(OperatingSystemProvider(tree.paths(), calls));
}

}  // namespace
}  // namespace cimomd
