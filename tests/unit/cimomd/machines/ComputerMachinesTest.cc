// The recorded machines as computer, chassis, boards, firmware, memory and slots.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/computer/BiosElementProvider.h"
#include "providers/computer/BoardProvider.h"
#include "providers/computer/ChassisProvider.h"
#include "providers/computer/ComputerSystemProvider.h"
#include "providers/computer/MemoryProvider.h"
#include "providers/computer/PhysicalMemoryProvider.h"
#include "providers/computer/SlotProvider.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

template <typename Provider>
void expectNone(const char* machineName, std::optional<Absence> why) {
    const auto stream = Provider(machine(machineName)).enumerate();
    EXPECT_EQ(stream->absence(), why) << machineName;
    EXPECT_TRUE(all(Provider(machine(machineName)).enumerate()).empty()) << machineName;
}

TEST(ComputerMachines, laptopAsComputer) {
    const auto instances = servedInstances<ComputerSystemProvider>("laptop");
    ASSERT_EQ(instances.size(), 1U);
    expectProperties(instances[0], {{"Name", "birch"},
                                    {"Caption", "birch"},
                                    {"ElementName", "birch"},
                                    {"CreationClassName", "Velmira_ComputerSystem"},
                                    {"NameFormat", "Other"},
                                    {"Dedicated", "0 "},
                                    {"ResetCapability", "5"},
                                    {"WakeUpType", "6"},
                                    {"Manufacturer", "Nordwind Systems"},
                                    {"Model", "NX-14 Gen 2"},
                                    {"ModelVersion", "NX 14"},
                                    {"SerialNumber", "PF2A7K3Q"},
                                    {"UUID", "4b3c5acc-215e-11b2-a85c-e8d0fc1be7a1"},
                                    {"SKU", "NX14_MT_20W0"},
                                    {"Family", "NX 14"},
                                    {"MachineId", "6c1f0e6d5b0b4c0c9d3a1c2b7f4e8a10"},
                                    {"OtherIdentifyingInfo",
                                     "PF2A7K3Q 4b3c5acc-215e-11b2-a85c-e8d0fc1be7a1 "
                                     "6c1f0e6d5b0b4c0c9d3a1c2b7f4e8a10 "},
                                    {"IdentifyingDescriptions", "Serial number UUID Machine id "}});
}

TEST(ComputerMachines, serverAsComputer) {
    const auto instances = servedInstances<ComputerSystemProvider>("server");
    ASSERT_EQ(instances.size(), 1U);
    expectProperties(instances[0], {{"Name", "rack12-db1"},
                                    {"ResetCapability", "4"},
                                    {"Manufacturer", "Granit Computer"},
                                    {"Model", "GR-740 Rack Server"},
                                    {"ModelVersion", "null"},
                                    {"SerialNumber", "7XK2LM3"},
                                    {"UUID", "44454c4c-5800-4b10-8032-b7c04f4c4d33"},
                                    {"SKU", "SKU=0715;ModelName=GR-740"},
                                    {"Family", "GR Rack"}});
}

TEST(ComputerMachines, virtualMachineAsComputer) {
    const auto instances = servedInstances<ComputerSystemProvider>("virtual");
    ASSERT_EQ(instances.size(), 1U);
    expectProperties(instances[0], {{"Name", "vm-web3"},
                                    {"ResetCapability", "null"},
                                    {"WakeUpType", "6"},
                                    {"Manufacturer", "null"},
                                    {"Model", "Standard PC (i440FX + PIIX, 1996)"},
                                    {"ModelVersion", "pc-i440fx-7.2"},
                                    {"SerialNumber", "null"},
                                    {"UUID", "null"},
                                    {"SKU", "null"},
                                    {"Family", "null"},
                                    {"OtherIdentifyingInfo", "a94c6d02b7ef4e6f8b1d3357c0a9e5f1 "},
                                    {"IdentifyingDescriptions", "Machine id "}});
}

TEST(ComputerMachines, armBoardAsComputer) {
    const auto instances = servedInstances<ComputerSystemProvider>("arm");
    ASSERT_EQ(instances.size(), 1U);
    expectProperties(instances[0], {{"Name", "pi-lab"},
                                    {"WakeUpType", "null"},
                                    {"Manufacturer", "null"},
                                    {"Model", "Raspberry Pi 4 Model B Rev 1.4"},
                                    {"SerialNumber", "10000000abcdef01"},
                                    {"UUID", "null"},
                                    {"OtherIdentifyingInfo",
                                     "10000000abcdef01 5e2b7c90d41f4a8f9c63b0e8a7d61f24 "},
                                    {"IdentifyingDescriptions", "Serial number Machine id "}});
}

TEST(ComputerMachines, chassis) {
    const auto laptop = servedInstances<ChassisProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"Tag", "Chassis 0"},
                                 {"CreationClassName", "Velmira_Chassis"},
                                 {"ElementName", "Notebook"},
                                 {"Manufacturer", "Nordwind Systems"},
                                 {"SerialNumber", "PF2A7K3Q"},
                                 {"SKU", "NX14_CH_01"},
                                 {"Version", "null"},
                                 {"OtherIdentifyingInfo", "IT-00417"},
                                 {"LockPresent", "FALSE"},
                                 {"ChassisPackageType", "10"},
                                 {"ChassisTypes", "10 "},
                                 {"ChassisTypeDescription", "Notebook"},
                                 {"TypeDescriptions", "Notebook "},
                                 {"NumberOfPowerCords", "1"},
                                 {"HeightUnits", "null"}});
    const auto server = servedInstances<ChassisProvider>("server");
    ASSERT_EQ(server.size(), 1U);
    expectProperties(server[0], {{"ChassisPackageType", "23"},
                                 {"ChassisTypes", "23 "},
                                 {"ChassisTypeDescription", "Rack Mount Chassis"},
                                 {"LockPresent", "TRUE"},
                                 {"HeightUnits", "2"},
                                 {"NumberOfPowerCords", "2"},
                                 {"OtherIdentifyingInfo", "DC2-R12-U07"},
                                 {"Version", "null"},
                                 {"SKU", "null"}});
    const auto virtualMachine = servedInstances<ChassisProvider>("virtual");
    ASSERT_EQ(virtualMachine.size(), 1U);
    expectProperties(virtualMachine[0], {{"ChassisPackageType", "1"},
                                         {"ChassisTypes", "1 "},
                                         {"Manufacturer", "QEMU"},
                                         {"SerialNumber", "null"},
                                         {"OtherIdentifyingInfo", "null"}});
    expectNone<ChassisProvider>("arm", Absence::Absent);
}

TEST(ComputerMachines, boards) {
    const auto laptop = servedInstances<BoardProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"Tag", "Board 0"},
                                 {"CreationClassName", "Velmira_Card"},
                                 {"ElementName", "20W0S1AB00"},
                                 {"Manufacturer", "Nordwind Systems"},
                                 {"Model", "20W0S1AB00"},
                                 {"Version", "SDK0J40697 WIN"},
                                 {"SerialNumber", "L1HF16N00TQ"},
                                 {"PartNumber", "null"},
                                 {"HostingBoard", "TRUE"},
                                 {"Removable", "FALSE"},
                                 {"Replaceable", "TRUE"},
                                 {"HotSwappable", "FALSE"}});
    const auto server = servedInstances<BoardProvider>("server");
    ASSERT_EQ(server.size(), 2U);
    expectProperties(server[0], {{"Tag", "Board 0"},
                                 {"Model", "0YWR7D"},
                                 {"SerialNumber", "CNFCP0000123AB"},
                                 {"HostingBoard", "TRUE"},
                                 {"Location", "null"}});
    expectProperties(server[1], {{"Tag", "Board 1"},
                                 {"Model", "0RSR2B"},
                                 {"SerialNumber", "CNFCP0000456CD"},
                                 {"HostingBoard", "FALSE"},
                                 {"Removable", "TRUE"},
                                 {"Location", "Riser 2"}});
    expectNone<BoardProvider>("virtual", std::nullopt);
    expectNone<BoardProvider>("arm", Absence::Absent);
}

TEST(ComputerMachines, firmware) {
    const auto laptop = servedInstances<BiosElementProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"Name", "System firmware"},
                                 {"Caption", "UEFI N2HET47W (1.30 )"},
                                 {"Version", "N2HET47W (1.30 )"},
                                 {"SoftwareElementID", "Firmware 0"},
                                 {"SoftwareElementState", "3"},
                                 {"TargetOperatingSystem", "66"},
                                 {"Manufacturer", "Nordwind Systems"},
                                 {"PrimaryBIOS", "TRUE"},
                                 {"ReleaseDate", "20220814000000.000000+000"},
                                 {"FirmwareType", "UEFI"},
                                 {"Release", "1.30"},
                                 {"ControllerRelease", "1.18"},
                                 {"RomSizeKB", "32768"}});
    const auto server = servedInstances<BiosElementProvider>("server");
    ASSERT_EQ(server.size(), 1U);
    // 256 steps of 64 KB: tables of version 2.8 have no field for more.
    expectProperties(server[0], {{"Version", "2.11.2"},
                                 {"FirmwareType", "UEFI"},
                                 {"ReleaseDate", "20210521000000.000000+000"},
                                 {"Release", "2.11"},
                                 {"ControllerRelease", "null"},
                                 {"RomSizeKB", "16384"}});
    const auto virtualMachine = servedInstances<BiosElementProvider>("virtual");
    ASSERT_EQ(virtualMachine.size(), 1U);
    expectProperties(virtualMachine[0], {{"Version", "1.16.2-debian-1.16.2-1"},
                                         {"Manufacturer", "SeaBIOS"},
                                         {"FirmwareType", "BIOS"},
                                         {"ReleaseDate", "20140401000000.000000+000"},
                                         {"RomSizeKB", "64"}});
    expectNone<BiosElementProvider>("arm", Absence::Absent);
}

TEST(ComputerMachines, memoryModulesOfTheLaptop) {
    const auto modules = servedInstances<PhysicalMemoryProvider>("laptop");
    ASSERT_EQ(modules.size(), 2U);
    const Expected same{{"CreationClassName", "Velmira_PhysicalMemory"},
                        {"Capacity", "8589934592"},
                        {"CapacityMB", "8192"},
                        {"MemoryType", "26"},
                        {"Description", "DDR4"},
                        {"FormFactor", "12"},
                        {"TotalWidth", "64"},
                        {"DataWidth", "64"},
                        {"ConfiguredMemoryClockSpeed", "3200"},
                        {"MaxMemorySpeed", "3200"},
                        {"IsSpeedInMhz", "TRUE"},
                        {"Speed", "null"},
                        {"Manufacturer", "Samsung"},
                        {"PartNumber", "M471A1G44BB0-CWE"},
                        {"OtherIdentifyingInfo", "9876543210"},
                        {"DataSource", "SMBIOS"}};
    for (const CIMInstance& module : modules)
        expectProperties(module, same);
    expectProperties(modules[0], {{"Tag", "Memory Device 0"},
                                  {"ElementName", "ChannelA-DIMM0"},
                                  {"Name", "ChannelA-DIMM0"},
                                  {"BankLabel", "BANK 0"},
                                  {"SerialNumber", "18C7A4F1"}});
    expectProperties(modules[1], {{"Tag", "Memory Device 1"},
                                  {"ElementName", "ChannelB-DIMM0"},
                                  {"BankLabel", "BANK 2"},
                                  {"SerialNumber", "18C7A4F2"}});
}

// Every second group of four sockets is empty.
TEST(ComputerMachines, memoryModulesOfTheServer) {
    const auto modules = servedInstances<PhysicalMemoryProvider>("server");
    ASSERT_EQ(modules.size(), 8U);
    const Expected same{{"Capacity", "34359738368"},
                        {"CapacityMB", "32768"},
                        {"MemoryType", "26"},
                        {"FormFactor", "8"},
                        {"TotalWidth", "72"},
                        {"DataWidth", "64"},
                        {"MaxMemorySpeed", "2933"},
                        {"ConfiguredMemoryClockSpeed", "2666"},
                        {"PartNumber", "36ASF4G72PZ-2G9E2"},
                        {"Manufacturer", "Micron"}};
    for (const CIMInstance& module : modules)
        expectProperties(module, same);
    expectProperties(modules[3], {{"Tag", "Memory Device 3"},
                                  {"Name", "A4"},
                                  {"BankLabel", "Bank A"},
                                  {"SerialNumber", "2F1BA430"},
                                  {"OtherIdentifyingInfo", "A4_AssetTag"}});
    expectProperties(modules[4], {{"Tag", "Memory Device 8"},
                                  {"Name", "B1"},
                                  {"BankLabel", "Bank B"},
                                  {"SerialNumber", "2F1BA930"}});
}

TEST(ComputerMachines, memoryModulesOfTheVirtualMachine) {
    const auto modules = servedInstances<PhysicalMemoryProvider>("virtual");
    ASSERT_EQ(modules.size(), 1U);
    expectProperties(modules[0], {{"Tag", "Memory Device 0"},
                                  {"ElementName", "DIMM 0"},
                                  {"CapacityMB", "4096"},
                                  {"MemoryType", "9"},
                                  {"Description", "RAM"},
                                  {"FormFactor", "8"},
                                  {"TotalWidth", "null"},
                                  {"DataWidth", "null"},
                                  {"MaxMemorySpeed", "null"},
                                  {"ConfiguredMemoryClockSpeed", "null"},
                                  {"IsSpeedInMhz", "null"},
                                  {"BankLabel", "null"},
                                  {"Manufacturer", "QEMU"},
                                  {"SerialNumber", "null"},
                                  {"PartNumber", "null"},
                                  {"OtherIdentifyingInfo", "null"}});
}

TEST(ComputerMachines, memoryOfTheArmBoardIsTheKernels) {
    const auto modules = servedInstances<PhysicalMemoryProvider>("arm");
    ASSERT_EQ(modules.size(), 1U);
    expectProperties(
        modules[0],
        {{"Tag", "Main Memory"},
         {"DataSource", "Kernel"},
         {"Description", "All memory that the kernel uses; the firmware describes no modules"},
         {"Capacity", "3977601024"},
         {"CapacityMB", "3793"},
         {"MemoryType", "null"},
         {"FormFactor", "0"},
         {"Manufacturer", "null"}});
}

TEST(ComputerMachines, memoryInAll) {
    const auto laptop = servedInstances<MemoryProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"DeviceID", "Memory"},
                                 {"SystemName", "birch"},
                                 {"SystemCreationClassName", "Velmira_ComputerSystem"},
                                 {"CreationClassName", "Velmira_Memory"},
                                 {"BlockSize", "1024"},
                                 {"NumberOfBlocks", "16116204"},
                                 {"Volatile", "TRUE"},
                                 {"OperationalStatus", "2 "},
                                 {"ExtentStatus", "2 "},
                                 {"TotalMB", "15738"},
                                 {"ModulesMB", "16384"},
                                 {"NumberOfModules", "2"},
                                 {"FirmwareTablesShort", "FALSE"}});
    expectProperties(servedInstances<MemoryProvider>("server").at(0),
                     {{"NumberOfBlocks", "263860912"},
                      {"TotalMB", "257676"},
                      {"ModulesMB", "262144"},
                      {"NumberOfModules", "8"}});
    expectProperties(servedInstances<MemoryProvider>("virtual").at(0),
                     {{"TotalMB", "3925"}, {"ModulesMB", "4096"}, {"NumberOfModules", "1"}});
    expectProperties(servedInstances<MemoryProvider>("arm").at(0),
                     {{"TotalMB", "3793"},
                      {"ModulesMB", "null"},
                      {"NumberOfModules", "null"},
                      {"FirmwareTablesShort", "null"}});
}

TEST(ComputerMachines, slots) {
    const auto laptop = servedInstances<SlotProvider>("laptop");
    ASSERT_EQ(laptop.size(), 2U);
    expectProperties(laptop[0], {{"Tag", "Slot 0"},
                                 {"CreationClassName", "Velmira_Slot"},
                                 {"ElementName", "Media Card Slot"},
                                 {"Number", "1"},
                                 {"ConnectorLayout", "1"},
                                 {"SlotType", "null"},
                                 {"MaxLinkWidth", "null"},
                                 {"MaxDataWidth", "null"},
                                 {"SupportsHotPlug", "FALSE"},
                                 {"InUse", "FALSE"},
                                 {"PCIAddress", "null"}});
    expectProperties(laptop[1], {{"Tag", "Slot 1"},
                                 {"ElementName", "M.2 SSD"},
                                 {"ConnectorLayout", "7"},
                                 {"SlotType", "M.2 socket 3"},
                                 {"MaxLinkWidth", "4"},
                                 {"InUse", "TRUE"},
                                 {"PCIAddress", "0000:04:00.0"}});
    const auto server = servedInstances<SlotProvider>("server");
    ASSERT_EQ(server.size(), 3U);
    expectProperties(server[0], {{"ElementName", "PCIe Slot 1"},
                                 {"ConnectorLayout", "22"},
                                 {"SlotType", "PCI Express 3 x8"},
                                 {"MaxLinkWidth", "8"},
                                 {"InUse", "TRUE"},
                                 {"PCIAddress", "0000:3b:00.0"}});
    expectProperties(server[1], {{"ConnectorLayout", "23"},
                                 {"SlotType", "PCI Express 3 x16"},
                                 {"MaxLinkWidth", "16"},
                                 {"InUse", "FALSE"},
                                 {"SupportsHotPlug", "TRUE"},
                                 {"PCIAddress", "null"}});
    // A long connector of which only half is wired; the firmware does not know whether it is used.
    expectProperties(server[2],
                     {{"ConnectorLayout", "23"}, {"MaxLinkWidth", "8"}, {"InUse", "null"}});
    expectNone<SlotProvider>("virtual", std::nullopt);
    expectNone<SlotProvider>("arm", Absence::Absent);
}

}  // namespace
}  // namespace cimomd
