// The processors of the recorded machines and their caches.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/processor/CacheMemoryProvider.h"
#include "providers/processor/ProcessorProvider.h"

namespace cimomd {
namespace {

Table processorsOf(const char* name, const std::vector<const char*>& properties) {
    return tableOf(ProcessorProvider(machine(name)), properties);
}

Table cachesOf(const char* name) {
    return tableOf(CacheMemoryProvider(machine(name)),
                   {"DeviceID", "Level", "CacheType", "SizeKB", "Associativity", "Ways", "LineSize",
                    "SharedBy"});
}

const std::vector<const char*> kModel{"DeviceID",     "Family", "OtherFamilyDescription",
                                      "Manufacturer", "Model",  "Stepping"};
const std::vector<const char*> kClocks{"MaxClockSpeed", "CurrentClockSpeed",
                                       "ExternalBusClockSpeed"};
const std::vector<const char*> kSize{"NumberOfEnabledCores", "NumberOfEnabledThreads", "DataWidth",
                                     "AddressWidth"};
const std::vector<const char*> kSocket{"SocketDesignation", "UpgradeMethod", "SerialNumber",
                                       "PartNumber",        "CPUStatus",     "EnabledState"};

TEST(ProcessorMachines, laptop) {
    EXPECT_EQ(processorsOf("laptop", kModel),
              (Table{{"CPU0", "205", "null", "GenuineIntel",
                      "11th Gen Intel(R) Core(TM) i5-1135G7 @ 2.40GHz", "1"}}));
    // The fastest core counts; 4100.501 MHz are nearer to 4101.
    EXPECT_EQ(processorsOf("laptop", kClocks), (Table{{"4200", "4101", "100"}}));
    EXPECT_EQ(processorsOf("laptop", kSize), (Table{{"4", "8", "64", "64"}}));
    EXPECT_EQ(processorsOf("laptop", kSocket), (Table{{"U3E1", "60", "null", "null", "1", "2"}}));
    EXPECT_EQ(cachesOf("laptop"), (Table{{"L1d-0", "3", "4", "48", "1", "12", "64", "0,4"},
                                         {"L1i-0", "3", "3", "32", "6", "8", "64", "0,4"},
                                         {"L2-0", "4", "5", "1280", "1", "20", "64", "0,4"},
                                         {"L3-0", "5", "5", "8192", "6", "8", "64", "0-7"},
                                         {"L1d-1", "3", "4", "48", "1", "12", "64", "1,5"},
                                         {"L1i-1", "3", "3", "32", "6", "8", "64", "1,5"},
                                         {"L2-1", "4", "5", "1280", "1", "20", "64", "1,5"},
                                         {"L1d-2", "3", "4", "48", "1", "12", "64", "2,6"},
                                         {"L1i-2", "3", "3", "32", "6", "8", "64", "2,6"},
                                         {"L2-2", "4", "5", "1280", "1", "20", "64", "2,6"},
                                         {"L1d-3", "3", "4", "48", "1", "12", "64", "3,7"},
                                         {"L1i-3", "3", "3", "32", "6", "8", "64", "3,7"},
                                         {"L2-3", "4", "5", "1280", "1", "20", "64", "3,7"}}));
}

TEST(ProcessorMachines, server) {
    const char* model = "Intel(R) Xeon(R) Gold 5222 CPU @ 3.80GHz";
    EXPECT_EQ(processorsOf("server", kModel),
              (Table{{"CPU0", "179", "null", "GenuineIntel", model, "7"},
                     {"CPU1", "179", "null", "GenuineIntel", model, "7"}}));
    EXPECT_EQ(processorsOf("server", kClocks),
              (Table{{"3900", "3800", "10400"}, {"3900", "3800", "10400"}}));
    // One core of the second socket is off line.
    EXPECT_EQ(processorsOf("server", kSize),
              (Table{{"4", "4", "64", "64"}, {"3", "3", "64", "64"}}));
    EXPECT_EQ(processorsOf("server", kSocket),
              (Table{{"CPU1", "54", "5F3A81C7", "null", "1", "2"},
                     {"CPU2", "54", "5F3A81D2", "null", "1", "2"}}));
    const Table caches = cachesOf("server");
    // Three of each of the seven cores that work, and one of each socket.
    ASSERT_EQ(caches.size(), 23U);
    EXPECT_EQ(caches[3], (Row{"L3-0", "5", "5", "16896", "1", "11", "64", "0,2,4,6"}));
    EXPECT_EQ(caches[7], (Row{"L3-1", "5", "5", "16896", "1", "11", "64", "1,3,5"}));
    EXPECT_EQ(caches[22], (Row{"L2-6", "4", "5", "1024", "7", "16", "64", "6"}));
}

TEST(ProcessorMachines, virtualMachine) {
    const char* model = "QEMU Virtual CPU version 2.5+";
    EXPECT_EQ(processorsOf("virtual", kModel),
              (Table{{"CPU0", "1", model, "AuthenticAMD", model, "1"},
                     {"CPU1", "1", model, "AuthenticAMD", model, "1"}}));
    EXPECT_EQ(processorsOf("virtual", kClocks),
              (Table{{"2000", "2595", "null"}, {"2000", "2595", "null"}}));
    EXPECT_EQ(processorsOf("virtual", kSize),
              (Table{{"1", "1", "64", "64"}, {"1", "1", "64", "64"}}));
    EXPECT_EQ(processorsOf("virtual", kSocket), (Table{{"CPU 0", "1", "null", "null", "1", "2"},
                                                       {"CPU 1", "1", "null", "null", "1", "2"}}));
    EXPECT_EQ(cachesOf("virtual"), (Table{{"L1d-0", "3", "4", "64", "3", "2", "64", "0"},
                                          {"L1i-0", "3", "3", "64", "3", "2", "64", "0"},
                                          {"L2-0", "4", "5", "512", "7", "16", "64", "0"},
                                          {"L3-0", "5", "5", "16384", "7", "16", "64", "0"},
                                          {"L1d-1", "3", "4", "64", "3", "2", "64", "1"},
                                          {"L1i-1", "3", "3", "64", "3", "2", "64", "1"},
                                          {"L2-1", "4", "5", "512", "7", "16", "64", "1"},
                                          {"L3-1", "5", "5", "16384", "7", "16", "64", "1"}}));
}

TEST(ProcessorMachines, armBoard) {
    EXPECT_EQ(processorsOf("arm", kModel),
              (Table{{"CPU0", "1", "Cortex-A72", "ARM", "Cortex-A72", "3"}}));
    EXPECT_EQ(processorsOf("arm", kClocks), (Table{{"1500", "null", "null"}}));
    EXPECT_EQ(processorsOf("arm", kSize), (Table{{"4", "4", "64", "64"}}));
    EXPECT_EQ(processorsOf("arm", kSocket), (Table{{"null", "null", "null", "null", "1", "2"}}));
    const Table caches = cachesOf("arm");
    ASSERT_EQ(caches.size(), 9U);
    EXPECT_EQ(caches[0], (Row{"L1d-0", "3", "4", "null", "null", "null", "64", "0"}));
    EXPECT_EQ(caches[2], (Row{"L2-0", "4", "5", "1024", "7", "16", "64", "0-3"}));
}

TEST(ProcessorMachines, serveWhatTheSchemaDeclares) {
    for (const char* name : {"laptop", "server", "virtual", "arm"}) {
        expectServesItsClass(ProcessorProvider(machine(name)));
        expectServesItsClass(CacheMemoryProvider(machine(name)));
    }
}

}  // namespace
}  // namespace cimomd
