// The schema for Sybase: batches end at a line "go", columns say that they may be null.

#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

#include "QveFixture.h"

namespace {

using namespace qvetest;

class SybaseCim2SqlConverterTest : public QveFixture {
  protected:
    std::string schema(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<SybaseCim2SqlConverter>(scriptText, answers, kLimit);
    }
};

TEST_F(SybaseCim2SqlConverterTest, WritesTheWholeScriptToTheByte) {
    const CIMClass disk = cimClass("CIM_X", {property("Capacity", null(CIMTYPE_UINT64)),
                                             property("Name", null(CIMTYPE_STRING), {maxLen(64)})});
    EXPECT_EQ(
        schema("[DEFAULT]\ntitle=Disk\n[CIM]\nG[0]=CIM_X\nA[0]=Capacity,Name\n", {described(disk)}),
        "drop table KWX_Disk\r\n"
        "go\r\n"
        "\r\n"
        "create table KWX_Disk (\r\n"
        "   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TIME varchar(32) NOT NULL,\r\n"
        "   Row_Index varchar(5) NOT NULL,\r\n"
        "   Capacity varchar(20) NULL,\r\n"
        "   Name varchar(64) NULL )\r\n"
        "go\r\n"
        "\r\n"
        "alter table KWX_Disk add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, "
        "Row_Index )\r\n"
        "go\r\n"
        "\r\n"
        "drop view KWX_VDisk\r\n"
        "go\r\n"
        "\r\n"
        "create view KWX_VDisk\r\n"
        "as\r\n"
        "select\r\n"
        "   COMPUTER_SYSTEM.QVE_OBJECT_ID,\r\n"
        "   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,\r\n"
        "   KWX_Disk.*\r\n"
        "from\r\n"
        "   COMPUTER_SYSTEM, KWX_Disk\r\n"
        "where\r\n"
        "   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =\r\n"
        "   KWX_Disk.HARDWARE_SYSTEM_ID\r\n"
        "go\r\n"
        "\r\n"
        "insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VDisk')\r\n"
        "go\r\n");
}

TEST_F(SybaseCim2SqlConverterTest, EndsInACommaWhenTheLastClassHasNoColumns) {
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=P\nG[1]=CIM_Y\n",
                     {plain(), described(cimClass("CIM_Y", {}))}),
              transactSchema("T", "\n   P varchar(8) NULL,"));
}

TEST_F(SybaseCim2SqlConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<SybaseCim2SqlConverter>(kLimit),
              "drop table KWX_T\r\n"
              "go\r\n"
              "\r\n"
              "create table KWX_T (\r\n"
              "   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TIME varchar(32) NOT NULL,\r\n"
              "   Row_Index varchar(5) NOT NULL,\r\n"
              "   A varchar(255) NULL,\r\n"
              "   B varchar(255) NULL,");
}

TEST_F(SybaseCim2SqlConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<SybaseCim2SqlConverter>();
}

}  // namespace
