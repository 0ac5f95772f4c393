#include "providers/computer/PhysicalMemoryProvider.h"

#include <gtest/gtest.h>

#include <map>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

std::string ofType(std::uint8_t type, const char* property) {
    MemoryDevice device;
    device.type = type;
    return textOf(PhysicalMemoryProvider::publish(device).instance, property);
}

std::string formOf(std::uint8_t form) {
    MemoryDevice device;
    device.formFactor = form;
    return textOf(PhysicalMemoryProvider::publish(device).instance, "FormFactor");
}

TEST(PhysicalMemoryProvider, knowsTheTypesOfMemory) {
    const std::map<std::uint8_t, std::pair<const char*, const char*>> expected{
        {0, {"null", "null"}},  {1, {"1", "null"}},     {2, {"0", "null"}},
        {3, {"2", "DRAM"}},     {4, {"6", "EDRAM"}},    {5, {"7", "VRAM"}},
        {6, {"8", "SRAM"}},     {7, {"9", "RAM"}},      {8, {"10", "ROM"}},
        {9, {"11", "Flash"}},   {10, {"12", "EEPROM"}}, {11, {"13", "FEPROM"}},
        {12, {"14", "EPROM"}},  {13, {"15", "CDRAM"}},  {14, {"16", "3DRAM"}},
        {15, {"17", "SDRAM"}},  {16, {"18", "SGRAM"}},  {17, {"19", "RDRAM"}},
        {18, {"20", "DDR"}},    {19, {"21", "DDR2"}},   {20, {"23", "DDR2 FB-DIMM"}},
        {21, {"1", "null"}},    {24, {"24", "DDR3"}},   {25, {"25", "FBD2"}},
        {26, {"26", "DDR4"}},   {27, {"27", "LPDDR"}},  {28, {"28", "LPDDR2"}},
        {29, {"29", "LPDDR3"}}, {30, {"30", "LPDDR4"}}, {31, {"1", "Logical non-volatile device"}},
        {32, {"1", "HBM"}},     {33, {"1", "HBM2"}},    {34, {"1", "DDR5"}},
        {35, {"1", "LPDDR5"}},  {36, {"1", "HBM3"}},    {37, {"1", "null"}},
        {255, {"1", "null"}}};
    for (const auto& [type, texts] : expected) {
        EXPECT_EQ(ofType(type, "MemoryType"), texts.first) << int{type};
        EXPECT_EQ(ofType(type, "Description"), texts.second) << int{type};
    }
}

TEST(PhysicalMemoryProvider, knowsTheFormsOfModules) {
    const std::map<std::uint8_t, const char*> expected{
        {0, "0"},   {1, "1"},   {2, "0"},   {3, "7"},  {4, "2"},  {5, "1"},
        {6, "3"},   {7, "4"},   {8, "6"},   {9, "8"},  {10, "9"}, {11, "1"},
        {12, "11"}, {13, "12"}, {14, "13"}, {15, "8"}, {16, "1"}, {255, "1"}};
    for (const auto& [form, number] : expected)
        EXPECT_EQ(formOf(form), number) << int{form};
}

TEST(PhysicalMemoryProvider, cutsTheBankLabel) {
    MemoryDevice device;
    device.bankLabel = std::string(70, 'b');
    EXPECT_EQ(textOf(PhysicalMemoryProvider::publish(device).instance, "BankLabel"),
              std::string(64, 'b'));
}

TEST(PhysicalMemoryProvider, givesTheKernelsSumWhenTheFirmwareListsNoModule) {
    RecordedTree tree;
    recordSmbios(tree, {SmbiosFields(17, 0x1B)});
    const PhysicalMemoryProvider provider(tree.paths());
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Absent);
    tree.file("proc/meminfo", "MemTotal: nonsense\n");
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Unreadable);
    tree.file("proc/meminfo", "MemTotal:  524288 kB\n");
    const auto modules = all(provider.enumerate());
    ASSERT_EQ(modules.size(), 1U);
    EXPECT_EQ(textOf(modules[0], "Capacity"), "536870912");
    EXPECT_EQ(textOf(modules[0], "CapacityMB"), "512");
    EXPECT_EQ(textOf(modules[0], "DataSource"), "Kernel");
    expectServesItsClass(provider);
}

TEST(PhysicalMemoryProvider, hasNoInstancesWithoutUsableTables) {
    RecordedTree tree;
    tree.file("proc/meminfo", "MemTotal: 524288 kB\n")
        .file("sys/firmware/dmi/tables/smbios_entry_point", "nonsense");
    EXPECT_EQ(PhysicalMemoryProvider(tree.paths()).enumerate()->absence(), Absence::Unreadable);
}

TEST(PhysicalMemoryProvider, keepsModulesOfTheSameNameApart) {
    RecordedTree tree;
    const auto module = SmbiosFields(17, 0x1B).word(0x0C, 1).text(0x10, "DIMM 0");
    recordSmbios(tree, {module, module, module});
    expectServesItsClass(PhysicalMemoryProvider(tree.paths()));
}

}  // namespace
}  // namespace cimomd
