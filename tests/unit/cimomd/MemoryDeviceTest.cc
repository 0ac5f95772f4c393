#include "system/computer/MemoryDevice.h"

#include <gtest/gtest.h>

#include "SmbiosBytes.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kMemory = 17;
constexpr std::uint64_t kGiB = std::uint64_t{1} << 30;

std::vector<MemoryDevice> devicesOf(const std::vector<SmbiosFields>& structures) {
    return memoryDevicesOf({{3, 2}, parseSmbiosStructures(smbiosTableOf(structures))});
}

MemoryDevice deviceOf(const SmbiosFields& structure) {
    const auto devices = devicesOf({structure});
    EXPECT_EQ(devices.size(), 1U);
    return devices.empty() ? MemoryDevice{} : devices[0];
}

SmbiosFields module(std::uint16_t size, std::uint8_t length = 0x54) {
    return SmbiosFields(kMemory, length).word(0x0C, size);
}

TEST(MemoryDevice, hasItsSizeInMegabytesOrKilobytes) {
    EXPECT_EQ(deviceOf(module(8192)).capacityBytes, 8 * kGiB);
    EXPECT_EQ(deviceOf(module(0x7FFE)).capacityBytes, std::uint64_t{0x7FFE} << 20);
    EXPECT_EQ(deviceOf(module(0x8000 | 512)).capacityBytes, std::uint64_t{512} << 10);
}

TEST(MemoryDevice, hasALargeSizeInAFieldOfItsOwn) {
    EXPECT_EQ(deviceOf(module(0x7FFF).doubleWord(0x1C, 65536)).capacityBytes, 64 * kGiB);
    // The highest bit is reserved.
    EXPECT_EQ(deviceOf(module(0x7FFF).doubleWord(0x1C, 0x80000000U | 1024)).capacityBytes, kGiB);
    const auto withoutField = deviceOf(module(0x7FFF, 0x1C)).capacityBytes;
    EXPECT_EQ(withoutField, std::nullopt);
    EXPECT_EQ(withoutField.reason(), Absence::Absent);
    EXPECT_EQ(deviceOf(module(0x7FFF)).capacityBytes.reason(), Absence::Filtered);
}

TEST(MemoryDevice, isNoneWithoutASize) {
    EXPECT_TRUE(devicesOf({module(0)}).empty());
    EXPECT_TRUE(devicesOf({module(0x8000)}).empty());
    EXPECT_TRUE(devicesOf({SmbiosFields(kMemory, 0x0D)}).empty());
}

TEST(MemoryDevice, isThereThoughItsSizeIsUnknown) {
    const auto device = deviceOf(module(0xFFFF));
    EXPECT_EQ(device.capacityBytes, std::nullopt);
    EXPECT_EQ(device.capacityBytes.reason(), Absence::Absent);
}

TEST(MemoryDevice, keepsItsNumberBesideEmptySockets) {
    const auto devices = devicesOf({module(0), module(1), module(0), module(2)});
    ASSERT_EQ(devices.size(), 2U);
    EXPECT_EQ(devices[0].socketNumber, 1U);
    EXPECT_EQ(devices[1].socketNumber, 3U);
}

TEST(MemoryDevice, hasSpeeds) {
    const auto ordinary = deviceOf(module(1).word(0x15, 3200).word(0x20, 2933));
    EXPECT_EQ(ordinary.maxSpeedMHz, 3200U);
    EXPECT_EQ(ordinary.configuredSpeedMHz, 2933U);
    const auto unknown = deviceOf(module(1));
    EXPECT_EQ(unknown.maxSpeedMHz, std::nullopt);
    EXPECT_EQ(unknown.configuredSpeedMHz.reason(), Absence::Absent);
    const auto fast = deviceOf(module(1, 0x5C)
                                   .word(0x15, 0xFFFF)
                                   .word(0x20, 0xFFFF)
                                   .doubleWord(0x54, 0x80000000U | 70000)
                                   .doubleWord(0x58, 66000));
    EXPECT_EQ(fast.maxSpeedMHz, 70000U);
    EXPECT_EQ(fast.configuredSpeedMHz, 66000U);
    EXPECT_EQ(deviceOf(module(1).word(0x15, 0xFFFF)).maxSpeedMHz, std::nullopt);
}

TEST(MemoryDevice, hasWidths) {
    const auto widths = [](std::uint16_t total, std::uint16_t data) {
        const auto device = deviceOf(module(1).word(0x08, total).word(0x0A, data));
        return std::pair(device.totalWidthBits, device.dataWidthBits);
    };
    EXPECT_EQ(widths(72, 64), std::pair(Fact<std::uint16_t>(std::uint16_t{72}),
                                        Fact<std::uint16_t>(std::uint16_t{64})));
    // Only for the correction of errors.
    EXPECT_EQ(widths(8, 0).second, 0);
    EXPECT_EQ(widths(0xFFFF, 0xFFFF).first, std::nullopt);
    EXPECT_EQ(widths(0xFFFF, 0xFFFF).second.reason(), Absence::Absent);
    EXPECT_EQ(widths(0, 0).first.reason(), Absence::Filtered);
    EXPECT_EQ(widths(0, 0).second.reason(), Absence::Filtered);
}

TEST(MemoryDevice, hasTexts) {
    const auto device = deviceOf(module(1)
                                     .text(0x10, "DIMM_A1")
                                     .text(0x11, "BANK 0")
                                     .text(0x17, "Maker")
                                     .text(0x18, "00000000")
                                     .text(0x19, "Asset 7")
                                     .text(0x1A, "PART-1   "));
    EXPECT_EQ(device.locator, "DIMM_A1");
    EXPECT_EQ(device.bankLabel, "BANK 0");
    EXPECT_EQ(device.manufacturer, "Maker");
    EXPECT_EQ(device.serialNumber, std::nullopt);
    EXPECT_EQ(device.serialNumber.reason(), Absence::Filtered);
    EXPECT_EQ(device.assetTag, "Asset 7");
    EXPECT_EQ(device.partNumber, "PART-1");
}

// A module of version 2.1 ends before the speed, one of 2.3 before the rank.
TEST(MemoryDevice, ofOldTablesHasLess) {
    const auto oldest = deviceOf(module(64, 0x15).byte(0x0E, 3).byte(0x12, 15));
    EXPECT_EQ(oldest.capacityBytes, std::uint64_t{64} << 20);
    EXPECT_EQ(oldest.formFactor, 3);
    EXPECT_EQ(oldest.type, 15);
    EXPECT_EQ(oldest.maxSpeedMHz, std::nullopt);
    EXPECT_EQ(oldest.manufacturer.reason(), Absence::Absent);
    const auto old = deviceOf(module(64, 0x1B).word(0x15, 133).text(0x17, "Maker"));
    EXPECT_EQ(old.maxSpeedMHz, 133U);
    EXPECT_EQ(old.manufacturer, "Maker");
    EXPECT_EQ(old.configuredSpeedMHz, std::nullopt);
}

TEST(MemoryDevice, mayBelongToSomethingElseThanMainMemory) {
    const auto array = [](std::uint16_t handle, std::uint8_t use) {
        return SmbiosFields(16, 0x0F, handle).byte(0x05, use);
    };
    const auto devices = devicesOf({array(1, 3), array(2, 5), SmbiosFields(16, 5, 3),
                                    module(1024).word(0x04, 1), module(8).word(0x04, 2),
                                    module(2048).word(0x04, 3), module(4096).word(0x04, 9)});
    ASSERT_EQ(devices.size(), 4U);
    EXPECT_TRUE(devices[0].isMainMemory);
    EXPECT_FALSE(devices[1].isMainMemory);
    EXPECT_TRUE(devices[2].isMainMemory);
    EXPECT_TRUE(devices[3].isMainMemory);
    EXPECT_EQ(totalCapacityBytes(devices), 7 * kGiB);
}

TEST(MemoryDevice, givesNoSumWhenOneIsUnknown) {
    EXPECT_EQ(totalCapacityBytes(devicesOf({module(1024), module(0xFFFF)})), std::nullopt);
    EXPECT_EQ(totalCapacityBytes({}).reason(), Absence::Absent);
}

TEST(MemoryDevice, ofTheKernelHasItsSizeOnly) {
    const auto device = memoryOfKernel(1024);
    EXPECT_FALSE(device.describedByFirmware);
    EXPECT_EQ(device.capacityBytes, std::uint64_t{1} << 20);
    EXPECT_EQ(memoryOfKernel(UINT64_MAX).capacityBytes.reason(), Absence::Filtered);
}

}  // namespace
}  // namespace cimomd
