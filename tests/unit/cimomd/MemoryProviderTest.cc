#include "providers/computer/MemoryProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

MemoryDevice deviceOfMB(std::uint64_t megabytes) {
    MemoryDevice device;
    device.capacityBytes = megabytes << 20;
    return device;
}

ProvidedInstance published(std::uint64_t totalKB, const Fact<std::vector<MemoryDevice>>& devices) {
    return MemoryProvider::publish("node7", totalKB, devices);
}

Absence reasonOf(const ProvidedInstance& provided, const std::string& property) {
    for (const MissingValue& value : provided.missing) {
        if (value.property == property)
            return value.reason;
    }
    ADD_FAILURE() << property << " is not missing";
    return Absence::Absent;
}

TEST(MemoryProvider, sumsTheModules) {
    const auto memory = published(1048576, std::vector{deviceOfMB(512), deviceOfMB(512)});
    EXPECT_EQ(textOf(memory.instance, "TotalMB"), "1024");
    EXPECT_EQ(textOf(memory.instance, "ModulesMB"), "1024");
    EXPECT_EQ(textOf(memory.instance, "NumberOfModules"), "2");
    EXPECT_EQ(textOf(memory.instance, "FirmwareTablesShort"), "FALSE");
}

TEST(MemoryProvider, findsOutThatTheFirmwareListsTooLittle) {
    const auto memory = published(1048577, std::vector{deviceOfMB(512), deviceOfMB(512)});
    EXPECT_EQ(textOf(memory.instance, "FirmwareTablesShort"), "TRUE");
    EXPECT_EQ(textOf(memory.instance, "ModulesMB"), "null");
    EXPECT_EQ(reasonOf(memory, "ModulesMB"), Absence::Filtered);
    EXPECT_EQ(textOf(memory.instance, "NumberOfModules"), "2");
}

TEST(MemoryProvider, leavesOutMemoryOfOtherThings) {
    MemoryDevice flash = deviceOfMB(16);
    flash.isMainMemory = false;
    const auto memory = published(1024, std::vector{deviceOfMB(512), flash});
    EXPECT_EQ(textOf(memory.instance, "ModulesMB"), "512");
    EXPECT_EQ(textOf(memory.instance, "NumberOfModules"), "1");
}

TEST(MemoryProvider, cannotCompareWithModulesOfUnknownSize) {
    const auto memory = published(1024, std::vector{deviceOfMB(512), MemoryDevice{}});
    EXPECT_EQ(textOf(memory.instance, "ModulesMB"), "null");
    EXPECT_EQ(textOf(memory.instance, "FirmwareTablesShort"), "null");
    EXPECT_EQ(textOf(memory.instance, "NumberOfModules"), "2");
}

// Far beyond what prints whole in 32 bits: 8 TiB.
TEST(MemoryProvider, givesMegabytesWhereBlocksDoNotSurvive) {
    const auto memory = published(std::uint64_t{8} << 30, Absence::Absent);
    EXPECT_EQ(textOf(memory.instance, "NumberOfBlocks"), "8589934592");
    EXPECT_EQ(textOf(memory.instance, "TotalMB"), "8388608");
    EXPECT_EQ(reasonOf(published(UINT64_MAX, Absence::Absent), "TotalMB"), Absence::Filtered);
}

TEST(MemoryProvider, hasNoInstanceWithoutTheKernelsSum) {
    RecordedTree tree;
    EXPECT_EQ(MemoryProvider(tree.paths()).enumerate()->absence(), Absence::Absent);
    tree.file("proc/meminfo", "MemFree: 5 kB\n");
    EXPECT_EQ(MemoryProvider(tree.paths()).enumerate()->absence(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
