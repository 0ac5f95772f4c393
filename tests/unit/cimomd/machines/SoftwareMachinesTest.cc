// The recorded machines as operating system, packages, processes, accounts, groups and time zone.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/software/AccountProvider.h"
#include "providers/software/GroupProvider.h"
#include "providers/software/OperatingSystemProvider.h"
#include "providers/software/ServiceProvider.h"
#include "providers/software/SoftwareIdentityProvider.h"
#include "providers/software/TimeZoneProvider.h"
#include "providers/software/UnixProcessProvider.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

template <typename Provider>
void expectAbsent(const char* machineName) {
    const auto stream = providerOf<Provider>(machineName).enumerate();
    EXPECT_EQ(stream->absence(), Absence::Absent) << machineName;
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided)) << machineName;
}

TEST(SoftwareMachines, laptopAsOperatingSystem) {
    const auto instances = servedInstances<OperatingSystemProvider>("laptop");
    ASSERT_EQ(instances.size(), 1U);
    expectProperties(instances[0], {{"Name", "Ubuntu"},
                                    {"Caption", "Ubuntu 22.04.4 LTS"},
                                    {"CSName", "birch"},
                                    {"OSType", "94"},
                                    {"Version", "22.04"},
                                    {"DistributionId", "ubuntu"},
                                    {"KernelRelease", "6.5.0-35-generic"},
                                    {"Architecture", "x86_64"},
                                    // 1699999000 is 14 November 2023, 21:56:40 UTC.
                                    {"LastBootUpTime", "20231114225640.000000+060"},
                                    {"NumberOfProcesses", "2"},
                                    {"NumberOfUsers", "null"},
                                    {"TotalVisibleMemorySize", "16116204"},
                                    {"TotalVisibleMemorySizeMB", "15738"},
                                    {"FreePhysicalMemoryMB", "7168"},
                                    {"TotalSwapSpaceSizeMB", "8191"},
                                    {"TotalVirtualMemorySize", "24504808"},
                                    {"FreeVirtualMemory", "15728636"}});
}

TEST(SoftwareMachines, othersAsOperatingSystems) {
    expectProperties(servedInstances<OperatingSystemProvider>("server").at(0),
                     {{"Name", "Red Hat Enterprise Linux"},
                      {"OSType", "80"},
                      {"Version", "9.3"},
                      {"LastBootUpTime", "20230722052640.000000+060"},
                      {"NumberOfProcesses", "3"},
                      {"TotalVisibleMemorySizeMB", "257676"},
                      {"TotalSwapSpaceSizeMB", "0"}});
    expectProperties(servedInstances<OperatingSystemProvider>("virtual").at(0),
                     {{"Name", "Debian GNU/Linux"},
                      {"OSType", "96"},
                      {"Version", "12"},
                      {"TotalVisibleMemorySizeMB", "3925"},
                      {"TotalSwapSpaceSizeMB", "975"}});
    // Its os-release is the vendor's, knows no version, and no list knows the distribution.
    expectProperties(servedInstances<OperatingSystemProvider>("arm").at(0),
                     {{"Name", "Sennix"},
                      {"Caption", "Sennix rolling"},
                      {"OSType", "36"},
                      {"Version", "null"},
                      {"Architecture", "armv7l"},
                      {"LastBootUpTime", "20231113231320.000000+060"},
                      {"TotalVisibleMemorySizeMB", "3793"}});
}

TEST(SoftwareMachines, packages) {
    const auto laptop = servedInstances<SoftwareIdentityProvider>("laptop");
    ASSERT_EQ(laptop.size(), 3U);
    expectProperties(laptop[0],
                     {{"InstanceID", "Velmira:deb:bash:amd64"},
                      {"Name", "bash"},
                      {"Caption", "GNU Bourne Again SHell"},
                      {"VersionString", "5.1-6ubuntu1"},
                      {"MajorVersion", "5"},
                      {"MinorVersion", "1"},
                      {"RevisionNumber", "null"},
                      {"Manufacturer", "Ubuntu Developers <ubuntu-devel-discuss@lists.ubuntu.com>"},
                      {"ClassificationDescriptions", "shells "},
                      {"Architecture", "amd64"},
                      {"InstalledSizeKB", "1864"},
                      {"InstallDate", "null"}});
    EXPECT_EQ(textOf(laptop[1], "InstanceID"), "Velmira:deb:libc6:amd64");
    EXPECT_EQ(textOf(laptop[2], "InstanceID"), "Velmira:deb:libc6:i386");
    const auto virtualMachine = servedInstances<SoftwareIdentityProvider>("virtual");
    ASSERT_EQ(virtualMachine.size(), 1U);
    expectProperties(virtualMachine[0], {{"VersionString", "1.3.4.20200120-3.1"},
                                         {"MajorVersion", "1"},
                                         {"MinorVersion", "3"},
                                         {"RevisionNumber", "4"},
                                         {"BuildNumber", "null"}});
    expectAbsent<SoftwareIdentityProvider>("server");
    expectAbsent<SoftwareIdentityProvider>("arm");
}

TEST(SoftwareMachines, processesOfTheLaptop) {
    const auto instances = servedInstances<UnixProcessProvider>("laptop");
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "Handle"), "1");
    EXPECT_EQ(textOf(instances[0], "Parameters"), "/sbin/init splash ");
    expectProperties(instances[1],
                     {{"Handle", "2350"},
                      {"Name", "Web Content (2)"},
                      {"ParentProcessID", "1"},
                      {"ExecutionState", "3"},
                      {"ProcessTTY", "pts/0"},
                      {"RealUserID", "1000"},
                      {"UserName", "ada"},
                      {"Priority", "20"},
                      {"Nice", "-10"},
                      {"ProcessNiceValue", "null"},
                      {"UserModeTime", "1234000"},
                      {"KernelModeTime", "66000"},
                      {"ProcessorSeconds", "1300"},
                      {"WorkingSetSize", "536870912"},
                      {"WorkingSetSizeKB", "524288"},
                      {"CreationDate", "20231114230000.000000+060"},
                      {"Parameters", "/opt/browser/browser --profile /home/ada/My Profile "}});
}

TEST(SoftwareMachines, processesOfOthers) {
    const auto server = servedInstances<UnixProcessProvider>("server");
    ASSERT_EQ(server.size(), 3U);
    expectProperties(server[1], {{"Name", "migration/0"},
                                 {"Priority", "null"},
                                 {"WorkingSetSizeKB", "null"},
                                 {"KernelModeTime", "900000"},
                                 {"Parameters", ""}});
    expectProperties(server[2], {{"Handle", "90001"},
                                 {"UserName", "postgres"},
                                 {"UserModeTime", "9000000000"},
                                 {"ProcessorSeconds", "10000000"},
                                 {"WorkingSetSize", "8589934592"},
                                 {"WorkingSetSizeKB", "8388608"},
                                 {"CreationDate", "20230723052640.000000+060"},
                                 {"Parameters", "postgres: writer "}});
    const auto virtualMachine = servedInstances<UnixProcessProvider>("virtual");
    ASSERT_EQ(virtualMachine.size(), 2U);
    expectProperties(virtualMachine[1], {{"Name", "defunct)"},
                                         {"ExecutionState", "7"},
                                         {"OperationalStatus", "17 "},
                                         {"ProcessNiceValue", "19"},
                                         {"UserName", "null"}});
    const auto arm = servedInstances<UnixProcessProvider>("arm");
    ASSERT_EQ(arm.size(), 1U);
    expectProperties(arm[0], {{"OSName", "Sennix"}, {"ProcessTTY", "ttyS1"}, {"UserName", "root"}});
}

TEST(SoftwareMachines, accounts) {
    const auto laptop = servedInstances<AccountProvider>("laptop");
    ASSERT_EQ(laptop.size(), 3U);
    expectProperties(laptop[2], {{"Name", "ada"},
                                 {"SystemName", "birch"},
                                 {"UserID", "1000"},
                                 {"Descriptions", "Ada Lund "},
                                 {"HomeDirectory", "/home/ada"},
                                 {"LastLogin", "null"}});
    const auto server = servedInstances<AccountProvider>("server");
    ASSERT_EQ(server.size(), 2U);
    EXPECT_EQ(textOf(server[1], "Name"), "postgres");
    EXPECT_EQ(textOf(servedInstances<AccountProvider>("virtual").at(1), "UserID"), "65534");
    EXPECT_EQ(textOf(servedInstances<AccountProvider>("arm").at(0), "Descriptions"), "null");
}

TEST(SoftwareMachines, groups) {
    const auto laptop = servedInstances<GroupProvider>("laptop");
    ASSERT_EQ(laptop.size(), 4U);
    expectProperties(laptop[2], {{"Name", "sudo"}, {"GroupID", "27"}, {"Members", "ada "}});
    const auto server = servedInstances<GroupProvider>("server");
    ASSERT_EQ(server.size(), 3U);
    EXPECT_EQ(textOf(server[1], "Members"), "root ops ");
    EXPECT_EQ(textOf(servedInstances<GroupProvider>("virtual").at(1), "GroupID"), "65534");
    EXPECT_EQ(textOf(servedInstances<GroupProvider>("arm").at(0), "Members"), "root ");
}

TEST(SoftwareMachines, timeZones) {
    expectProperties(servedInstances<TimeZoneProvider>("laptop").at(0),
                     {{"TimeZoneID", "Europe/Berlin"},
                      {"TimeZoneStartDate", "18930401000632.000000+060"},
                      {"StandardOffset", "60"},
                      {"DaylightOffset", "120"},
                      {"PosixRules", "CET-1CEST,M3.5.0,M10.5.0/3"}});
    expectProperties(servedInstances<TimeZoneProvider>("server").at(0),
                     {{"TimeZoneID", "UTC"},
                      {"TimeZoneStartDate", "00000101000000.000000+720"},
                      {"StandardName", "UTC"},
                      {"StandardOffset", "0"},
                      {"DaylightName", "null"}});
    // The name is known, the zone's file is not there.
    expectProperties(servedInstances<TimeZoneProvider>("virtual").at(0),
                     {{"TimeZoneID", "Etc/UTC"}, {"StandardOffset", "null"}});
    expectAbsent<TimeZoneProvider>("arm");
}

TEST(SoftwareMachines, noBusIsRecorded) {
    for (const char* name : {"laptop", "server", "virtual", "arm"})
        expectAbsent<ServiceProvider>(name);
}

}  // namespace
}  // namespace cimomd
