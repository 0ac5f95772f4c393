#include "script/ScriptLint.h"

#include <gtest/gtest.h>

#include "script/ScriptReader.h"

namespace sennetctl {
namespace {

class ScriptLintTest : public testing::Test {
  protected:
    std::string check(const std::string& cim, const std::string& file = "x.script.inv") {
        findings.clear();
        model = ScriptReader(file, findings).read("[DEFAULT]\ntitle=Fan List\n[CIM]\n" + cim);
        EXPECT_TRUE(findings.empty());
        checkScript(model, findings);
        return told();
    }
    std::string told() const {
        std::string text;
        for (const Finding& finding : findings) {
            text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                    nameOf(finding.severity) + ": " + finding.message + "\n";
        }
        return text;
    }

    std::vector<Finding> findings;
    ScriptModel model;
};

TEST_F(ScriptLintTest, AGoodScriptHasNoFindings) {
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID, Speed,Name\n"), "");
    ASSERT_EQ(model.slots[0].properties.size(), 3U);
    EXPECT_EQ(model.slots[0].properties[1].value, "Speed");
    EXPECT_EQ(model.slots[0].properties[1].column, 16U);
}

TEST_F(ScriptLintTest, SlotsWithoutAClass) {
    EXPECT_EQ(check("G[0]=A\nA[0]=B\nN[1]=root/cimv2\nA[1]=B\n"),
              "6:6: warning: line without effect: slot 1 has no class, which G[1]= would name\n"
              "7:6: warning: line without effect: slot 1 has no class, which G[1]= would name\n");
}

TEST_F(ScriptLintTest, AScriptWithoutClasses) {
    EXPECT_EQ(check(""), "0:0: warning: the script names no class: nothing is written\n");
}

TEST_F(ScriptLintTest, AClassWithoutProperties) {
    EXPECT_EQ(check("G[4]=A\n"),
              "4:6: warning: slot 4 has no property list: its rows get an empty cell that no "
              "column is for\n");
}

TEST_F(ScriptLintTest, AListWithoutProperties) {
    const std::string told =
        "5:6: warning: slot 0 has an empty property list: its rows get an empty cell that no "
        "column is for\n";
    for (const char* list : {",", ",,", " ,", ", "}) {
        // That the last two have a blank is told where they are read.
        findings.clear();
        model = ScriptReader("x.script.inv", findings)
                    .read(std::string("[DEFAULT]\ntitle=F\n[CIM]\nG[0]=A\nA[0]=") + list + "\n");
        findings.clear();
        checkScript(model, findings);
        EXPECT_EQ(this->told(), told) << "'" << list << "'";
    }
    model =
        ScriptReader("x.script.inv", findings).read("[DEFAULT]\ntitle=F\n[CIM]\nG[0]=A\nA[0]= \n");
    findings.clear();
    checkScript(model, findings);
    EXPECT_EQ(this->told(), told);
}

TEST_F(ScriptLintTest, ADefaultNamespaceThatIsNoneIsToldOnce) {
    const auto check = [this](const std::string& nameSpace, const std::string& cim) {
        findings.clear();
        model = ScriptReader("x.script.inv", findings)
                    .read("[DEFAULT]\ntitle=F\ndefaultnamespace=" + nameSpace + "\n[CIM]\n" + cim);
        checkScript(model, findings);
        return told();
    };
    const std::string used = "G[0]=A\nA[0]=B\nG[1]=C\nA[1]=D\n";
    EXPECT_EQ(
        check("root//x", used),
        "3:18: error: 'root//x' is no name of a namespace: sennet gives the whole script up\n");
    EXPECT_EQ(check(" ", used),
              "3:18: error: ' ' is no name of a namespace: sennet gives the whole script up\n");
    EXPECT_EQ(check("root//x", "G[0]=A\nN[0]=root\nA[0]=B\n"), "") << "nothing needs it";
}

TEST_F(ScriptLintTest, NamesThatAreNone) {
    EXPECT_EQ(check("G[0]=A-B\nA[0]=C\n"),
              "4:6: error: 'A-B' is no name of a class: sennet gives the whole script up\n");
    EXPECT_TRUE(model.givenUp);
    EXPECT_EQ(check("G[0]=A\nN[0]=root//x\nA[0]=C\n"),
              "5:6: error: 'root//x' is no name of a namespace: sennet gives the whole script "
              "up\n");
    EXPECT_EQ(check("G[0]=A\nA[0]=B,1C\n"),
              "5:8: error: '1C' is no name of a property: sennet breaks the MIF file off in its "
              "middle, for CA and QVE the file of "
              "all scripts\n");
    EXPECT_EQ(check("G[0]=A\nA[0]=B,C,\n"),
              "5:8: error: 'C,' is no name of a property, for a comma or blank at the end of the "
              "line belongs to it: sennet breaks the MIF file off in its middle, for CA and QVE "
              "the file of "
              "all scripts\n");
}

TEST_F(ScriptLintTest, NamesWithWhatIsNotMeant) {
    const std::string end = ": sennet gives the whole script up\n";
    EXPECT_EQ(
        check("G[0]=A \nA[0]=C\n"),
        "4:6: error: 'A ' is no name of a class, for blanks beside it belong to it; write A" + end);
    EXPECT_EQ(check("G[0]=A # the fans\nA[0]=C\n"),
              "4:6: error: 'A # the fans' is no name of a class, for a comment has a line of its "
              "own; write A" +
                  end);
    EXPECT_EQ(check("G[0]=\"A\"\nA[0]=C\n"),
              "4:6: error: '\"A\"' is no name of a class, for quotes belong to it; write A" + end);
    EXPECT_EQ(check("A[0]=C\nG[0]=A\r"),
              "5:6: error: 'A\r' is no name of a class, for the carriage return at the end of the "
              "file belongs to it; write A" +
                  end);
    EXPECT_EQ(check("G[0]=A\nN[0]= root/cimv2\nA[0]=C\n"),
              "5:6: error: ' root/cimv2' is no name of a namespace, for blanks beside it belong to "
              "it; write root/cimv2" +
                  end);
    EXPECT_EQ(check("G[0]=# A\nA[0]=C\n"), "4:6: error: '# A' is no name of a class" + end);
}

TEST_F(ScriptLintTest, PropertiesWithWhatIsNotMeant) {
    const std::string end =
        ": sennet breaks the MIF file off in its middle, for CA and QVE the file of all scripts\n";
    EXPECT_EQ(check("G[0]=A\nA[0]=\"B,C\"\n"),
              "5:6: error: '\"B' is no name of a property, for quotes belong to it; write B" + end +
                  "5:9: error: 'C\"' is no name of a property, for quotes belong to it; write C" +
                  end);
    EXPECT_EQ(
        check("G[0]=A\nA[0]=B # all of them\n"),
        "5:8: error: '#' is no name of a property, for a comment has a line of its own" + end);
    EXPECT_EQ(check("G[0]=A\nA[0]=B,C\r"),
              "5:8: error: 'C\r' is no name of a property, for the carriage return at the end of "
              "the file belongs to it; write C" +
                  end);
    EXPECT_FALSE(model.givenUp) << "what is right in it can still be checked";
}

TEST_F(ScriptLintTest, WhatIsListedTwice) {
    EXPECT_EQ(check("G[0]=A\nA[0]=B,b\n"),
              "5:8: warning: the property b is listed twice, and so gets two columns\n");
    EXPECT_EQ(check("G[0]=A\nA[0]=B,C,b,c,B\n"),
              "5:10: warning: the property b is listed 3 times, and so gets 3 columns\n"
              "5:12: warning: the property c is listed twice, and so gets two columns\n");
    EXPECT_EQ(check("G[0]=A\nA[0]=B\nG[2]=a\nA[2]=C\n"),
              "6:6: warning: slot 0 has this class, too: its property list is taken for both\n");
}

TEST_F(ScriptLintTest, AFileThatIsNotRead) {
    EXPECT_EQ(check("G[0]=A\nA[0]=B\n", "x.inv"),
              "0:0: warning: the file's name does not end in .script.inv: sennet does not read "
              "it\n");
    EXPECT_EQ(check("G[0]=A\nA[0]=B\n", "X.Script.INV"), "");
    const std::string nameless =
        "0:0: warning: the file's name has nothing before .script.inv: for SMS and LANDesk sennet "
        "writes no file\n";
    EXPECT_EQ(check("G[0]=A\nA[0]=B\n", ".script.inv"), nameless);
    EXPECT_EQ(check("G[0]=A\nA[0]=B\n", "/d/.SCRIPT.inv"), nameless);
}

TEST_F(ScriptLintTest, MissingTranslations) {
    check("G[0]=CIM_Fan\nA[0]=DeviceID,Speed\n");
    Velm::Properties texts;
    texts.set("CIM_Fan.Speed", "Speed");
    checkTranslations(model, texts, findings);
    EXPECT_EQ(told(),
              "2:7: warning: the resource properties have no title.Fan_List\n"
              "5:6: warning: the resource properties have no CIM_Fan.DeviceID\n");
}

}  // namespace
}  // namespace sennetctl
