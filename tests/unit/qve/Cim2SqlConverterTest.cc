// What the schema writers do alike: the table stem, the column names and the lengths. Shown on the
// Sybase dialect, which neither abbreviates nor adds an index.

#include "SennetConverter/sql/Cim2SqlConverter.h"

#include "QveFixture.h"
#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

namespace {

using namespace qvetest;

class Cim2SqlConverterTest : public QveFixture {
  protected:
    std::string schema(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<SybaseCim2SqlConverter>(scriptText, answers, kLimit);
    }

    /// The length of the one column of CIM_X.P, when the resource properties say `size`.
    void expectLength(const char* size, const std::string& length) {
        properties.set("CIM_X.P.Size", size);
        EXPECT_EQ(schema(titled("T"), {plain()}),
                  transactSchema("T", "\n   P varchar(" + length + ") NULL"))
            << size;
    }

    /// The length of the one column when the property is declared so.
    void expectLengthOf(const CIMProperty& declared, const std::string& length) {
        EXPECT_EQ(schema(titled("T"), {described(cimClass("CIM_X", {declared}))}),
                  transactSchema("T", "\n   P varchar(" + length + ") NULL"));
    }
};

TEST_F(Cim2SqlConverterTest, TakesTheStemFromTheFileNameWithoutATitle) {
    EXPECT_EQ(schema("[CIM]\nG[0]=CIM_X\nA[0]=P\n", {plain()}),
              transactSchema("cpu", "\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, KeepsTheOuterUnderscoresOfATitle) {
    EXPECT_EQ(schema(titled(" Disk  Drives "), {plain()}),
              transactSchema("_Disk__Drives_", "\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, ShortensTitlesOfMoreThan25Characters) {
    EXPECT_EQ(schema(titled("Abcdefghijklmnopqrstuvwxy"), {plain()}),
              transactSchema("Abcdefghijklmnopqrstuvwxy", "\n   P varchar(8) NULL"));
    EXPECT_EQ(schema(titled("Abcdefghijklmnopqrstuvwxyz"), {plain()}),
              transactSchema("Abcdefghijklmnopqrstuv2r", "\n   P varchar(8) NULL"));
    EXPECT_EQ(schema(titled("Operating System Information"), {plain()}),
              transactSchema("Operating_System_Inforuj1", "\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, TranslatesTheTitle) {
    properties.set("title.Disk_Drives", " \t Fixed disks\r\n");
    EXPECT_EQ(schema(titled("Disk Drives"), {plain()}),
              transactSchema("Fixed_disks", "\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, TranslatesAndCleansColumnNames) {
    properties.set("CIM_X.A", "  Free disk space\r\n");
    properties.set("CIM_X.B", "Speed (MHz)");
    properties.set("CIM_X.C", "LEVEL");
    properties.set("C", "not looked at");
    EXPECT_EQ(schema(scriptOf("A,B,C,Index,Sizes,Resource,Abcdefghijklmnopqrstuvwxyzabcdefgh"),
                     {texts({"A", "B", "C", "Index", "Sizes", "Resource",
                             "Abcdefghijklmnopqrstuvwxyzabcdefgh"})}),
              transactSchema("T",
                             "\n   Free_disk_space varchar(255) NULL,"
                             "\n   Speed__MHz_ varchar(255) NULL,"
                             "\n   level_ varchar(255) NULL,"
                             "\n   indx varchar(255) NULL,"
                             "\n   Sizes varchar(255) NULL,"
                             "\n   resourc_ varchar(255) NULL,"
                             "\n   Abcdefghijklmnopqrstuvwxyzabcd varchar(255) NULL"));
}

TEST_F(Cim2SqlConverterTest, NumbersARepeatedNameOneAhead) {
    properties.set("CIM_X.C", "Name");
    EXPECT_EQ(schema(scriptOf("Name,B,C"), {texts({"Name", "B", "C"})}),
              transactSchema("T",
                             "\n   Name varchar(255) NULL,"
                             "\n   B varchar(255) NULL,"
                             "\n   Name4 varchar(255) NULL"));
}

TEST_F(Cim2SqlConverterTest, NumbersANameThatTheScriptRepeats) {
    EXPECT_EQ(schema(scriptOf("P,P,P"), {plain()}), transactSchema("T",
                                                                   "\n   P varchar(8) NULL,"
                                                                   "\n   P3 varchar(8) NULL,"
                                                                   "\n   P4 varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, ComparesNamesWithCase) {
    properties.set("CIM_X.B", "name");
    EXPECT_EQ(schema(scriptOf("Name,B"), {texts({"Name", "B"})}),
              transactSchema("T", "\n   Name varchar(255) NULL,\n   name varchar(255) NULL"));
}

TEST_F(Cim2SqlConverterTest, DoesNotCompareALengthenedNameAgain) {
    properties.set("CIM_X.A", "Name4");
    properties.set("CIM_X.C", "Name");
    properties.set("CIM_X.D", "Name4");
    EXPECT_EQ(schema(scriptOf("Name,A,C,D"), {texts({"Name", "A", "C", "D"})}),
              transactSchema("T",
                             "\n   Name varchar(255) NULL,"
                             "\n   Name4 varchar(255) NULL,"
                             "\n   Name4 varchar(255) NULL,"
                             "\n   Name45 varchar(255) NULL"));
}

TEST_F(Cim2SqlConverterTest, RemembersALengthenedName) {
    properties.set("CIM_X.B", "Name");
    properties.set("CIM_X.C", "Name3");
    EXPECT_EQ(schema(scriptOf("Name,B,C"), {texts({"Name", "B", "C"})}),
              transactSchema("T",
                             "\n   Name varchar(255) NULL,"
                             "\n   Name3 varchar(255) NULL,"
                             "\n   Name34 varchar(255) NULL"));
}

TEST_F(Cim2SqlConverterTest, CountsAndComparesAcrossClasses) {
    const CIMClass second = cimClass("CIM_Y", {property("Name", null(CIMTYPE_STRING), {maxLen(9)}),
                                               property("Other", null(CIMTYPE_UINT8))});
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=Name\nG[1]=CIM_Y\n"
                     "A[1]=Name,Other\n",
                     {texts({"Name"}), described(second)}),
              transactSchema("T",
                             "\n   Name varchar(255) NULL,"
                             "\n   Name3 varchar(9) NULL,"
                             "\n   Other varchar(20) NULL"));
}

TEST_F(Cim2SqlConverterTest, WritesTheColumnsOfClassesWithoutInstances) {
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Y\nA[0]=Q\nG[1]=CIM_X\nA[1]=P\n",
                     {{cimClass("CIM_Y", {property("Q", null(CIMTYPE_UINT8))}), {}}, plain()}),
              transactSchema("T", "\n   Q varchar(20) NULL,\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, WritesNoColumnsOfAClassThatTheScriptDoesNotName) {
    EXPECT_EQ(schema(titled("T"), {described(cimClass("CIM_Other", {})), plain()}),
              transactSchema("T", "\n   P varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, WritesNoColumnsWhenThereAreNone) {
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\n", {plain()}),
              transactSchema("T", ""));
}

TEST_F(Cim2SqlConverterTest, FindsTheSlotIgnoringCaseAndTranslatesByTheServersSpelling) {
    properties.set("CIM_X.P", "Server");
    properties.set("cim_x.P", "Script");
    EXPECT_EQ(schema("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=cim_x\nA[0]=P\n", {plain()}),
              transactSchema("T", "\n   Server varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, LimitsLengthsTo255) {
    expectLength("254", "254");
    expectLength("255", "255");
    expectLength("256", "255");
    expectLength("99999999999999999999999", "255");
    expectLength("-1", "-1");
    expectLength("0", "0");
}

TEST_F(Cim2SqlConverterTest, WritesALengthThatIsNoNumberAsItStands) {
    expectLength("wide", "wide");
    expectLength("12 or so", "12 or so");
    expectLength("", "");
    // What begins like a number counts as that number.
    expectLength("300 or so", "255");
    expectLength("  0256", "255");
}

TEST_F(Cim2SqlConverterTest, TakesTheLengthOfTheUntranslatedName) {
    properties.set("CIM_X.P", "Label");
    properties.set("CIM_X.Label.Size", "77");
    EXPECT_EQ(schema(titled("T"), {plain()}), transactSchema("T", "\n   Label varchar(8) NULL"));
}

TEST_F(Cim2SqlConverterTest, TakesTheLengthFromTheDeclaration) {
    expectLengthOf(property("P", null(CIMTYPE_STRING), {maxLen(256)}), "255");
    expectLengthOf(property("P", null(CIMTYPE_STRING), {maxLen(255)}), "255");
    expectLengthOf(property("P", null(CIMTYPE_STRING), {maxLen(0)}), "0");
    expectLengthOf(property("P", null(CIMTYPE_STRING)), "255");
    expectLengthOf(property("P", null(CIMTYPE_SINT64)), "20");
    expectLengthOf(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"a"})}), "255");
    expectLengthOf(property("P", nullArray(CIMTYPE_UINT16)), "255");
    expectLengthOf(property("P", null(CIMTYPE_DATETIME)), "25");
    expectLengthOf(property("P", null(CIMTYPE_REAL64)), "32");
    expectLengthOf(property("Q", null(CIMTYPE_BOOLEAN)), "255");
}

}  // namespace
