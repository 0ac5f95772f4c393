// The schema for Oracle: varchar2, and a unique index that covers one column more than the key.

#include "SennetConverter/sql/OracleCim2SqlConverter.h"

#include "QveFixture.h"

namespace {

using namespace qvetest;

class OracleCim2SqlConverterTest : public QveFixture {
  protected:
    std::string schema(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<OracleCim2SqlConverter>(scriptText, answers, kLimit);
    }
};

TEST_F(OracleCim2SqlConverterTest, WritesTheWholeScriptToTheByte) {
    const CIMClass disk =
        cimClass("CIM_X", {property("Capacity", null(CIMTYPE_STRING), {maxLen(32)}),
                           property("Name", null(CIMTYPE_STRING), {maxLen(64)})});
    EXPECT_EQ(
        schema("[DEFAULT]\ntitle=Disk\n[CIM]\nG[0]=CIM_X\nA[0]=Capacity,Name\n", {described(disk)}),
        "drop table KWX_Disk cascade constraints ;\r\n"
        "\r\n"
        "create table KWX_Disk (\r\n"
        "   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,\r\n"
        "   Row_Index varchar2(5) NOT NULL,\r\n"
        "   Capacity varchar2(32) NULL,\r\n"
        "   Name varchar2(64) NULL );\r\n"
        "\r\n"
        "create unique index KWX_IDisk on KWX_Disk\r\n"
        "(\r\n"
        "   HARDWARE_SYSTEM_ID,\r\n"
        "   CONFIG_CHANGE_TYPE,\r\n"
        "   CONFIG_CHANGE_TIME,\r\n"
        "   Row_Index\r\n"
        ");\r\n"
        "\r\n"
        "alter table KWX_Disk add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, "
        "Row_Index ));\r\n"
        "\r\n"
        "drop view KWX_VDisk;\r\n"
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
        "   KWX_Disk.HARDWARE_SYSTEM_ID;\r\n"
        "\r\n"
        "insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VDisk');\r\n");
}

TEST_F(OracleCim2SqlConverterTest, EndsInACommaWhenTheLastClassHasNoColumns) {
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=P\nG[1]=CIM_Y\n",
                     {plain(), described(cimClass("CIM_Y", {}))}),
              oracleSchema("T", "\n   P varchar2(8) NULL,"));
}

TEST_F(OracleCim2SqlConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<OracleCim2SqlConverter>(kLimit),
              "drop table KWX_T cascade constraints ;\r\n"
              "\r\n"
              "create table KWX_T (\r\n"
              "   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,\r\n"
              "   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,\r\n"
              "   Row_Index varchar2(5) NOT NULL,\r\n"
              "   A varchar2(255) NULL,\r\n"
              "   B varchar2(255) NULL,");
}

TEST_F(OracleCim2SqlConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<OracleCim2SqlConverter>();
}

}  // namespace
