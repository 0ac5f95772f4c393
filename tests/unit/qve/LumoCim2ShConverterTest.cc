// The query script for Lumo databases: it names the view and the columns of the Lumo schema.

#include "SennetConverter/shell/LumoCim2ShConverter.h"

#include "QveFixture.h"
#include "SennetConverter/shell/Cim2ShConverter.h"
#include "SennetConverter/sql/LumoCim2SqlConverter.h"

namespace {

using namespace qvetest;

class LumoCim2ShConverterTest : public QveFixture {
  protected:
    std::string query(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<LumoCim2ShConverter>(scriptText, answers, kLumoLimit);
    }
};

TEST_F(LumoCim2ShConverterTest, WritesTheWholeScriptToTheByte) {
    EXPECT_EQ(query("[DEFAULT]\ntitle=Installed Software\n[CIM]\nG[0]=CIM_X\n"
                    "A[0]=SoftwareVersion,Serial_Number\n",
                    {texts({"SoftwareVersion", "Serial_Number"})}),
              "echo \"Creating query 'Installed_Software' in $QUERY_LIB...\" \r\n"
              "echo \"Creating query 'Installed_Software' in $QUERY_LIB...\""
              " >> $DBDIR/tmp/kwvinstall.log \r\n"
              "qvmkquery -d \"Installed_Software\" -r inventory -v KWX_VINST_12o \\\r\n"
              "   -c QVE_OBJECT_LABEL \\\r\n"
              "   -c SW \\\r\n"
              "   -c SER_NUM \\\r\n"
              "\"$QUERY_LIB\" \"Installed Software\" 2>> $DBDIR/tmp/kwvinstall.log\r\n"
              "ERR=$?\r\n"
              "if [ $ERR -ne 0 ] ; then\r\n"
              "   echo \"'Installed Software' query already exists.\"\r\n"
              "fi\r\n");
}

TEST_F(LumoCim2ShConverterTest, NamesTheViewAndColumnsThatTheSchemaCreates) {
    properties.set("CIM_X.B", "Memory size");
    properties.set("CIM_X.C", "Memory size");
    const std::string text =
        "[DEFAULT]\ntitle= Logical Drives \n[CIM]\nG[0]=CIM_X\nA[0]=B,Other,C,Level\n";
    const std::vector<Answer> answers = {texts({"B", "Other", "C", "Level"})};
    // 16 characters: 10 of them and a hash remain, then the leading underscore goes.
    const std::string stem = "Logical_Dvht";
    EXPECT_EQ(query(text, answers),
              queryScript("_Logical_Drives_", stem, {"MEM_size", "Other", "MEM_size4", "level"},
                          " Logical Drives "));
    EXPECT_EQ(convert<LumoCim2SqlConverter>(text, answers, kLumoLimit),
              lumoSchema(stem,
                         "\n   MEM_size varchar(255),"
                         "\n   Other varchar(255),"
                         "\n   MEM_size4 varchar(255),"
                         "\n   level varchar(255)"));
}

TEST_F(LumoCim2ShConverterTest, DiffersFromThePlainScriptByLengthAndWords) {
    const std::string text = scriptOf("Name,Memory,Abcdefghijklmnopqrst");
    const std::vector<Answer> answers = {texts({"Name", "Memory", "Abcdefghijklmnopqrst"})};
    EXPECT_EQ(query(text, answers),
              queryScript("T", "T", {"Name", "MEM", "Abcdefghijklmnopqr"}, "T"));
    EXPECT_EQ(convert<Cim2ShConverter>(text, answers, kLimit),
              queryScript("T", "T", {"Name", "Memory", "Abcdefghijklmnopqrst"}, "T"));
}

TEST_F(LumoCim2ShConverterTest, KeepsWhatWasWrittenBeforeABadPropertyList) {
    EXPECT_EQ(convertUpToBadList<LumoCim2ShConverter>(kLumoLimit),
              "echo \"Creating query 'T' in $QUERY_LIB...\" \r\n"
              "echo \"Creating query 'T' in $QUERY_LIB...\" >> $DBDIR/tmp/kwvinstall.log \r\n"
              "qvmkquery -d \"T\" -r inventory -v KWX_VT \\\r\n"
              "   -c QVE_OBJECT_LABEL \\\r\n"
              "   -c A \\\r\n"
              "   -c B \\\r\n");
}

TEST_F(LumoCim2ShConverterTest, WritesNothingWithoutInstances) {
    expectNothingWritten<LumoCim2ShConverter>();
}

TEST_F(LumoCim2ShConverterTest, ShortensAndAbbreviatesByItsOwnLimit) {
    LumoCim2ShConverter converter(outputName(), properties, kLumoLimit);
    EXPECT_EQ(utf8(converter.hashString("InstalledSoftwareProduct")), "InstalledSbij");
    EXPECT_EQ(utf8(converter.substituteValues("Memory_Size")), "MEM_Size");
}

}  // namespace
