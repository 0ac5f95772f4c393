#include "script/ScriptReader.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace sennetctl {
namespace {

std::string told(const std::vector<Finding>& findings) {
    std::string text;
    for (const Finding& finding : findings) {
        text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                nameOf(finding.severity) + ": " + finding.message + "\n";
    }
    return text;
}

class ScriptReaderTest : public testing::Test {
  protected:
    std::string read(const std::string& text) {
        findings.clear();
        model = ScriptReader("x.script.inv", findings).read(text);
        return told(findings);
    }
    /// What is said to one line of a section that nothing else stands in.
    std::string inDefault(const std::string& line) { return read("[DEFAULT]\n" + line + "\n"); }
    std::string inCim(const std::string& line) { return read("[CIM]\n" + line + "\n"); }

    std::vector<Finding> findings;
    ScriptModel model;
};

TEST_F(ScriptReaderTest, AGoodScriptIsRead) {
    EXPECT_EQ(read("# a comment\r\n[DEFAULT]\r\ntitle=Fans of all kinds\r\n\r\n[CIM]\r\n"
                   "G[0]=CIM_Fan\r\nN[0]=root/cimv2\r\nA[0]=DeviceID, Speed"),
              "");
    EXPECT_EQ(model.title.value, "Fans of all kinds");
    EXPECT_EQ(model.title.line, 3U);
    EXPECT_EQ(model.title.column, 7U);
    EXPECT_EQ(model.slots[0].className.value, "CIM_Fan");
    EXPECT_EQ(model.slots[0].propertyList.value, "DeviceID, Speed");
    EXPECT_EQ(model.slots[0].propertyList.line, 8U);
    EXPECT_EQ(model.namespaceOf(model.slots[0]), "root/cimv2");
    EXPECT_FALSE(model.givenUp);
}

TEST_F(ScriptReaderTest, LinesBeforeTheFirstSection) {
    EXPECT_EQ(read("title=x\n"),
              "1:1: warning: line without effect: it stands before the first section\n");
}

TEST_F(ScriptReaderTest, HeadersThatAreNone) {
    const std::string meant =
        "2:1: warning: line without effect: the header has to be exactly [CIM], in capitals and "
        "without blanks\n";
    EXPECT_EQ(inDefault("[cim]"), meant);
    EXPECT_EQ(inDefault("[CIM] "), meant);
    EXPECT_EQ(inDefault(" [CIM]"), meant);
    EXPECT_EQ(inDefault("[OTHER]"),
              "2:1: warning: line without effect: there are the sections [DEFAULT] and [CIM] only, "
              "and the one before goes on\n");
}

TEST_F(ScriptReaderTest, WhatFollowsALostHeaderIsNotToldAgain) {
    EXPECT_EQ(inDefault("[cim]\nG[0]=X\nA[0]=Y\n[CIM]\ntitle=Z"),
              "2:1: warning: line without effect: the header has to be exactly [CIM], in capitals "
              "and without blanks\n"
              "6:1: warning: line without effect: title and defaultnamespace belong below "
              "[DEFAULT]\n");
    EXPECT_EQ(read("[default]\ntitle=x\n"),
              "1:1: warning: line without effect: the header has to be exactly [DEFAULT], in "
              "capitals and without blanks\n");
    EXPECT_EQ(read("\xEF\xBB\xBF[DEFAULT]\ntitle=x\n"),
              "1:1: error: byte-order mark, which hides this line from sennet: save the file "
              "without it\n");
    EXPECT_EQ(read("\xEF\xBB\xBF# Fans\ntitle=x\n"),
              "1:1: error: byte-order mark, which hides this line from sennet: save the file "
              "without it\n"
              "2:1: warning: line without effect: it stands before the first section\n");
}

TEST_F(ScriptReaderTest, LinesThatEndInCarriageReturnsAlone) {
    EXPECT_EQ(read("[CIM]\rG[0]=X\r"),
              "1:1: error: lines that end in carriage returns alone, so that sennet sees one line "
              "and no entry: end them with line feeds\n");
    EXPECT_TRUE(model.givenUp);
    EXPECT_EQ(read("[CIM]"), "");
    EXPECT_EQ(read(""), "");
    EXPECT_FALSE(model.givenUp);
}

TEST_F(ScriptReaderTest, EntriesOfTheFirstSection) {
    EXPECT_EQ(inDefault("title = X"),
              "2:1: warning: line without effect: blanks around '=' belong to key and value; write "
              "title=X\n");
    EXPECT_EQ(model.title.line, 0U);
    EXPECT_EQ(inDefault("titel=X"),
              "2:1: warning: line without effect: unknown key 'titel'; there are title and "
              "defaultnamespace\n");
    EXPECT_EQ(inDefault("title="), "2:1: warning: line without effect: it has no value\n");
    EXPECT_EQ(inDefault("nonsense"), "2:1: warning: line without effect: an entry is key=value\n");
    EXPECT_EQ(inDefault("G[0]=CIM_Fan"),
              "2:1: warning: line without effect: entries of classes belong below [CIM]\n");
    EXPECT_EQ(inDefault("title=A=B"),
              "2:1: warning: only 'A' is taken: a second '=' or a tab ends the value\n");
    EXPECT_EQ(inDefault("title= X"), "2:7: warning: the title ' X' begins or ends with a blank\n");
    EXPECT_EQ(inDefault("title=A\nTITLE=B"), "3:1: warning: replaces the title of line 2\n");
    EXPECT_EQ(model.title.value, "B");
}

TEST_F(ScriptReaderTest, EntriesOfTheSecondSection) {
    EXPECT_EQ(inCim("title=X"),
              "2:1: warning: line without effect: title and defaultnamespace belong below "
              "[DEFAULT]\n");
    EXPECT_EQ(inCim("G[1]"), "2:1: warning: line without effect: it has no value\n");
    EXPECT_EQ(inCim("G[1]="), "2:1: warning: line without effect: it has no value\n");
    EXPECT_EQ(inCim("G[-1]=X"),
              "2:1: warning: line without effect: the slot number is negative; slots are 0 to 9\n");
    EXPECT_EQ(inCim(" G[1]=X"),
              "2:1: warning: line without effect: blanks beside the letter; write G[1]=X\n");
    EXPECT_EQ(inCim("GG[1]=X"),
              "2:1: warning: line without effect: unknown letter 'GG'; an entry is G[n]=class, "
              "N[n]=namespace or A[n]=properties\n");
    EXPECT_EQ(inCim("nonsense"),
              "2:1: warning: line without effect: an entry is G[n]=class, N[n]=namespace or "
              "A[n]=properties\n");
    for (const ScriptSlot& slot : model.slots) {
        EXPECT_FALSE(slot.isUsed());
    }
}

TEST_F(ScriptReaderTest, EntriesThatHaveAnotherEffectThanMeant) {
    EXPECT_EQ(
        inCim("G[0] = X"),
        "2:1: error: blanks around '=' are taken for the value: sennet gives the whole script "
        "up; write G[0]=X\n");
    EXPECT_EQ(model.slots[0].className.value, " ");
    EXPECT_EQ(inCim("A[0] = X"),
              "2:1: error: blanks around '=' are taken for the value; write A[0]=X\n");
    EXPECT_EQ(
        inCim("N[0]= "),
        "2:1: error: blanks around '=' are taken for the value: sennet gives the whole script "
        "up\n");
    EXPECT_EQ(inCim("G[x]=X"), "2:3: warning: slot number 'x' is read as 0\n");
    EXPECT_EQ(model.slots[0].className.value, "X");
    EXPECT_EQ(inCim("A[3]=One=Two"),
              "2:1: warning: only 'One' is taken: a bracket, a second '=' or a tab ends the "
              "value\n");
    EXPECT_EQ(inCim("g[3]=X\nG[3]=Y"), "3:1: warning: replaces the class of slot 3 of line 2\n");
    EXPECT_EQ(model.slots[3].className.value, "Y");
}

TEST_F(ScriptReaderTest, FaultsOfWhatALaterLineReplaces) {
    EXPECT_EQ(inCim("G[0] = X\nG[0]=X"), "3:1: warning: replaces the class of slot 0 of line 2\n");
    EXPECT_EQ(model.slots[0].className.value, "X");
    EXPECT_EQ(inCim("A[0]=B=C\nA[0]=D\nA[0]=E"),
              "3:1: warning: replaces the properties of slot 0 of line 2\n"
              "4:1: warning: replaces the properties of slot 0 of line 3\n");
    EXPECT_EQ(
        inCim("N[0]=root\nN[0] = root"),
        "3:1: warning: replaces the namespace of slot 0 of line 2\n"
        "3:1: error: blanks around '=' are taken for the value: sennet gives the whole script "
        "up; write N[0]=root\n");
    EXPECT_EQ(inDefault("title= A=B\ntitle=C"), "3:1: warning: replaces the title of line 2\n");
    EXPECT_EQ(
        inCim("G[0] = X\nG[1]=X"),
        "2:1: error: blanks around '=' are taken for the value: sennet gives the whole script "
        "up; write G[0]=X\n")
        << "another slot";
}

TEST_F(ScriptReaderTest, SlotsEndAtNine) {
    EXPECT_EQ(inCim("G[9]=X"), "");
    EXPECT_FALSE(model.givenUp);
    EXPECT_EQ(inCim("G[10]=X"),
              "2:3: error: slot 10, while slots are 0 to 9: sennet gives the whole script up\n");
    EXPECT_TRUE(model.givenUp);
    EXPECT_EQ(inCim("G[99999999999999999999]=X").substr(0, 11), "2:3: error:");
}

TEST_F(ScriptReaderTest, LongLinesAreCut) {
    const std::string start = "A[0]=";
    EXPECT_EQ(inCim(start + std::string(1024 - start.size(), 'x')), "");
    EXPECT_EQ(inCim(start + std::string(1025 - start.size(), 'x')),
              "2:1025: warning: line of 1025 octets: only the first 1024 are read\n");
    EXPECT_EQ(model.slots[0].propertyList.value.size(), 1024 - start.size());
}

TEST_F(ScriptReaderTest, Encodings) {
    EXPECT_EQ(read("\xEF\xBB\xBF[DEFAULT]\n"),
              "1:1: error: byte-order mark, which hides this line from sennet: save the file "
              "without it\n");
    EXPECT_EQ(read(std::string("\xFF\xFE[\0", 4)),
              "1:1: error: UTF-16, of which sennet understands nothing: save it as UTF-8\n");
    EXPECT_EQ(inDefault("title=M\xFCller"),
              "2:8: error: octets that are not UTF-8: sennet gives the whole script up\n");
    EXPECT_TRUE(model.givenUp);
    EXPECT_EQ(inDefault("title=M\xC3\xBCller"), "");
    EXPECT_EQ(inDefault(std::string("title=A\0B", 9)),
              "2:8: warning: NUL, at which the line ends for sennet\n");
    EXPECT_EQ(model.title.value, "A");
}

}  // namespace
}  // namespace sennetctl
