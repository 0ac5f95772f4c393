// The recorded machines' disks, partitions, volumes, optical drives and file systems.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/storage/CDROMDriveProvider.h"
#include "providers/storage/DiskDriveProvider.h"
#include "providers/storage/DiskPackageProvider.h"
#include "providers/storage/DiskPartitionProvider.h"
#include "providers/storage/LocalFileSystemProvider.h"
#include "providers/storage/NFSProvider.h"
#include "providers/storage/RemoteFileSystemProvider.h"
#include "providers/storage/StorageVolumeProvider.h"
#include "system/RecordedSystemCalls.h"

namespace cimomd {
namespace {

/// What the instances have in the named properties, of a provider that is held against the schema.
Table valuesOf(const Provider& provider, const std::vector<const char*>& properties) {
    expectServesItsClass(provider);
    return tableOf(provider, properties);
}

template <typename OneProvider>
Table devices(const char* machineName, const std::vector<const char*>& properties) {
    return valuesOf(OneProvider(machine(machineName)), properties);
}

template <typename OneProvider>
Table fileSystems(const char* machineName, const std::vector<const char*>& properties) {
    const RecordedSystemCalls calls(machine(machineName));
    return valuesOf(OneProvider(machine(machineName), calls), properties);
}

/// There are none, and nothing stands in the way of finding any.
void expectNone(const Provider& provider) {
    const auto stream = provider.enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided)) << provider.className();
    EXPECT_EQ(stream->absence(), std::nullopt) << provider.className();
}

const std::vector<const char*> kDrive{
    "DeviceID",         "Name",     "Capabilities",      "MaxMediaSize", "MaxMediaSizeMB",
    "DefaultBlockSize", "DiskType", "OperationalStatus", "EnabledState"};
const std::vector<const char*> kPackage{"Tag",          "Manufacturer", "Model",
                                        "SerialNumber", "Version",      "OtherIdentifyingInfo"};
const std::vector<const char*> kPartition{"DeviceID",       "Disk",   "PartitionType", "BlockSize",
                                          "NumberOfBlocks", "SizeMB", "StartMB"};
const std::vector<const char*> kVolume{
    "DeviceID",  "Name",         "VolumeType",        "SizeMB",      "Members", "RAIDLevel",
    "RAIDDisks", "MissingDisks", "OperationalStatus", "ExtentStatus"};
const std::vector<const char*> kOptical{"DeviceID",        "Manufacturer", "Model",
                                        "FirmwareVersion", "DriveSpeed",   "ReadsDVD",
                                        "WritesCDR",       "Capabilities"};
const std::vector<const char*> kLocal{
    "Name",     "Device",          "FileSystemType", "FileSystemSizeMB", "AvailableSpaceMB",
    "ReadOnly", "PersistenceType", "TotalInodes"};
const std::vector<const char*> kRemote{"Name",       "Device",           "FileSystemType",
                                       "ServerName", "FileSystemSizeMB", "AvailableSpaceMB",
                                       "ReadOnly",   "OperationalStatus"};

TEST(StorageMachines, laptop) {
    // 2,000,409,264 sectors are 1,024,209,543,168 bytes; 60,062,500 are 30,752,000,000.
    EXPECT_EQ(devices<DiskDriveProvider>("laptop", kDrive),
              (Table{{"sda", "/dev/sda", "3 4 7 ", "30752000", "30752", "512", "1", "2 ", "2"},
                     {"nvme0n1", "/dev/nvme0n1", "3 4 ", "1024209543", "1024209", "512", "3", "2 ",
                      "2"}}));
    EXPECT_EQ(devices<DiskPackageProvider>("laptop", kPackage),
              (Table{{"/dev/sda", "SanDisk", "Ultra Fit", "4C530001230707115353", "1.00", "null"},
                     {"/dev/nvme0n1", "null", "Samsung SSD 980 PRO 1TB", "S5P2NG0R704512X",
                      "5B2QGXA7", "eui.002538b711504c2a"}}));
    EXPECT_EQ(devices<DiskPartitionProvider>("laptop", kPartition),
              (Table{{"sda1", "sda", "1", "512", "60062468", "29327", "0"},
                     {"nvme0n1p1", "nvme0n1", "1", "512", "1048576", "512", "1"},
                     {"nvme0n1p2", "nvme0n1", "1", "512", "2097152", "1024", "513"},
                     {"nvme0n1p3", "nvme0n1", "1", "512", "1997258752", "975224", "1537"}}));
    EXPECT_EQ(devices<StorageVolumeProvider>("laptop", kVolume),
              (Table{{"dm-0", "/dev/mapper/nvme0n1p3_crypt", "CRYPT", "975208", "nvme0n1p3 ",
                      "null", "null", "null", "2 ", "2 "},
                     {"dm-1", "/dev/mapper/birch--vg-root", "LVM", "958464", "dm-0 ", "null",
                      "null", "null", "2 ", "2 "},
                     {"dm-2", "/dev/mapper/birch--vg-swap", "LVM", "16384", "dm-0 ", "null", "null",
                      "null", "2 ", "2 "}}));
    expectNone(CDROMDriveProvider(machine("laptop")));
}

TEST(StorageMachines, laptopFileSystems) {
    EXPECT_EQ(fileSystems<LocalFileSystemProvider>("laptop", kLocal),
              (Table{{"/", "/dev/mapper/birch--vg-root", "ext4", "939488", "703125", "FALSE", "2",
                      "61341696"},
                     {"/boot", "/dev/nvme0n1p2", "ext4", "975", "625", "FALSE", "2", "65536"},
                     {"/boot/efi", "/dev/nvme0n1p1", "vfat", "510", "500", "FALSE", "2", "null"},
                     {"/tmp", "tmpfs", "tmpfs", "7878", "7875", "FALSE", "3", "2016938"},
                     {"/media/mia/USB STICK", "/dev/sda1", "vfat", "29311", "14062", "FALSE", "2",
                      "null"}}));
    EXPECT_EQ(fileSystems<RemoteFileSystemProvider>("laptop", kRemote),
              (Table{{"/home/mia/shell", "mia@shell.example.org:/home/mia", "fuse.sshfs",
                      "shell.example.org", "102400", "51200", "FALSE", "2 "}}));
    const RecordedSystemCalls calls(machine("laptop"));
    expectNone(NFSProvider(machine("laptop"), calls));
}

TEST(StorageMachines, server) {
    // 7,814,037,168 sectors are 4,000,787,030,016 bytes; 1,000,215,216 are 512,110,190,592.
    EXPECT_EQ(devices<DiskDriveProvider>("server", kDrive),
              (Table{{"sda", "/dev/sda", "3 4 ", "4000787030", "4000787", "512", "2", "2 ", "2"},
                     {"sdb", "/dev/sdb", "3 4 ", "4000787030", "4000787", "512", "2", "2 ", "2"},
                     {"sdc", "/dev/sdc", "3 4 ", "4000787030", "4000787", "512", "2", "2 ", "2"},
                     {"sdd", "/dev/sdd", "3 4 ", "4000787030", "4000787", "512", "2", "6 ", "6"},
                     {"sdaa", "/dev/sdaa", "3 4 ", "512110190", "512110", "512", "3", "2 ", "2"}}));
    EXPECT_EQ(
        devices<DiskPackageProvider>("server", kPackage),
        (Table{{"/dev/sda", "SEAGATE", "ST4000NM0025", "ZC1A2B30", "N004", "naa.5000c50085a1b2c0"},
               {"/dev/sdb", "SEAGATE", "ST4000NM0025", "ZC1A2B31", "N004", "naa.5000c50085a1b2c1"},
               {"/dev/sdc", "SEAGATE", "ST4000NM0025", "ZC1A2B32", "N004", "naa.5000c50085a1b2c2"},
               {"/dev/sdd", "SEAGATE", "ST4000NM0025", "ZC1A2B33", "N004", "naa.5000c50085a1b2c3"},
               {"/dev/sdaa", "null", "Micron_5300_MTFDDAK480TDS", "20312A1B2C3D", "U001",
                "t10.ATA     Micron_5300_MTFDDAK480TDS                 20312A1B2C3D"}}));
    const Table partitions = devices<DiskPartitionProvider>("server", kPartition);
    ASSERT_EQ(partitions.size(), 8U);
    EXPECT_EQ(partitions[0], (Row{"sda1", "sda", "1", "512", "2097152", "1024", "1"}));
    EXPECT_EQ(partitions[7], (Row{"sdd2", "sdd", "1", "512", "7811937280", "3814422", "1025"}));
    EXPECT_EQ(
        devices<StorageVolumeProvider>("server", kVolume),
        (Table{{"md0", "/dev/md0", "MD", "1023", "sda1 sdb1 sdc1 sdd1 ", "raid1", "4", "0", "2 ",
                "2 "},
               {"md1", "/dev/md1", "MD", "7628842", "sda2 sdb2 sdc2 sdd2 ", "raid10", "4", "1",
                "3 ", "6 11 "},
               {"md2", "/dev/md2", "MD", "488385", "sdaa ", "raid0", "1", "null", "2 ", "2 "}}));
    EXPECT_EQ(devices<CDROMDriveProvider>("server", kOptical),
              (Table{{"sr0", "HL-DT-ST", "DVDRAM GUD1N", "LD03", "24", "TRUE", "TRUE", "3 4 7 "}}));
}

TEST(StorageMachines, serverFileSystems) {
    EXPECT_EQ(
        fileSystems<LocalFileSystemProvider>("server", kLocal),
        (Table{{"/", "/dev/md0", "ext4", "992", "390", "FALSE", "2", "65536"},
               {"/srv", "/dev/md1", "xfs", "7626984", "3906250", "FALSE", "2", "781194112"},
               {"/var/cache", "/dev/md2", "xfs", "488146", "468750", "FALSE", "2", "62513280"},
               {"/backup/index", "tmpfs", "tmpfs", "4", "4", "FALSE", "3", "1024"}}));
    EXPECT_EQ(
        fileSystems<NFSProvider>("server", kRemote),
        (Table{{"/home", "nas.example.org:/export/home", "nfs4", "nas.example.org", "8388608",
                "4194304", "FALSE", "2 "},
               {"/backup", "old-nas:/backup", "nfs", "old-nas", "null", "null", "TRUE", "12 "}}));
    EXPECT_EQ(
        fileSystems<NFSProvider>("server", {"NFSVersion", "HardMount", "AttributeCaching",
                                            "ReadBufferSize", "RetransmissionTimeout",
                                            "RetransmissionAttempts", "ServerCommunicationPort"}),
        (Table{{"4.2", "TRUE", "TRUE", "1048576", "600", "2", "null"},
               {"3", "FALSE", "FALSE", "65536", "100", "3", "20049"}}));
    EXPECT_EQ(fileSystems<RemoteFileSystemProvider>("server", kRemote),
              (Table{{"/mnt/files", "//files.example.org/public", "cifs", "files.example.org",
                      "10240", "5120", "FALSE", "2 "}}));
}

TEST(StorageMachines, virtualMachine) {
    // 83,886,080 sectors are 42,949,672,960 bytes; 16,777,216 are 8,589,934,592.
    EXPECT_EQ(devices<DiskDriveProvider>("virtual", kDrive),
              (Table{{"vda", "/dev/vda", "3 4 ", "42949672", "42949", "512", "0", "0 ", "null"},
                     {"vdb", "/dev/vdb", "3 4 ", "8589934", "8589", "512", "0", "0 ", "null"}}));
    EXPECT_EQ(devices<DiskPackageProvider>("virtual", kPackage),
              (Table{{"/dev/vda", "null", "null", "web3-root", "null", "null"},
                     {"/dev/vdb", "null", "null", "null", "null", "null"}}));
    EXPECT_EQ(devices<DiskPartitionProvider>("virtual", kPartition),
              (Table{{"vda1", "vda", "1", "512", "79687680", "38910", "1"},
                     {"vda2", "vda", "2", "512", "2", "0", "38911"},
                     {"vda5", "vda", "3", "512", "4192256", "2047", "38912"}}));
    EXPECT_EQ(devices<CDROMDriveProvider>("virtual", kOptical),
              (Table{{"sr0", "QEMU", "QEMU DVD-ROM", "2.5+", "4", "TRUE", "FALSE", "3 7 "}}));
    expectNone(StorageVolumeProvider(machine("virtual")));
}

TEST(StorageMachines, virtualMachineFileSystems) {
    EXPECT_EQ(
        fileSystems<LocalFileSystemProvider>("virtual", kLocal),
        (Table{{"/", "/dev/vda1", "btrfs", "38910", "19531", "FALSE", "2", "null"},
               {"/var/lib/docker", "/dev/vdb", "ext4", "7936", "3906", "FALSE", "2", "524288"}}));
    EXPECT_EQ(fileSystems<RemoteFileSystemProvider>("virtual", kRemote),
              (Table{{"/host", "share", "virtiofs", "null", "390625", "156250", "FALSE", "2 "}}));
}

TEST(StorageMachines, arm) {
    // 62,333,952 sectors are 31,914,983,424 bytes; 15,269,888 are 7,818,182,656.
    EXPECT_EQ(
        devices<DiskDriveProvider>("arm", kDrive),
        (Table{{"mmcblk0", "/dev/mmcblk0", "3 4 ", "31914983", "31914", "512", "3", "0 ", "null"},
               {"mmcblk1", "/dev/mmcblk1", "3 4 ", "7818182", "7818", "512", "3", "0 ", "null"}}));
    EXPECT_EQ(
        devices<DiskPackageProvider>("arm", kPackage),
        (Table{{"/dev/mmcblk0", "null", "SD32G", "0x1b2c3d4e", "null", "null"},
               {"/dev/mmcblk1", "null", "DG4008", "0x7a6b5c4d", "0x3731303131323031", "null"}}));
    EXPECT_EQ(devices<DiskPartitionProvider>("arm", kPartition),
              (Table{{"mmcblk0p1", "mmcblk0", "1", "512", "1048576", "512", "4"},
                     {"mmcblk0p2", "mmcblk0", "1", "512", "61277184", "29920", "516"}}));
    EXPECT_EQ(fileSystems<LocalFileSystemProvider>("arm", kLocal),
              (Table{{"/", "/dev/mmcblk0p2", "ext4", "29449", "23437", "FALSE", "2", "1909760"},
                     {"/boot", "/dev/mmcblk0p1", "vfat", "511", "439", "TRUE", "2", "null"}}));
    expectNone(StorageVolumeProvider(machine("arm")));
    expectNone(CDROMDriveProvider(machine("arm")));
}

}  // namespace
}  // namespace cimomd
