#include "system/processor/ProcessorPackage.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

constexpr std::string_view kX86 =
    "processor\t: 0\nvendor_id\t: GenuineIntel\nmodel name\t: Intel(R) Xeon(R) CPU @ 2.20GHz\n"
    "stepping\t: 7\ncpu MHz\t\t: 2199.998\nphysical id\t: 0\ncore id\t\t: 0\n"
    "flags\t\t: fpu vme lm sse\n\n"
    "processor\t: 1\nvendor_id\t: GenuineIntel\nmodel name\t: Intel(R) Xeon(R) CPU @ 2.20GHz\n"
    "stepping\t: 7\ncpu MHz\t\t: 2300.500\nphysical id\t: 0\ncore id\t\t: 0\n"
    "flags\t\t: fpu vme lm sse\n\n";

constexpr std::string_view kArm =
    "processor\t: 0\nBogoMIPS\t: 108.00\nFeatures\t: fp asimd\nCPU implementer\t: 0x41\n"
    "CPU architecture: 8\nCPU variant\t: 0x0\nCPU part\t: 0xd08\nCPU revision\t: 3\n\n"
    "Hardware\t: BCM2711\nRevision\t: c03111\n";

LogicalProcessor logical(std::uint64_t number, std::int64_t package, std::int64_t core) {
    LogicalProcessor processor;
    processor.number = number;
    processor.packageId = package;
    processor.coreId = core;
    return processor;
}

TEST(CpuInfo, readsX86) {
    const auto infos = parseCpuInfo(kX86);
    ASSERT_EQ(infos.size(), 2U);
    EXPECT_EQ(infos[1].processor, 1U);
    EXPECT_EQ(infos[1].vendor, "GenuineIntel");
    EXPECT_EQ(infos[1].model, "Intel(R) Xeon(R) CPU @ 2.20GHz");
    EXPECT_EQ(infos[1].stepping, "7");
    EXPECT_EQ(infos[1].currentMHz, 2300.5);
    EXPECT_EQ(infos[1].packageId, 0);
    EXPECT_EQ(infos[1].coreId, 0);
    EXPECT_EQ(infos[1].width, 64);
}

TEST(CpuInfo, describesArmWithoutAModelName) {
    const auto infos = parseCpuInfo(kArm);
    ASSERT_EQ(infos.size(), 1U);
    EXPECT_EQ(infos[0].vendor, "ARM");
    EXPECT_EQ(infos[0].model, "Cortex-A72");
    EXPECT_EQ(infos[0].stepping, "3");
    EXPECT_EQ(infos[0].width, 64);
    EXPECT_EQ(infos[0].packageId, std::nullopt);
}

TEST(CpuInfo, leavesOutWhatItCannotRead) {
    EXPECT_TRUE(parseCpuInfo("").empty());
    EXPECT_TRUE(parseCpuInfo("processor : first\n\nmodel name : x\n").empty());
    const auto infos = parseCpuInfo("processor: 0\ncpu MHz: fast\nmodel name:\nflags: fpu\n");
    ASSERT_EQ(infos.size(), 1U);
    EXPECT_EQ(infos[0].currentMHz, std::nullopt);
    EXPECT_EQ(infos[0].model, std::nullopt);
    EXPECT_EQ(infos[0].width, 32);
}

TEST(CpuInfo, keepsTheNumbersOfUnknownArmProcessors) {
    const auto infos = parseCpuInfo(
        "processor: 0\nCPU implementer: 0x61\nCPU part: 0xd08\n\n"
        "processor: 1\nCPU implementer: 0xee\nCPU part: 0x1\n\n"
        "processor: 2\nCPU implementer: me\nCPU part: 0xd08\n");
    ASSERT_EQ(infos.size(), 3U);
    EXPECT_EQ(infos[0].vendor, "Apple");
    EXPECT_EQ(infos[0].model, "ARM implementer 0x61 part 0xd08");
    EXPECT_EQ(infos[1].vendor, std::nullopt);
    EXPECT_EQ(infos[1].model, "ARM implementer 0xee part 0x1");
    EXPECT_EQ(infos[2].vendor, std::nullopt);
}

TEST(LogicalProcessor, readsTopologyInNumericOrder) {
    RecordedTree tree;
    for (const char* number : {"10", "2"}) {
        const std::string base = std::string("cpu/cpu") + number;
        tree.file(base + "/topology/physical_package_id", "1\n")
            .file(base + "/topology/core_id", std::string(number) + "\n")
            .file(base + "/cpufreq/cpuinfo_max_freq", "3600000\n");
    }
    tree.directory("cpu/cpu11").directory("cpu/cpufreq").directory("cpu/cpuidle");
    const auto processors = readLogicalProcessors(tree.root / "cpu");
    ASSERT_EQ(processors.size(), 3U);
    EXPECT_EQ(processors[0].number, 2U);
    EXPECT_EQ(processors[0].packageId, 1);
    EXPECT_EQ(processors[0].coreId, 2);
    EXPECT_EQ(processors[0].maxKHz, 3600000U);
    EXPECT_EQ(processors[1].number, 10U);
    EXPECT_EQ(processors[2].packageId, std::nullopt);
    EXPECT_TRUE(readLogicalProcessors(tree.root / "none").empty());
}

TEST(ProcessorPackage, countsCoresAndThreadsOfEachSocket) {
    std::vector<LogicalProcessor> processors{logical(0, 0, 0), logical(1, 0, 0), logical(2, 0, 1),
                                             logical(3, 1, 0)};
    processors[0].maxKHz = 2000000;
    processors[1].maxKHz = 2100999;
    const auto packages = groupByPackage(processors, parseCpuInfo(kX86));
    ASSERT_EQ(packages.size(), 2U);
    EXPECT_EQ(packages[0].number, 0);
    EXPECT_EQ(packages[0].cores, 2);
    EXPECT_EQ(packages[0].threads, 3);
    EXPECT_EQ(packages[0].maxMHz, 2100U);
    EXPECT_EQ(packages[0].currentMHz, 2301U);
    EXPECT_EQ(packages[0].model, "Intel(R) Xeon(R) CPU @ 2.20GHz");
    EXPECT_EQ(packages[1].number, 1);
    EXPECT_EQ(packages[1].threads, 1);
    EXPECT_EQ(packages[1].maxMHz, std::nullopt);
    EXPECT_EQ(packages[1].model, std::nullopt);
}

TEST(ProcessorPackage, keepsCoresOfDifferentDiesApart) {
    std::vector<LogicalProcessor> processors{logical(0, 0, 0), logical(1, 0, 0)};
    processors[0].dieId = 0;
    processors[1].dieId = 1;
    EXPECT_EQ(groupByPackage(processors, {})[0].cores, 2);
}

TEST(ProcessorPackage, takesAPackageWithoutANumberAsTheFirst) {
    const auto packages = groupByPackage({logical(0, -1, 0), logical(1, -1, 1)}, {});
    ASSERT_EQ(packages.size(), 1U);
    EXPECT_EQ(packages[0].number, 0);
    EXPECT_EQ(packages[0].cores, 2);
}

TEST(ProcessorPackage, leavesOutProcessorsThatAreOffLine) {
    LogicalProcessor offline;
    offline.number = 1;
    const auto packages = groupByPackage({logical(0, 0, 0), offline}, {});
    ASSERT_EQ(packages.size(), 1U);
    EXPECT_EQ(packages[0].threads, 1);
}

TEST(ProcessorPackage, doesWithoutTopology) {
    const auto packages = groupByPackage({}, parseCpuInfo(kX86));
    ASSERT_EQ(packages.size(), 1U);
    EXPECT_EQ(packages[0].cores, 1);
    EXPECT_EQ(packages[0].threads, 2);
    const auto arm = groupByPackage({}, parseCpuInfo(kArm));
    ASSERT_EQ(arm.size(), 1U);
    EXPECT_EQ(arm[0].number, 0);
    EXPECT_EQ(arm[0].cores, std::nullopt);
}

}  // namespace
}  // namespace cimomd
