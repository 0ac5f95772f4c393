// The query script: its three titles, its columns and its lines.

#include "SennetConverter/shell/Cim2ShConverter.h"

#include "QveFixture.h"
#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

namespace {

using namespace qvetest;

class Cim2ShConverterTest : public QveFixture {
  protected:
    std::string query(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<Cim2ShConverter>(scriptText, answers, kLimit);
    }
};

TEST_F(Cim2ShConverterTest, WritesTheWholeScriptToTheByte) {
    EXPECT_EQ(query("[DEFAULT]\ntitle=Disk Drives\n[CIM]\nG[0]=CIM_X\nA[0]=Capacity,Name\n",
                    {texts({"Capacity", "Name"})}),
              "echo \"Creating query 'Disk_Drives' in $QUERY_LIB...\" \r\n"
              "echo \"Creating query 'Disk_Drives' in $QUERY_LIB...\""
              " >> $DBDIR/tmp/kwvinstall.log \r\n"
              "qvmkquery -d \"Disk_Drives\" -r inventory -v KWX_VDisk_DRV \\\r\n"
              "   -c QVE_OBJECT_LABEL \\\r\n"
              "   -c Capacity \\\r\n"
              "   -c Name \\\r\n"
              "\"$QUERY_LIB\" \"Disk Drives\" 2>> $DBDIR/tmp/kwvinstall.log\r\n"
              "ERR=$?\r\n"
              "if [ $ERR -ne 0 ] ; then\r\n"
              "   echo \"'Disk Drives' query already exists.\"\r\n"
              "fi\r\n");
}

TEST_F(Cim2ShConverterTest, KeepsOuterBlanksOfATitleAsUnderscoresButNotInTheView) {
    EXPECT_EQ(query(titled(" Disk "), {plain()}), queryScript("_Disk_", "Disk", {"P"}, " Disk "));
}

TEST_F(Cim2ShConverterTest, TakesDescriptionAndViewFromATranslation) {
    properties.set("title.Disk_Drives", "Fixed disks");
    EXPECT_EQ(query(titled("Disk Drives"), {plain()}),
              queryScript("Fixed disks", "Fixed_disks", {"P"}, "Disk Drives"));
}

TEST_F(Cim2ShConverterTest, TrimsATranslationForTheViewOnly) {
    properties.set("title.Disk", " \t Fixed disks\t ");
    EXPECT_EQ(query(titled("Disk"), {plain()}),
              queryScript(" \t Fixed disks\t ", "Fixed_disks", {"P"}, "Disk"));
}

TEST_F(Cim2ShConverterTest, TrimsLineEndsOfATranslationForTheViewOnly) {
    // Built by hand: the helper would turn the bare line feeds of the translation into CR LF.
    properties.set("title.Disk", "\r\nFixed\r\n");
    EXPECT_EQ(query(titled("Disk"), {plain()}),
              "echo \"Creating query '\r\nFixed\r\n' in $QUERY_LIB...\" \r\n"
              "echo \"Creating query '\r\nFixed\r\n' in $QUERY_LIB...\""
              " >> $DBDIR/tmp/kwvinstall.log \r\n"
              "qvmkquery -d \"\r\nFixed\r\n\" -r inventory -v KWX_VFixed \\\r\n"
              "   -c QVE_OBJECT_LABEL \\\r\n"
              "   -c P \\\r\n"
              "\"$QUERY_LIB\" \"Disk\" 2>> $DBDIR/tmp/kwvinstall.log\r\n"
              "ERR=$?\r\n"
              "if [ $ERR -ne 0 ] ; then\r\n"
              "   echo \"'Disk' query already exists.\"\r\n"
              "fi\r\n");
}

TEST_F(Cim2ShConverterTest, NamesABareViewWhenATranslationIsBlank) {
    properties.set("title.Disk", "  ");
    EXPECT_EQ(query(titled("Disk"), {plain()}), queryScript("  ", "", {"P"}, "Disk"));
}

TEST_F(Cim2ShConverterTest, ShortensAndThenAbbreviatesTheViewOnly) {
    EXPECT_EQ(query(titled("Installed Software Packages"), {plain()}),
              queryScript("Installed_Software_Packages", "INST_SW_Pactnt", {"P"},
                          "Installed Software Packages"));
    EXPECT_EQ(query(titled("Installed Software"), {plain()}),
              queryScript("Installed_Software", "INST_SW", {"P"}, "Installed Software"));
}

TEST_F(Cim2ShConverterTest, TakesTheTitleFromTheFileName) {
    EXPECT_EQ(query("[CIM]\nG[0]=CIM_X\nA[0]=P\n", {plain()}),
              queryScript("cpu", "cpu", {"P"}, "cpu"));
}

TEST_F(Cim2ShConverterTest, NamesTheColumnsThatTheSchemaCreates) {
    properties.set("CIM_X.B", "Speed (MHz)");
    properties.set("CIM_X.C", "Name");
    const std::string text = scriptOf("Name,B,C,Size,Memory,Abcdefghijklmnopqrstuvwxyzabcdefgh");
    const std::vector<Answer> answers = {
        texts({"Name", "B", "C", "Size", "Memory", "Abcdefghijklmnopqrstuvwxyzabcdefgh"})};
    EXPECT_EQ(query(text, answers), queryScript("T", "T",
                                                {"Name", "Speed__MHz_", "Name4", "siz_", "Memory",
                                                 "Abcdefghijklmnopqrstuvwxyzabcd"},
                                                "T"));
    EXPECT_EQ(convert<SybaseCim2SqlConverter>(text, answers, kLimit),
              transactSchema("T",
                             "\n   Name varchar(255) NULL,"
                             "\n   Speed__MHz_ varchar(255) NULL,"
                             "\n   Name4 varchar(255) NULL,"
                             "\n   siz_ varchar(255) NULL,"
                             "\n   Memory varchar(255) NULL,"
                             "\n   Abcdefghijklmnopqrstuvwxyzabcd varchar(255) NULL"));
}

TEST_F(Cim2ShConverterTest, CountsAndComparesAcrossClassesWithoutASecondCheck) {
    properties.set("CIM_Y.B", "Name4");
    properties.set("CIM_Y.A", "Name");
    const CIMClass second = cimClass("CIM_Y", {});
    EXPECT_EQ(query("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=Name\nG[1]=CIM_Y\nA[1]=B,A,Name,"
                    "name\nG[2]=CIM_Z\n",
                    {texts({"Name"}), described(second), described(cimClass("CIM_Z", {}))}),
              queryScript("T", "T", {"Name", "Name4", "Name4", "Name5", "name"}, "T"));
}

TEST_F(Cim2ShConverterTest, ContinuesToTheTitleWithoutColumns) {
    EXPECT_EQ(query("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\n", {plain()}),
              queryScript("T", "T", {}, "T"));
}

TEST_F(Cim2ShConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<Cim2ShConverter>(kLimit),
              "echo \"Creating query 'T' in $QUERY_LIB...\" \r\n"
              "echo \"Creating query 'T' in $QUERY_LIB...\" >> $DBDIR/tmp/kwvinstall.log \r\n"
              "qvmkquery -d \"T\" -r inventory -v KWX_VT \\\r\n"
              "   -c QVE_OBJECT_LABEL \\\r\n"
              "   -c A \\\r\n"
              "   -c B \\\r\n");
}

TEST_F(Cim2ShConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<Cim2ShConverter>();
}

TEST_F(Cim2ShConverterTest, ShortensNamesButDoesNotAbbreviateThem) {
    Cim2ShConverter converter(outputName(), properties, kLimit);
    EXPECT_EQ(utf8(converter.hashString("Abcdefghijklmnopqrstuvwxyz")), "Abcdefghijklmnopqrstuv2r");
    EXPECT_EQ(utf8(converter.substituteValues("Memory")), "Memory");
}

}  // namespace
