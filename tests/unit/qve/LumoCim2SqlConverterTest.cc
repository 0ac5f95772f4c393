// The schema for Lumo databases: names of 18 characters at most, words abbreviated.

#include "SennetConverter/sql/LumoCim2SqlConverter.h"

#include "QveFixture.h"

namespace {

using namespace qvetest;

class LumoCim2SqlConverterTest : public QveFixture {
  protected:
    std::string schema(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<LumoCim2SqlConverter>(scriptText, answers, kLumoLimit);
    }
};

TEST_F(LumoCim2SqlConverterTest, WritesTheWholeScriptToTheByte) {
    const CIMClass disk =
        cimClass("CIM_X", {property("Capacity", null(CIMTYPE_STRING), {maxLen(32)}),
                           property("Name", null(CIMTYPE_STRING), {maxLen(64)})});
    EXPECT_EQ(
        schema("[DEFAULT]\ntitle=Disk\n[CIM]\nG[0]=CIM_X\nA[0]=Capacity,Name\n", {described(disk)}),
        "drop table KWX_Disk;\r\n"
        "\r\n"
        "create table KWX_Disk (\r\n"
        "   HWARE_SYS_ID varchar(64) NOT NULL,\r\n"
        "   CFG_CHG_TYPE varchar(12) NOT NULL,\r\n"
        "   CFG_CHG_TIME varchar(32) NOT NULL,\r\n"
        "   Row_Index varchar(5) NOT NULL,\r\n"
        "   Capacity varchar(32),\r\n"
        "   Name varchar(64) );\r\n"
        "\r\n"
        "alter table KWX_Disk add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );\r\n"
        "\r\n"
        "drop view KWX_VDisk;\r\n"
        "\r\n"
        "create view KWX_VDisk\r\n"
        "as\r\n"
        "select\r\n"
        "   COMPUTER_SYS.QVE_OBJECT_ID,\r\n"
        "   COMPUTER_SYS.QVE_OBJECT_LABEL,\r\n"
        "   KWX_Disk.*\r\n"
        "from\r\n"
        "   COMPUTER_SYS, KWX_Disk\r\n"
        "where\r\n"
        "   COMPUTER_SYS.HWARE_SYS_ID =\r\n"
        "   KWX_Disk.HWARE_SYS_ID;\r\n"
        "\r\n"
        "insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VDisk');\r\n");
}

TEST_F(LumoCim2SqlConverterTest, AbbreviatesTheTitle) {
    EXPECT_EQ(schema(titled("Disk Drives"), {plain()}),
              lumoSchema("Disk_DRV", "\n   P varchar(8)"));
}

TEST_F(LumoCim2SqlConverterTest, ShortensTheTitleBeforeAbbreviatingIt) {
    // 13 characters stay whole; of 14, 10 and a hash remain.
    EXPECT_EQ(schema(titled("Abcdefghijklm"), {plain()}),
              lumoSchema("Abcdefghijklm", "\n   P varchar(8)"));
    EXPECT_EQ(schema(titled("Abcdefghijklmn"), {plain()}),
              lumoSchema("Abcdefghij7id", "\n   P varchar(8)"));
    EXPECT_EQ(schema(titled("Installed Software"), {plain()}),
              lumoSchema("INST_12o", "\n   P varchar(8)"));
}

TEST_F(LumoCim2SqlConverterTest, DropsTheOuterUnderscoresOfATitle) {
    EXPECT_EQ(schema(titled(" Disk "), {plain()}), lumoSchema("Disk", "\n   P varchar(8)"));
}

TEST_F(LumoCim2SqlConverterTest, AbbreviatesColumnNames) {
    properties.set("CIM_X.B", "Speed (MHz)");
    properties.set("CIM_X.C", "Operating system");
    EXPECT_EQ(schema(scriptOf("Logical_Drive_Number,B,C,VolumeLabel,Size"),
                     {texts({"Logical_Drive_Number", "B", "C", "VolumeLabel", "Size"})}),
              // The first name is cut to Logical_Drive_Numb before its words are looked up.
              lumoSchema("T",
                         "\n   Logical_DRV_Numb varchar(255),"
                         "\n   Speed_MHz varchar(255),"
                         "\n   Operating_SYS varchar(255),"
                         "\n   VOLLABEL varchar(255),"
                         "\n   siz varchar(255)"));
}

TEST_F(LumoCim2SqlConverterTest, NumbersNamesThatAreEqualOnceCut) {
    EXPECT_EQ(schema(scriptOf("Abcdefghijklmnopqrst,Other,Abcdefghijklmnopqrxy"),
                     {texts({"Abcdefghijklmnopqrst", "Other", "Abcdefghijklmnopqrxy"})}),
              lumoSchema("T",
                         "\n   Abcdefghijklmnopqr varchar(255),"
                         "\n   Other varchar(255),"
                         "\n   Abcdefghijklmnopqr4 varchar(255)"));
}

TEST_F(LumoCim2SqlConverterTest, DoesNotSeeNamesThatOnlyTheAbbreviationMakesEqual) {
    EXPECT_EQ(schema(scriptOf("Drive_A,Driver_A"), {texts({"Drive_A", "Driver_A"})}),
              lumoSchema("T", "\n   DRV_A varchar(255),\n   DRV_A varchar(255)"));
}

TEST_F(LumoCim2SqlConverterTest, LosesTheNumberOfAnAbbreviatedWord) {
    // The number becomes part of the word that the abbreviation stands for.
    properties.set("CIM_X.B", "Drive");
    EXPECT_EQ(schema(scriptOf("Drive,B"), {texts({"Drive", "B"})}),
              lumoSchema("T", "\n   DRV varchar(255),\n   DRV varchar(255)"));
}

TEST_F(LumoCim2SqlConverterTest, EndsInACommaWhenTheLastClassHasNoColumns) {
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=P\nG[1]=CIM_Y\n",
                     {plain(), described(cimClass("CIM_Y", {}))}),
              lumoSchema("T", "\n   P varchar(8),"));
}

TEST_F(LumoCim2SqlConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<LumoCim2SqlConverter>(kLumoLimit),
              "drop table KWX_T;\r\n"
              "\r\n"
              "create table KWX_T (\r\n"
              "   HWARE_SYS_ID varchar(64) NOT NULL,\r\n"
              "   CFG_CHG_TYPE varchar(12) NOT NULL,\r\n"
              "   CFG_CHG_TIME varchar(32) NOT NULL,\r\n"
              "   Row_Index varchar(5) NOT NULL,\r\n"
              "   A varchar(255),\r\n"
              "   B varchar(255),");
}

TEST_F(LumoCim2SqlConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<LumoCim2SqlConverter>();
}

TEST_F(LumoCim2SqlConverterTest, ShortensAndAbbreviatesByItsOwnLimit) {
    LumoCim2SqlConverter converter(outputName(), properties, kLumoLimit);
    EXPECT_EQ(utf8(converter.hashString("InstalledSoftwareProduct")), "InstalledSbij");
    EXPECT_EQ(utf8(converter.substituteValues("Memory_Size")), "MEM_Size");
}

}  // namespace
