#include "providers/processor/ProcessorProvider.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "mof/MofCompiler.h"
#include "providers/processor/ProcessorNumbers.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

class ProcessorProviderTest : public testing::Test {
  protected:
    ProcessorProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
};

TEST_F(ProcessorProviderTest, publishesPackages) {
    for (const char* cpu : {"cpu0", "cpu1"}) {
        const std::string base = std::string("sys/devices/system/cpu/") + cpu;
        tree.file(base + "/topology/physical_package_id", cpu[3] == '0' ? "0\n" : "3\n")
            .file(base + "/topology/core_id", "0\n")
            .file(base + "/cpufreq/cpuinfo_max_freq", "3600000\n");
    }
    const std::string longName(80, 'x');
    tree.file("proc/cpuinfo",
              "processor: 0\nvendor_id: AuthenticAMD\nmodel name: AMD EPYC\n"
              "stepping: 1\ncpu MHz: 2596.142\nflags: lm\n\nprocessor: 1\n"
              "model name: " +
                  longName + "\n");
    const auto instances = all(ProcessorProvider(tree.paths()).enumerate());
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "DeviceID"), "CPU0");
    EXPECT_EQ(textOf(instances[0], "SystemName"), "node7");
    EXPECT_EQ(textOf(instances[0], "Family"), "1");
    EXPECT_EQ(textOf(instances[0], "OtherFamilyDescription"), "AMD EPYC");
    EXPECT_EQ(textOf(instances[0], "MaxClockSpeed"), "3600");
    EXPECT_EQ(textOf(instances[0], "CurrentClockSpeed"), "2596");
    EXPECT_EQ(textOf(instances[0], "DataWidth"), "64");
    EXPECT_EQ(textOf(instances[0], "Stepping"), "1");
    EXPECT_EQ(textOf(instances[0], "CPUStatus"), "1");
    EXPECT_EQ(textOf(instances[0], "NumberOfEnabledCores"), "1");
    EXPECT_EQ(textOf(instances[0], "NumberOfEnabledThreads"), "1");
    EXPECT_EQ(textOf(instances[0], "Manufacturer"), "AuthenticAMD");
    EXPECT_EQ(textOf(instances[1], "DeviceID"), "CPU3");
    EXPECT_EQ(textOf(instances[1], "Model"), longName);
    EXPECT_EQ(textOf(instances[1], "OtherFamilyDescription"), longName.substr(0, 64));
    EXPECT_EQ(textOf(instances[1], "CurrentClockSpeed"), "null");
    EXPECT_EQ(textOf(instances[1], "Manufacturer"), "null");
}

TEST_F(ProcessorProviderTest, saysWhyThereAreNone) {
    const auto reason = [this] {
        const auto stream = ProcessorProvider(tree.paths()).enumerate();
        ProvidedInstance provided;
        EXPECT_FALSE(stream->next(provided));
        return stream->absence();
    };
    EXPECT_EQ(reason(), Absence::Absent);
    tree.file("proc/cpuinfo", "nothing\n");
    EXPECT_EQ(reason(), Absence::Unreadable);
}

// Virtual machines may show the directories of processors without topology: there were no
// processors at all then.
TEST_F(ProcessorProviderTest, doesWithoutTopology) {
    tree.file("sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq", "2400000\n")
        .directory("sys/devices/system/cpu/cpu1")
        .directory("sys/devices/system/cpu/cpu2")
        .file("proc/cpuinfo",
              "processor: 0\nphysical id: 0\ncore id: 0\nmodel name: Q\n\n"
              "processor: 1\nphysical id: 0\ncore id: 1\nmodel name: Q\n");
    const auto stream = ProcessorProvider(tree.paths()).enumerate();
    ProvidedInstance provided;
    ASSERT_TRUE(stream->next(provided));
    EXPECT_EQ(textOf(provided.instance, "DeviceID"), "CPU0");
    EXPECT_EQ(textOf(provided.instance, "Model"), "Q");
    EXPECT_EQ(textOf(provided.instance, "NumberOfEnabledCores"), "2");
    // The third is off line.
    EXPECT_EQ(textOf(provided.instance, "NumberOfEnabledThreads"), "2");
    EXPECT_EQ(textOf(provided.instance, "MaxClockSpeed"), "2400");
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), std::nullopt);
}

InstalledProcessor onlySocket(std::uint8_t status) {
    ProcessorSocket socket;
    socket.number = 2;
    socket.status = status;
    socket.version = std::string("Xeon");
    socket.manufacturer = std::string("Intel");
    socket.family = std::uint16_t{0xB3};
    socket.maxMHz = std::uint16_t{3800};
    socket.upgrade = std::uint8_t{200};
    return {std::nullopt, socket};
}

TEST_F(ProcessorProviderTest, publishesProcessorsThatTheFirmwareDisabled) {
    const auto byUser = ProcessorProvider::publish("node7", onlySocket(2)).instance;
    EXPECT_EQ(textOf(byUser, "DeviceID"), "SOCKET2");
    EXPECT_EQ(textOf(byUser, "CPUStatus"), "2");
    EXPECT_EQ(textOf(byUser, "EnabledState"), "3");
    EXPECT_EQ(textOf(byUser, "OperationalStatus"), "10 ");
    EXPECT_EQ(textOf(byUser, "Model"), "Xeon");
    EXPECT_EQ(textOf(byUser, "Manufacturer"), "Intel");
    EXPECT_EQ(textOf(byUser, "Family"), "179");
    EXPECT_EQ(textOf(byUser, "OtherFamilyDescription"), "null");
    EXPECT_EQ(textOf(byUser, "MaxClockSpeed"), "3800");
    EXPECT_EQ(textOf(byUser, "CurrentClockSpeed"), "null");
    EXPECT_EQ(textOf(byUser, "UpgradeMethod"), "1");
    EXPECT_EQ(textOf(byUser, "NumberOfEnabledCores"), "null");
    EXPECT_EQ(textOf(byUser, "NumberOfEnabledThreads"), "null");
    const auto byFirmware = ProcessorProvider::publish("node7", onlySocket(3)).instance;
    EXPECT_EQ(textOf(byFirmware, "CPUStatus"), "3");
    EXPECT_EQ(textOf(byFirmware, "OperationalStatus"), "6 ");
}

TEST_F(ProcessorProviderTest, keepsTheReasonOfAMissingSocket) {
    const auto provided =
        ProcessorProvider::publish("node7", {ProcessorPackage(), Absence::NeedsRoot});
    for (const char* name : {"UpgradeMethod", "ExternalBusClockSpeed", "SocketDesignation",
                             "SerialNumber", "PartNumber", "Family", "MaxClockSpeed"}) {
        const auto missing = std::find_if(
            provided.missing.begin(), provided.missing.end(),
            [name](const MissingValue& value) { return value.property == std::string(name); });
        ASSERT_NE(missing, provided.missing.end()) << name;
        EXPECT_EQ(missing->reason, Absence::NeedsRoot) << name;
    }
}

/// Expects that the schema lists just those numbers below `end` that `isListed` takes.
template <typename IsListed>
void expectListed(const char* property, unsigned end, IsListed isListed) {
    const Pegasus::CIMNamespaceName nameSpace("root/cimv2");
    ClassRepository repository;
    MofCompiler(repository, nameSpace)
        .compileFile(std::filesystem::path(SCHEMA_DIR) / "cimomd.mof");
    const Pegasus::CIMConstClass declared(
        *repository.findClass(nameSpace, Pegasus::CIMName("CIM_Processor")));
    const auto list = declared.getProperty(declared.findProperty(Pegasus::CIMName(property)));
    Pegasus::Array<Pegasus::String> numbers;
    list.getQualifier(list.findQualifier(Pegasus::CIMName("ValueMap"))).getValue().get(numbers);
    std::vector<std::string> expected;
    for (unsigned number = 1; number < end; ++number) {
        if (isListed(number))
            expected.push_back(std::to_string(number));
    }
    std::vector<std::string> found;
    for (Pegasus::Uint32 i = 0; i < numbers.size(); ++i)
        found.push_back(utf8Of(numbers[i]));
    EXPECT_EQ(found, expected) << property;
}

TEST(ProcessorNumbers, areThoseThatTheSchemaHasTextsFor) {
    expectListed("Family", 2000, [](unsigned number) {
        return processorFamilyOf(static_cast<std::uint16_t>(number)) == number;
    });
    expectListed("UpgradeMethod", 256, [](unsigned number) {
        return upgradeMethodOf(static_cast<std::uint8_t>(number)) == number;
    });
}

TEST(ProcessorNumbers, areOtherBeyondTheList) {
    EXPECT_EQ(processorFamilyOf(0xCD), 205);
    EXPECT_EQ(processorFamilyOf(0x101), 257);
    EXPECT_EQ(processorFamilyOf(0x6B), 1);
    EXPECT_EQ(processorFamilyOf(0), 1);
    EXPECT_EQ(processorFamilyOf(0xFE), 1);
    EXPECT_EQ(upgradeMethodOf(0x3C), 60);
    EXPECT_EQ(upgradeMethodOf(0x3D), 1);
}

}  // namespace
}  // namespace cimomd
