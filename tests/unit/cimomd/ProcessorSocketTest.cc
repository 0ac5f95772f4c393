#include "system/processor/ProcessorSocket.h"

#include <gtest/gtest.h>

#include "SmbiosBytes.h"
#include "system/processor/InstalledProcessor.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kWorking = 0x41;

SmbiosFields processor(std::uint8_t length, std::uint8_t status) {
    SmbiosFields fields(4, length);
    fields.byte(0x05, 3).byte(0x18, status);
    return fields;
}

std::vector<ProcessorSocket> socketsOf(const std::vector<SmbiosFields>& structures) {
    SmbiosTable table;
    table.structures = parseSmbiosStructures(smbiosTableOf(structures));
    return processorSockets(table);
}

TEST(ProcessorSocket, readsAStructureOfVersion30) {
    const auto sockets = socketsOf({processor(0x30, kWorking)
                                        .text(0x04, "P0")
                                        .byte(0x06, 0xFE)
                                        .text(0x07, "Ampere(R)")
                                        .text(0x10, "Ampere(R) Altra(R) Processor")
                                        .word(0x12, 1650)
                                        .word(0x14, 3000)
                                        .word(0x16, 2800)
                                        .byte(0x19, 6)
                                        .text(0x20, "000000000000000002550A0104A1F008")
                                        .text(0x22, "Q80-30")
                                        .word(0x28, 0x0101)});
    ASSERT_EQ(sockets.size(), 1U);
    const ProcessorSocket& socket = sockets[0];
    EXPECT_EQ(socket.number, 1U);
    EXPECT_EQ(socket.designation, "P0");
    EXPECT_EQ(socket.family, 257);
    EXPECT_EQ(socket.manufacturer, "Ampere(R)");
    EXPECT_EQ(socket.version, "Ampere(R) Altra(R) Processor");
    EXPECT_EQ(socket.externalClockMHz, 1650);
    EXPECT_EQ(socket.maxMHz, 3000);
    EXPECT_EQ(socket.currentMHz, 2800);
    EXPECT_EQ(socket.status, 1);
    EXPECT_EQ(socket.upgrade, 6);
    EXPECT_EQ(socket.serialNumber, "000000000000000002550A0104A1F008");
    EXPECT_EQ(socket.partNumber, "Q80-30");
    EXPECT_FALSE(socket.isDisabled());
}

TEST(ProcessorSocket, takesUnknownNumbersAsNothing) {
    // Unknown family and upgrade; the clock rates are 0.
    const auto sockets = socketsOf({processor(0x1A, kWorking).byte(0x06, 2).byte(0x19, 2),
                                    processor(0x1A, kWorking).byte(0x06, 0xFE)});
    ASSERT_EQ(sockets.size(), 2U);
    for (const ProcessorSocket& socket : sockets) {
        EXPECT_EQ(socket.family.reason(), Absence::Absent);
        EXPECT_EQ(socket.family, std::nullopt);
        EXPECT_EQ(socket.upgrade, std::nullopt);
        EXPECT_EQ(socket.maxMHz, std::nullopt);
        EXPECT_EQ(socket.currentMHz, std::nullopt);
        EXPECT_EQ(socket.externalClockMHz, std::nullopt);
        EXPECT_EQ(socket.designation, std::nullopt);
        EXPECT_EQ(socket.serialNumber, std::nullopt);
    }
}

TEST(ProcessorSocket, leavesOutEmptySocketsAndOtherKinds) {
    const auto sockets = socketsOf(
        {processor(0x1A, 0x01), processor(0x1A, kWorking), processor(0x1A, kWorking).byte(0x05, 4),
         processor(0x1A, kWorking).byte(0x05, 6), processor(0x1A, 0x43), SmbiosFields(4, 0x10),
         SmbiosFields(7, 0x1A).byte(0x18, kWorking)});
    ASSERT_EQ(sockets.size(), 2U);
    EXPECT_EQ(sockets[0].number, 2U);
    EXPECT_EQ(sockets[1].number, 5U);
    EXPECT_TRUE(sockets[1].isDisabled());
}

ProcessorPackage package(std::int64_t number) {
    ProcessorPackage out;
    out.number = number;
    return out;
}

TEST(InstalledProcessor, takesSocketsInTheirOrder) {
    const auto sockets = socketsOf({processor(0x1A, kWorking).text(0x04, "CPU1"),
                                    processor(0x1A, 0x42).text(0x04, "CPU2"),
                                    processor(0x1A, kWorking).text(0x04, "CPU3")});
    const auto processors = installedProcessors({package(0), package(2)}, sockets);
    ASSERT_EQ(processors.size(), 3U);
    EXPECT_EQ(processors[0].package->number, 0);
    EXPECT_EQ(processors[0].socket->designation, "CPU1");
    EXPECT_EQ(processors[1].package->number, 2);
    EXPECT_EQ(processors[1].socket->designation, "CPU3");
    EXPECT_FALSE(processors[2].package.has_value());
    EXPECT_EQ(processors[2].socket->designation, "CPU2");
}

TEST(InstalledProcessor, doesNotGuessWhenTheNumbersDiffer) {
    const auto sockets = socketsOf({processor(0x1A, kWorking)});
    for (const InstalledProcessor& processor :
         installedProcessors({package(0), package(1)}, sockets))
        EXPECT_EQ(processor.socket.reason(), Absence::Unreadable);
    const auto forbidden = installedProcessors({package(0)}, Absence::NeedsRoot);
    ASSERT_EQ(forbidden.size(), 1U);
    EXPECT_EQ(forbidden[0].socket.reason(), Absence::NeedsRoot);
}

}  // namespace
}  // namespace cimomd
