#include "system/software/KernelTables.h"

#include <gtest/gtest.h>
#include <utmpx.h>

#include <string>

namespace cimomd {
namespace {

TEST(KernelTables, readsMemory) {
    const MemoryInfo memory = parseMemoryInfo(
        "MemTotal:       24684096 kB\nMemFree:         1048576 kB\nMemAvailable: 5 kB\n"
        "SwapTotal:             0 kB\nHugePages_Total:       0\n");
    EXPECT_EQ(memory.totalKB, 24684096U);
    EXPECT_EQ(memory.freeKB, 1048576U);
    EXPECT_EQ(memory.swapTotalKB, 0U);
}

TEST(KernelTables, leavesOutMemoryItCannotRead) {
    const MemoryInfo memory =
        parseMemoryInfo("MemTotal: many kB\nMemFree: 5\nSwapTotal: 99999999999999999999 kB\n");
    EXPECT_EQ(memory.totalKB, std::nullopt);
    EXPECT_EQ(memory.freeKB, std::nullopt);
    EXPECT_EQ(memory.swapTotalKB, std::nullopt);
}

TEST(KernelTables, readsTheBootTime) {
    EXPECT_EQ(parseBootTime("cpu  1 2 3\nintr 5 0\nbtime 1700000000\nprocesses 9\n"), 1700000000);
    EXPECT_EQ(parseBootTime("cpu 1\n"), std::nullopt);
    EXPECT_EQ(parseBootTime("btime soon\n"), std::nullopt);
}

std::string record(short type) {
    utmpx entry{};
    entry.ut_type = type;
    return {reinterpret_cast<const char*>(&entry), sizeof entry};
}

TEST(KernelTables, countsUserSessions) {
    EXPECT_EQ(countSessions(""), 0U);
    EXPECT_EQ(countSessions(record(BOOT_TIME) + record(USER_PROCESS) + record(DEAD_PROCESS) +
                            record(USER_PROCESS)),
              2U);
    EXPECT_EQ(countSessions(record(USER_PROCESS) + record(USER_PROCESS).substr(0, 100)), 1U);
}

}  // namespace
}  // namespace cimomd
