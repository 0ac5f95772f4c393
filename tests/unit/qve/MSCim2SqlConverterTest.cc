// The schema for Microsoft SQL Server, which is the one for Sybase octet for octet.

#include "SennetConverter/sql/MSCim2SqlConverter.h"

#include "QveFixture.h"
#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

namespace {

using namespace qvetest;

class MSCim2SqlConverterTest : public QveFixture {};

TEST_F(MSCim2SqlConverterTest, WritesTheWholeScriptToTheByte) {
    const CIMClass disk = cimClass("CIM_X", {property("Removable", null(CIMTYPE_BOOLEAN)),
                                             property("InstallDate", null(CIMTYPE_DATETIME))});
    EXPECT_EQ(convert<MSCim2SqlConverter>(
                  "[DEFAULT]\ntitle=Disk Drives\n[CIM]\nG[0]=CIM_X\nA[0]=Removable,InstallDate\n",
                  {described(disk)}, kLimit),
              "drop table KWX_Disk_Drives\r\n"
              "go\r\n"
              "\r\n"
              "create table KWX_Disk_Drives (\r\n"
              "   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TIME varchar(32) NOT NULL,\r\n"
              "   Row_Index varchar(5) NOT NULL,\r\n"
              "   Removable varchar(32) NULL,\r\n"
              "   InstallDate varchar(25) NULL )\r\n"
              "go\r\n"
              "\r\n"
              "alter table KWX_Disk_Drives add primary key ( HARDWARE_SYSTEM_ID, "
              "CONFIG_CHANGE_TYPE, Row_Index )\r\n"
              "go\r\n"
              "\r\n"
              "drop view KWX_VDisk_Drives\r\n"
              "go\r\n"
              "\r\n"
              "create view KWX_VDisk_Drives\r\n"
              "as\r\n"
              "select\r\n"
              "   COMPUTER_SYSTEM.QVE_OBJECT_ID,\r\n"
              "   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,\r\n"
              "   KWX_Disk_Drives.*\r\n"
              "from\r\n"
              "   COMPUTER_SYSTEM, KWX_Disk_Drives\r\n"
              "where\r\n"
              "   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =\r\n"
              "   KWX_Disk_Drives.HARDWARE_SYSTEM_ID\r\n"
              "go\r\n"
              "\r\n"
              "insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VDisk_Drives')\r\n"
              "go\r\n");
}

TEST_F(MSCim2SqlConverterTest, WritesWhatSybaseTakes) {
    properties.set("CIM_X.B", "Name");
    const std::string text =
        "[DEFAULT]\ntitle=Installed Software\n[CIM]\nG[0]=CIM_X\nA[0]=Name,B,Size\nG[1]=CIM_Y\n";
    const std::vector<Answer> answers = {texts({"Name", "B", "Size"}),
                                         described(cimClass("CIM_Y", {}))};
    const std::string expected = transactSchema("Installed_Software",
                                                "\n   Name varchar(255) NULL,"
                                                "\n   Name3 varchar(255) NULL,"
                                                "\n   siz_ varchar(255) NULL,");
    EXPECT_EQ(convert<MSCim2SqlConverter>(text, answers, kLimit), expected);
    EXPECT_EQ(convert<SybaseCim2SqlConverter>(text, answers, kLimit), expected);
}

TEST_F(MSCim2SqlConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<MSCim2SqlConverter>(kLimit),
              convertUpToBadList<SybaseCim2SqlConverter>(kLimit));
}

TEST_F(MSCim2SqlConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<MSCim2SqlConverter>();
}

}  // namespace
