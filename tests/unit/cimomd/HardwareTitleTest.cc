#include "providers/devices/HardwareTitle.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(HardwareTitle, writesIdentifiersInFourDigits) {
    EXPECT_EQ(hardwareIdOf(std::uint16_t{0x46D}, std::uint16_t{0xC}), "046d:000c");
    EXPECT_EQ(hardwareIdOf(Absence::NeedsRoot, std::uint16_t{1}).reason(), Absence::NeedsRoot);
    EXPECT_FALSE(hardwareIdOf(Absence::NeedsRoot, std::uint16_t{1}));
    EXPECT_EQ(hardwareIdOf(std::uint16_t{1}, Absence::Filtered).reason(), Absence::Filtered);
}

TEST(HardwareTitle, saysWhatIsKnown) {
    EXPECT_EQ(titleOf("Intel", "AX201", "8086:a0f0"), "Intel AX201");
    EXPECT_EQ(titleOf("Intel", std::nullopt, "8086:a0f0"), "Intel 8086:a0f0");
    EXPECT_EQ(titleOf(std::nullopt, "AX201", "8086:a0f0"), "AX201");
    EXPECT_EQ(titleOf(std::nullopt, std::nullopt, "8086:a0f0"), "8086:a0f0");
}

TEST(HardwareTitle, doesNotSayTheMakerTwice) {
    EXPECT_EQ(titleOf("QEMU", "QEMU USB Tablet", ""), "QEMU USB Tablet");
}

}  // namespace
}  // namespace cimomd
