#include "system/storage/DriveIdentity.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

using namespace std::string_view_literals;

class DriveIdentityTest : public testing::Test {
  protected:
    DriveIdentity read(std::string_view udev = "") const {
        return readDriveIdentity(tree.root / "sda", UdevRecord(udev));
    }

    RecordedTree tree;
};

TEST_F(DriveIdentityTest, takesWhatTheDriverTells) {
    tree.file("sda/device/vendor", "SEAGATE \n")
        .file("sda/device/model", "ST4000NM0025    \n")
        .file("sda/device/rev", "N004\n")
        .file("sda/device/wwid", "naa.5000c50085a1b2c3\n")
        .file("sda/device/vpd_pg80", "\0\x80\0\x08ZC1A2B3Cjunk"sv);
    const DriveIdentity identity = read("E:ID_MODEL=other\nE:ID_SERIAL_SHORT=other\n");
    EXPECT_EQ(identity.vendor, std::string("SEAGATE"));
    EXPECT_EQ(identity.model, std::string("ST4000NM0025"));
    EXPECT_EQ(identity.serial, std::string("ZC1A2B3C"));
    EXPECT_EQ(identity.firmware, std::string("N004"));
    EXPECT_EQ(identity.worldWideId, std::string("naa.5000c50085a1b2c3"));
}

TEST_F(DriveIdentityTest, AtaIsNoMakerAndItsModelIsCutOff) {
    tree.file("sda/device/vendor", "ATA     \n").file("sda/device/model", "Samsung SSD 860 \n");
    const DriveIdentity cut = read();
    EXPECT_FALSE(cut.vendor);
    EXPECT_EQ(cut.vendor.reason(), Absence::Filtered);
    EXPECT_EQ(cut.model, std::string("Samsung SSD 860"));
    const DriveIdentity whole = read("E:ID_MODEL=Samsung_SSD_860_EVO_500GB\n");
    EXPECT_EQ(whole.model, std::string("Samsung SSD 860 EVO 500GB"));
}

TEST_F(DriveIdentityTest, fallsBackOnUdev) {
    const DriveIdentity identity = read(
        "E:ID_VENDOR=SanDisk\nE:ID_MODEL=Ultra_Fit\nE:ID_SERIAL_SHORT=4C530001\n"
        "E:ID_REVISION=1.00\nE:ID_WWN=0x5001b448b9c1\n");
    EXPECT_EQ(identity.vendor, std::string("SanDisk"));
    EXPECT_EQ(identity.model, std::string("Ultra Fit"));
    EXPECT_EQ(identity.serial, std::string("4C530001"));
    EXPECT_EQ(identity.firmware, std::string("1.00"));
    EXPECT_EQ(identity.worldWideId, std::string("0x5001b448b9c1"));
}

TEST_F(DriveIdentityTest, placeholdersAreNoIdentity) {
    tree.file("sda/device/vendor", "0x1af4\n")
        .file("sda/device/serial", "0000000000\n")
        .file("sda/device/model", "To be filled by O.E.M.\n");
    const DriveIdentity identity = read();
    EXPECT_EQ(identity.vendor, std::nullopt);
    EXPECT_EQ(identity.serial, std::nullopt);
    EXPECT_EQ(identity.serial.reason(), Absence::Filtered);
    EXPECT_EQ(identity.model, std::nullopt);
    EXPECT_EQ(identity.firmware.reason(), Absence::Absent);
}

TEST(SerialPage, mustBeWhole) {
    EXPECT_EQ(parseSerialPage("\0\x80\0\x04 12 "sv), "12");
    EXPECT_EQ(parseSerialPage("\0\x80\xFF\xFF"
                              "12"sv),
              "12");
    EXPECT_EQ(parseSerialPage("\0\x80\0\x01"
                              "12"sv),
              "1");
    EXPECT_EQ(parseSerialPage("\0\x83\0\x02"
                              "12"sv),
              std::nullopt);
    EXPECT_EQ(parseSerialPage("\0\x80\0\x02  "sv), std::nullopt);
    EXPECT_EQ(parseSerialPage("\0\x80\0\0"sv), std::nullopt);
    EXPECT_EQ(parseSerialPage("\0\x80\0"sv), std::nullopt);
    EXPECT_EQ(parseSerialPage(""), std::nullopt);
}

TEST_F(DriveIdentityTest, aBrokenSerialPageIsUnreadable) {
    tree.file("sda/device/vpd_pg80", "nonsense");
    EXPECT_EQ(read().serial.reason(), Absence::Unreadable);
    EXPECT_EQ(read("E:ID_SERIAL_SHORT=S1\n").serial, std::string("S1"));
}

}  // namespace
}  // namespace cimomd
