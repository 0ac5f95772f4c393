#include "system/computer/SystemIdentity.h"

#include <gtest/gtest.h>

#include <stdexcept>

#include "RecordedTree.h"
#include "SmbiosBytes.h"
#include "system/RecordedSystemCalls.h"
#include "system/computer/FirmwareText.h"

namespace cimomd {
namespace {

TEST(FirmwareText, knowsPlaceholders) {
    for (const char* text :
         {"To be filled by O.E.M.", " default STRING ", "0000", "XXXXXX", "........", "", "  ",
          "00000000-0000-0000-0000-000000000000", "FFFFFFFF-FFFF-FFFF-ffff-ffffffffffff", "N/A",
          "None", "0123456789", "INVALID", "No Asset Information", "not available", "0x0",
          "0X00000000", "---", "111"})
        EXPECT_TRUE(isPlaceholder(text)) << text;
    for (const char* text : {"Dell Inc.", "5", "00001", "None of these", "4C4C4544-0042", "11",
                             "AA", "0x", "0x01", "0x0 rev"})
        EXPECT_FALSE(isPlaceholder(text)) << text;
}

TEST(SystemIdentity, readsTheFirmwaresTexts) {
    RecordedTree tree;
    tree.file("sys/class/dmi/id/sys_vendor", "Dell Inc.\n")
        .file("sys/class/dmi/id/product_name", "OptiPlex 7010 \n")
        .file("sys/class/dmi/id/product_version", "Not Specified\n")
        .file("sys/class/dmi/id/product_serial", "ABC1234\n")
        .file("sys/class/dmi/id/product_uuid", "4c4c4544-0042-3510-8052-b4c04f4e3432\n")
        .file("etc/machine-id", "5e2b7c90d41f4a8f9c63b0e8a7d61f24\n");
    const SystemIdentity identity = readSystemIdentity(tree.paths());
    EXPECT_EQ(identity.manufacturer, "Dell Inc.");
    EXPECT_EQ(identity.model, "OptiPlex 7010");
    EXPECT_EQ(identity.version, std::nullopt);
    EXPECT_EQ(identity.serialNumber, "ABC1234");
    EXPECT_EQ(identity.uuid, "4c4c4544-0042-3510-8052-b4c04f4e3432");
    EXPECT_EQ(identity.machineId, "5e2b7c90d41f4a8f9c63b0e8a7d61f24");
}

SmbiosFields systemOf(std::uint8_t length) {
    SmbiosFields fields(1, length);
    fields.text(4, "Maker").text(5, "M-7").text(6, "None").text(7, "S-42");
    for (std::uint8_t i = 0; i < 16 && 8U + i < length; ++i)
        fields.byte(8U + i, i);
    return fields;
}

TEST(SystemIdentity, prefersTheTables) {
    RecordedTree tree;
    recordSmbios(tree, {systemOf(0x1B).byte(0x18, 6).text(0x19, "SKU-1").text(0x1A, "Family"),
                        SmbiosFields(24, 5).byte(4, 0xFD)});
    tree.file("sys/class/dmi/id/sys_vendor", "Another\n")
        .file("proc/device-tree/model", "Another model");
    const SystemIdentity identity = readSystemIdentity(tree.paths());
    EXPECT_EQ(identity.manufacturer, "Maker");
    EXPECT_EQ(identity.model, "M-7");
    EXPECT_EQ(identity.version.reason(), Absence::Filtered);
    EXPECT_EQ(identity.serialNumber, "S-42");
    EXPECT_EQ(identity.uuid, "03020100-0504-0706-0809-0a0b0c0d0e0f");
    EXPECT_EQ(identity.wakeUpType, 6);
    EXPECT_EQ(identity.sku, "SKU-1");
    EXPECT_EQ(identity.family, "Family");
    EXPECT_EQ(identity.resetButton, 1);
}

// Before version 2.6 the bytes of a UUID stood in the order in which they are written.
TEST(SystemIdentity, readsUuidsOfOldTablesInTheirOrder) {
    RecordedTree tree;
    tree.file("sys/firmware/dmi/tables/smbios_entry_point", smbiosEntryPoint32(2, 5))
        .file("sys/firmware/dmi/tables/DMI", smbiosTableOf({systemOf(0x19)}));
    EXPECT_EQ(readSystemIdentity(tree.paths()).uuid, "00010203-0405-0607-0809-0a0b0c0d0e0f");
    tree.file("sys/firmware/dmi/tables/smbios_entry_point", smbiosEntryPoint32(2, 6));
    EXPECT_EQ(readSystemIdentity(tree.paths()).uuid, "03020100-0504-0706-0809-0a0b0c0d0e0f");
}

// Version 2.0 ends before the UUID, 2.1 before the number of the configuration.
TEST(SystemIdentity, hasLessFromOldTables) {
    RecordedTree tree;
    recordSmbios(tree, {systemOf(0x08)});
    SystemIdentity identity = readSystemIdentity(tree.paths());
    EXPECT_EQ(identity.serialNumber, "S-42");
    EXPECT_EQ(identity.uuid.reason(), Absence::Absent);
    EXPECT_EQ(identity.wakeUpType, std::nullopt);
    recordSmbios(tree, {systemOf(0x17)});
    EXPECT_EQ(readSystemIdentity(tree.paths()).uuid, std::nullopt);
    recordSmbios(tree, {systemOf(0x19)});
    identity = readSystemIdentity(tree.paths());
    EXPECT_TRUE(identity.uuid.has_value());
    EXPECT_EQ(identity.sku, std::nullopt);
}

TEST(SystemIdentity, filtersUuidsThatNobodySet) {
    RecordedTree tree;
    SmbiosFields system(1, 0x19);
    recordSmbios(tree, {system});
    EXPECT_EQ(readSystemIdentity(tree.paths()).uuid.reason(), Absence::Filtered);
    for (std::size_t i = 8; i < 24; ++i)
        system.byte(i, 0xFF);
    recordSmbios(tree, {system});
    EXPECT_EQ(readSystemIdentity(tree.paths()).uuid.reason(), Absence::Filtered);
}

TEST(SystemIdentity, fillsGapsOfTheTablesFromTheDeviceTree) {
    RecordedTree tree;
    recordSmbios(tree, {SmbiosFields(1, 0x1B).text(4, "Maker").text(5, "Default string")});
    tree.file("proc/device-tree/model", std::string_view("Board 7\0", 8));
    const SystemIdentity identity = readSystemIdentity(tree.paths());
    EXPECT_EQ(identity.manufacturer, "Maker");
    EXPECT_EQ(identity.model, "Board 7");
    EXPECT_EQ(identity.serialNumber.reason(), Absence::Absent);
}

TEST(SystemIdentity, fallsBackOnTheDeviceTree) {
    RecordedTree tree;
    tree.file("proc/device-tree/model", std::string_view("Raspberry Pi 4 Model B\0", 23))
        .file("proc/device-tree/serial-number", std::string_view("10000000abcdef01\0", 17));
    const SystemIdentity identity = readSystemIdentity(tree.paths());
    EXPECT_EQ(identity.manufacturer, std::nullopt);
    EXPECT_EQ(identity.model, "Raspberry Pi 4 Model B");
    EXPECT_EQ(identity.serialNumber, "10000000abcdef01");
}

TEST(SystemIdentity, alwaysHasAHostName) {
    RecordedTree tree;
    EXPECT_EQ(readHostName(tree.paths()), "localhost");
    tree.file("proc/sys/kernel/hostname", "(none)\n");
    EXPECT_EQ(readHostName(tree.paths()), "localhost");
    tree.file("proc/sys/kernel/hostname", "node7.example.org\n");
    EXPECT_EQ(readHostName(tree.paths()), "node7.example.org");
}

TEST(SystemPaths, refusesToNameAPathWithoutARoot) {
    EXPECT_THROW(SystemPaths().memory(), std::logic_error);
    EXPECT_EQ(SystemPaths("/tree").memory(), "/tree/proc/meminfo");
}

TEST(RecordedSystemCalls, takesSizesFromTheTreeOnly) {
    RecordedTree tree;
    tree.file("statvfs",
              "/ 4096 1000 400 50 20\n/my\\040disk 512 8 4 0 0\nnonsense\n/x a b c d e\n"
              "/dead timeout\n/odd nothing\n");
    const RecordedSystemCalls calls(tree.paths());
    EXPECT_EQ(calls.fileSystemSize("/"), (FileSystemSize{4096, 1000, 400, 50, 20}));
    EXPECT_EQ(calls.fileSystemSize("/my disk"), (FileSystemSize{512, 8, 4, 0, 0}));
    EXPECT_EQ(calls.fileSystemSize("/x"), std::nullopt);
    EXPECT_EQ(calls.fileSystemSize("/proc"), std::nullopt);
    EXPECT_EQ(calls.fileSystemSizeInTime("/", "8:1"), calls.fileSystemSize("/"));
    EXPECT_EQ(calls.fileSystemSizeInTime("/dead", "0:40").reason(), Absence::TimedOut);
    EXPECT_EQ(calls.fileSystemSize("/odd").reason(), Absence::Absent);
    EXPECT_EQ(calls.machine(), std::nullopt);
}

}  // namespace
}  // namespace cimomd
