#include "providers/computer/BiosElementProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kFirmware = 0;

Firmware firmwareIn(const SmbiosFields& structure) {
    return firmwareOf({{3, 2}, parseSmbiosStructures(smbiosTableOf({structure}))}).at(0);
}

TEST(FirmwareDate, hasMonthDayAndYear) {
    EXPECT_EQ(parseFirmwareDate("08/14/2022"), (CalendarDate{2022, 8, 14}));
    EXPECT_EQ(parseFirmwareDate(" 2/9/2010 "), (CalendarDate{2010, 2, 9}));
    EXPECT_EQ(parseFirmwareDate("02/29/2000"), (CalendarDate{2000, 2, 29}));
}

TEST(FirmwareDate, mayHaveTwoDigitsOfTheYear) {
    EXPECT_EQ(parseFirmwareDate("12/31/99"), (CalendarDate{1999, 12, 31}));
    EXPECT_EQ(parseFirmwareDate("01/01/95"), (CalendarDate{1995, 1, 1}));
    EXPECT_EQ(parseFirmwareDate("07/02/03"), (CalendarDate{2003, 7, 2}));
    EXPECT_EQ(parseFirmwareDate("07/02/00"), (CalendarDate{2000, 7, 2}));
}

TEST(FirmwareDate, isNothingElse) {
    for (const char* text : {"",
                             "/",
                             "//",
                             "2022",
                             "13/01/2022",
                             "00/10/2022",
                             "02/30/2022",
                             "02/29/2022",
                             "2022-08-14",
                             "14.08.2022",
                             "08/14/22022",
                             "08/14/202",
                             "08/14/2",
                             "08/14/",
                             "08//2022",
                             "08/14/2022/1",
                             "08/14/1980",
                             "-8/14/2022",
                             "08/99999999999999999999/2022",
                             "a/b/cdef"})
        EXPECT_EQ(parseFirmwareDate(text), std::nullopt) << text;
}

TEST(Firmware, hasTheSizeOfItsMemory) {
    EXPECT_EQ(firmwareIn(SmbiosFields(kFirmware, 0x12).byte(9, 0)).romKB, 64U);
    EXPECT_EQ(firmwareIn(SmbiosFields(kFirmware, 0x12).byte(9, 0xFE)).romKB, 16320U);
    const auto extended = [](std::uint16_t field) {
        return firmwareIn(SmbiosFields(kFirmware, 0x1A).byte(9, 0xFF).word(0x18, field)).romKB;
    };
    EXPECT_EQ(extended(0x0020), 32U * 1024);
    EXPECT_EQ(extended(0x4001), 1024U * 1024);
    EXPECT_EQ(extended(0x0000), std::nullopt);
    EXPECT_EQ(extended(0x8001), std::nullopt);
    // 8191 GB fit 32 bits in no unit below; 2047 GB do.
    EXPECT_EQ(extended(0x5FFF), std::nullopt);
    EXPECT_EQ(extended(0x47FF), 2047U * 1024 * 1024);
    EXPECT_EQ(extended(0x4800), std::nullopt);
    // Tables without the longer field tell 256 steps of 64 KB at most.
    EXPECT_EQ(firmwareIn(SmbiosFields(kFirmware, 0x18).byte(9, 0xFF)).romKB, 16384U);
    EXPECT_EQ(firmwareIn(SmbiosFields(kFirmware, 0x12).byte(9, 0xFF)).romKB, 16384U);
}

TEST(Firmware, hasReleases) {
    const auto firmware = firmwareIn(
        SmbiosFields(kFirmware, 0x18).byte(0x14, 1).byte(0x15, 30).byte(0x16, 0xFF).byte(0x17, 2));
    EXPECT_EQ(firmware.release, "1.30");
    EXPECT_EQ(firmware.controllerRelease, std::nullopt);
}

// Version 2.0 ends with the characteristics.
TEST(Firmware, ofOldTablesHasLess) {
    const auto firmware = firmwareIn(
        SmbiosFields(kFirmware, 0x12).text(4, "Maker").text(5, "A05").text(8, "04/30/97"));
    EXPECT_EQ(firmware.vendor, "Maker");
    EXPECT_EQ(firmware.version, "A05");
    EXPECT_EQ(firmware.releaseDate, (CalendarDate{1997, 4, 30}));
    EXPECT_EQ(firmware.release.reason(), Absence::Absent);
    EXPECT_EQ(firmwareIn(SmbiosFields(kFirmware, 4)).romKB, std::nullopt);
}

TEST(BiosElementProvider, takesWhatTheKernelHandsOn) {
    RecordedTree tree;
    tree.file("sys/class/dmi/id/bios_vendor", "Maker\n")
        .file("sys/class/dmi/id/bios_version", "F14\n")
        .file("sys/class/dmi/id/bios_date", "01/05/2020\n")
        .file("sys/class/dmi/id/bios_release", "5.14\n");
    const BiosElementProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(textOf(instances[0], "Caption"), "BIOS F14");
    EXPECT_EQ(textOf(instances[0], "ReleaseDate"), "20200105000000.000000+000");
    EXPECT_EQ(textOf(instances[0], "Release"), "5.14");
    EXPECT_EQ(textOf(instances[0], "FirmwareType"), "BIOS");
    tree.directory("sys/firmware/efi");
    EXPECT_EQ(textOf(all(provider.enumerate()).at(0), "FirmwareType"), "UEFI");
}

TEST(BiosElementProvider, hasAKeyWhereNoVersionIsTold) {
    Firmware released;
    released.release = "1.30";
    EXPECT_EQ(textOf(BiosElementProvider::publish(released, false).instance, "Version"), "1.30");
    const auto instance = BiosElementProvider::publish({}, false).instance;
    EXPECT_EQ(textOf(instance, "Version"), "Unknown");
    EXPECT_EQ(textOf(instance, "Caption"), "BIOS");
    EXPECT_EQ(textOf(instance, "ReleaseDate"), "null");
}

TEST(BiosElementProvider, callsTheFirstThePrimaryOne) {
    Firmware second;
    second.index = 1;
    EXPECT_EQ(textOf(BiosElementProvider::publish({}, true).instance, "PrimaryBIOS"), "TRUE");
    EXPECT_EQ(textOf(BiosElementProvider::publish(second, true).instance, "PrimaryBIOS"), "FALSE");
}

}  // namespace
}  // namespace cimomd
