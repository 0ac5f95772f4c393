// What a process without rights sees of a machine whose tables only root may read.

#include <gtest/gtest.h>

#include <map>

#include "RecordedTree.h"
#include "SmbiosBytes.h"
#include "WithoutRights.h"
#include "providers/computer/BiosElementProvider.h"
#include "providers/computer/BoardProvider.h"
#include "providers/computer/ChassisProvider.h"
#include "providers/computer/ComputerSystemProvider.h"
#include "providers/computer/MemoryProvider.h"
#include "providers/computer/PhysicalMemoryProvider.h"
#include "providers/computer/SlotProvider.h"

namespace cimomd {
namespace {

using Reasons = std::map<std::string, Absence>;

class FirmwareRights : public testing::Test {
  protected:
    FirmwareRights() {
        const std::string tables = "sys/firmware/dmi/tables/";
        recordSmbios(tree, {SmbiosFields(17, 0x1B).word(0x0C, 8192)});
        tree.file("proc/meminfo", "MemTotal: 8000000 kB\n");
        for (const char* file : {"smbios_entry_point", "DMI"})
            forbid(tree, tables + file);
    }

    void kernelFile(const std::string& name, const std::string& text) {
        tree.file("sys/class/dmi/id/" + name, text + "\n");
    }
    void rootsFile(const std::string& name) {
        kernelFile(name, "secret");
        forbid(tree, "sys/class/dmi/id/" + name);
    }

    /// The reasons of the only instance's nulls.
    static Reasons reasonsOf(const Provider& provider) {
        const WithoutRights rights;
        Reasons reasons;
        const auto stream = provider.enumerate();
        ProvidedInstance provided;
        EXPECT_TRUE(stream->next(provided));
        for (const MissingValue& value : provided.missing)
            reasons[value.property] = value.reason;
        ProvidedInstance none;
        EXPECT_FALSE(stream->next(none));
        return reasons;
    }

    static void expectNone(const Provider& provider) {
        const WithoutRights rights;
        const auto stream = provider.enumerate();
        ProvidedInstance none;
        EXPECT_FALSE(stream->next(none));
        EXPECT_EQ(stream->absence(), Absence::NeedsRoot);
    }

    RecordedTree tree;
};

TEST_F(FirmwareRights, computer) {
    kernelFile("sys_vendor", "Maker");
    kernelFile("product_version", "None");
    rootsFile("product_serial");
    rootsFile("product_uuid");
    const Reasons reasons = reasonsOf(ComputerSystemProvider(tree.paths()));
    EXPECT_EQ(reasons.count("Manufacturer"), 0U);
    EXPECT_EQ(reasons.at("SerialNumber"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("UUID"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("OtherIdentifyingInfo"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("ResetCapability"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("WakeUpType"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("ModelVersion"), Absence::Filtered);
    EXPECT_EQ(reasons.at("MachineId"), Absence::Absent);
}

TEST_F(FirmwareRights, chassis) {
    kernelFile("chassis_type", "11");
    rootsFile("chassis_serial");
    const Reasons reasons = reasonsOf(ChassisProvider(tree.paths()));
    EXPECT_EQ(reasons.count("ChassisPackageType"), 0U);
    for (const char* property : {"SerialNumber", "LockPresent", "SKU", "NumberOfPowerCords"})
        EXPECT_EQ(reasons.at(property), Absence::NeedsRoot) << property;
    EXPECT_EQ(reasons.at("Model"), Absence::Absent);
}

TEST_F(FirmwareRights, boards) {
    kernelFile("board_name", "B7");
    rootsFile("board_serial");
    const Reasons reasons = reasonsOf(BoardProvider(tree.paths()));
    EXPECT_EQ(reasons.count("HostingBoard"), 0U);
    for (const char* property : {"SerialNumber", "Removable", "Location"})
        EXPECT_EQ(reasons.at(property), Absence::NeedsRoot) << property;
    EXPECT_EQ(reasons.at("PartNumber"), Absence::Absent);
}

TEST_F(FirmwareRights, firmware) {
    kernelFile("bios_version", "1.2");
    kernelFile("bios_date", "02/30/2020");
    const Reasons reasons = reasonsOf(BiosElementProvider(tree.paths()));
    EXPECT_EQ(reasons.at("RomSizeKB"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("Manufacturer"), Absence::NeedsRoot);
    EXPECT_EQ(reasons.at("ReleaseDate"), Absence::Unreadable);
}

// The kernel's sum would be a guess about the modules.
TEST_F(FirmwareRights, hideModulesAndSlots) {
    expectNone(PhysicalMemoryProvider(tree.paths()));
    expectNone(SlotProvider(tree.paths()));
}

TEST_F(FirmwareRights, hideAllWhenTheKernelHandsOnNothing) {
    expectNone(ChassisProvider(tree.paths()));
    expectNone(BoardProvider(tree.paths()));
    expectNone(BiosElementProvider(tree.paths()));
}

TEST_F(FirmwareRights, leaveTheKernelsSumOfMemory) {
    const Reasons reasons = reasonsOf(MemoryProvider(tree.paths()));
    EXPECT_EQ(reasons.count("NumberOfBlocks"), 0U);
    for (const char* property : {"ModulesMB", "NumberOfModules", "FirmwareTablesShort"})
        EXPECT_EQ(reasons.at(property), Absence::NeedsRoot) << property;
}

}  // namespace
}  // namespace cimomd
