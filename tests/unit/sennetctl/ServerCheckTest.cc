#include "script/ServerCheck.h"

#include <gtest/gtest.h>

#include "FanServer.h"
#include "report/WholeFile.h"
#include "script/ScriptLint.h"
#include "script/ScriptReader.h"

namespace sennetctl {
namespace {

using support::Reply;

class ServerCheckTest : public testing::Test {
  protected:
    /// What the server has to say to a script that is without fault by itself.
    std::string check(const std::string& cim, const std::string& title = "Fans") {
        std::vector<Finding> findings;
        ScriptModel model = ScriptReader("x.script.inv", findings)
                                .read("[DEFAULT]\ntitle=" + title + "\n[CIM]\n" + cim);
        checkScript(model, findings);
        EXPECT_TRUE(findings.empty()) << findings[0].message;
        LocalServer server;
        MissingValues missing(server);
        ServerCheck(server, missing, texts, {wantSizes, true}, findings).check(model);
        std::string text;
        for (const Finding& finding : findings) {
            if (finding.severity != Severity::Note || wantNotes) {
                text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                        nameOf(finding.severity) + ": " + finding.message + "\n";
            }
        }
        return text;
    }

    void addClass(const std::string& name, const std::string& instances) {
        fans.server.onGetClass(
            name, Reply::ok("<CLASS NAME=\"" + name +
                            "\"><PROPERTY NAME=\"DeviceID\" TYPE=\"string\"/></CLASS>"));
        fans.server.onEnumerateInstances(name, Reply::ok(instances));
    }

    /// The server says that the values of the property need root.
    void addMissing(const std::string& className, const std::string& property) {
        const std::string definition =
            R"(<CLASS NAME="Velmira_MissingValue"><PROPERTY NAME="Reason" TYPE="uint16">)"
            R"(<QUALIFIER NAME="ValueMap" TYPE="string"><VALUE.ARRAY><VALUE>3</VALUE></VALUE.ARRAY>)"
            R"(</QUALIFIER><QUALIFIER NAME="Values" TYPE="string"><VALUE.ARRAY>)"
            R"(<VALUE>Needs Root</VALUE></VALUE.ARRAY></QUALIFIER></PROPERTY></CLASS>)";
        fans.server.onGetClass("Velmira_MissingValue", Reply::ok(definition));
        fans.server.onEnumerateInstances(
            "Velmira_MissingValue",
            Reply::ok(instanceXml(
                "Velmira_MissingValue", "m",
                R"(<PROPERTY NAME="TargetClassName" TYPE="string"><VALUE>)" + className +
                    R"(</VALUE></PROPERTY>)"
                    R"(<PROPERTY NAME="PropertyName" TYPE="string"><VALUE>)" +
                    property +
                    R"(</VALUE></PROPERTY>)"
                    R"(<PROPERTY NAME="Reason" TYPE="uint16"><VALUE>3</VALUE></PROPERTY>)")));
    }

    FanServer fans;
    Velm::Properties texts;
    bool wantSizes = false;
    bool wantNotes = false;
};

TEST_F(ServerCheckTest, CountsInstancesAndSaysNothingElseToAGoodScript) {
    wantNotes = true;
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes\n"),
              "4:6: note: CIM_Fan: 2 instances\n");
}

TEST_F(ServerCheckTest, ClassesThatTheServerDoesNotKnow) {
    EXPECT_EQ(check("G[0]=CIM_X\nN[0]=root/cimv2\nA[0]=DeviceID\n"),
              "4:6: error: the server has no class CIM_X in root/cimv2, so sennet leaves it out: "
              "CIM_ERR_NOT_FOUND (6): CIM_ERR_NOT_FOUND: CIM_X\n");
    fans.server.onGetClass("CIM_X", Reply::cimError(3, "no such namespace"));
    EXPECT_EQ(check("G[0]=CIM_X\nA[0]=DeviceID\n"),
              "4:6: error: the server has no class CIM_X in root/velmira, so sennet leaves it out: "
              "CIM_ERR_INVALID_NAMESPACE (3): no such namespace (no line N[n]= names another "
              "namespace)\n");
}

TEST_F(ServerCheckTest, InstancesThatTheServerDoesNotGive) {
    fans.server.onEnumerateInstances("CIM_Fan", Reply::cimError(1, "out of order"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "4:6: error: the server does not give the instances of CIM_Fan, so sennet takes it "
              "for empty: CIM_ERR_FAILED (1): out of order\n");
}

TEST_F(ServerCheckTest, AServerThatBreaksDownEndsTheCheck) {
    fans.server.onGetClass("CIM_Fan", Reply::closeAtOnce());
    EXPECT_THROW(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), CannotRun);
}

TEST_F(ServerCheckTest, PropertiesThatTheClassLacks) {
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,Colour\n"),
              "5:15: warning: CIM_Fan has no property Colour: the column stays empty\n");
}

TEST_F(ServerCheckTest, AnEmptyClassLetsTheNextOnesMoveUp) {
    addClass("CIM_None", "");
    addClass("CIM_Card", instanceXml("CIM_Card", "c", "") + instanceXml("CIM_Card", "d", ""));
    texts.set("CIM_None.DeviceID", "None");
    texts.set("CIM_Card.DeviceID", "Card");
    EXPECT_EQ(check("G[0]=CIM_None\nA[0]=DeviceID\nG[1]=CIM_Card\nA[1]=DeviceID\n"
                    "G[2]=CIM_Fan\nA[2]=DeviceID\n"),
              "4:6: error: a class without instances stands before others: the columns of CIM_None "
              "show the instances of CIM_Card\n"
              "6:6: error: a class without instances stands before others: the columns of CIM_Card "
              "show the instances of CIM_Fan\n"
              "8:6: error: a class without instances stands before others: the columns of CIM_Fan "
              "stay empty\n");
}

TEST_F(ServerCheckTest, AnEmptyClassBehindTheOthersDoesNoHarm) {
    addClass("CIM_None", "");
    texts.set("CIM_None.DeviceID", "Other");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\nG[1]=CIM_None\nA[1]=DeviceID\n"), "");
}

TEST_F(ServerCheckTest, ClassesOfWhichOneHasFewerInstances) {
    addClass("CIM_Card", instanceXml("CIM_Card", "c", ""));
    texts.set("CIM_Card.DeviceID", "Card");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\nG[1]=CIM_Card\nA[1]=DeviceID\n"),
              "6:6: warning: 1 instance of CIM_Card beside 2 of CIM_Fan: in row 2 readers show the "
              "values of row 1 under the columns of CIM_Card (for CA 0 or nothing)\n");
    fans.setFans(fanXml("a", "2", "1") + fanXml("b", "2", "1") + fanXml("c", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Card\nA[0]=DeviceID\nG[1]=CIM_Fan\nA[1]=DeviceID\n"),
              "4:6: warning: 1 instance of CIM_Card beside 3 of CIM_Fan: in rows 2 to 3 readers "
              "show the values of row 1 under the columns of CIM_Card (for CA 0 or nothing)\n");
}

// The columns are those of the class that the list is taken for.
TEST_F(ServerCheckTest, AListThatMovesUpAndIsShorter) {
    addClass("CIM_None", "");
    addClass("CIM_Card", instanceXml("CIM_Card", "c", ""));
    texts.set("CIM_None.DeviceID", "None");
    texts.set("CIM_Card.DeviceID", "Card");
    const std::string told = check(
        "G[0]=CIM_None\nA[0]=DeviceID\nG[1]=CIM_Card\nA[1]=DeviceID\n"
        "G[2]=CIM_Fan\nA[2]=DeviceID\n");
    EXPECT_NE(
        told.find("4:6: warning: 1 instance of CIM_Card beside 2 of CIM_Fan: in row 2 readers "
                  "show the values of row 1 under the columns of CIM_None (for CA 0 or nothing)\n"),
        std::string::npos)
        << told;
}

TEST_F(ServerCheckTest, ClassesWithEquallyManyInstances) {
    addClass("CIM_Card", instanceXml("CIM_Card", "c", "") + instanceXml("CIM_Card", "d", ""));
    texts.set("CIM_Card.DeviceID", "Card");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\nG[1]=CIM_Card\nA[1]=DeviceID\n"), "");
}

TEST_F(ServerCheckTest, IntegersBeyond32Bits) {
    fans.setFans(fanXml("a", "2", "2147483647"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Bytes\n"), "");
    fans.setFans(fanXml("a", "2", "2147483648") + fanXml("b", "2", "8589934592"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Bytes\n"),
              "5:6: warning: 2 values of Bytes beyond 32 bits with sign: another number is "
              "written\n");
}

TEST_F(ServerCheckTest, TextsThatAreCutOrLongerThanTheirColumn) {
    fans.setFans(fanXml(std::string(65, 'x'), "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "5:6: warning: 1 value of DeviceID longer than the column of 64\n");
    texts.set("CIM_Fan.DeviceID.Size", "255");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), "");
    fans.setFans(fanXml(std::string(256, 'x'), "2", "1"));
    texts.set("CIM_Fan.DeviceID.Size", "300");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "5:6: warning: 1 value of DeviceID cut, for texts end at 255 characters, and other "
              "values at 32\n");
}

TEST_F(ServerCheckTest, ArraysThatAreCut) {
    fans.server.onGetClass("CIM_Fan",
                           Reply::ok("<CLASS NAME=\"CIM_Fan\"><PROPERTY.ARRAY NAME=\"Roles\" "
                                     "TYPE=\"string\"/></CLASS>"));
    const auto setRoles = [this](std::size_t first, std::size_t second) {
        fans.setFans(instanceXml("CIM_Fan", "a",
                                 "<PROPERTY.ARRAY NAME=\"Roles\" TYPE=\"string\"><VALUE.ARRAY>"
                                 "<VALUE>" +
                                     std::string(first, 'x') + "</VALUE><VALUE>" +
                                     std::string(second, 'x') +
                                     "</VALUE></VALUE.ARRAY></PROPERTY.ARRAY>"));
    };
    const std::string cut =
        "5:6: warning: 1 value of Roles cut, for texts end at 255 characters, and other values at "
        "32\n";
    setRoles(127, 127);
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Roles\n"), "") << "with the comma they have 255 characters";
    setRoles(127, 128);
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Roles\n"), cut);
    setRoles(5000, 1);
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Roles\n"), cut);
}

TEST_F(ServerCheckTest, NamesOfNumbersThatAreLongerThanTheirColumn) {
    texts.set("CIM_Fan.State.Size", "7");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=State\n"),
              "5:6: warning: 1 value of State longer than the column of 7\n")
        << "Disabled has eight letters, Enabled seven";
}

TEST_F(ServerCheckTest, LettersThatBecomeBlanks) {
    fans.setFans(fanXml("L\xC3\xBC"
                        "fter",
                        "2", "1") +
                 fanXml("Luefter", "2", "1") + fanXml("a&#9;b", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "5:6: warning: 2 values of DeviceID with letters beyond ASCII or control characters: "
              "each becomes a blank\n");
}

TEST_F(ServerCheckTest, DoubleQuotesAndLineEndsInValues) {
    wantNotes = true;
    fans.setFans(fanXml("3&quot; fan", "2", "1") + fanXml("&quot;a&quot;&#10;b", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "4:6: note: CIM_Fan: 2 instances\n"
              "5:6: warning: 2 values of DeviceID with a double quote: old versions of SMS refuse "
              "the file, and for QVE it becomes '\n"
              "5:6: note: 1 value of DeviceID with a line end, which is written as it is: readers "
              "that keep to the standard refuse it\n");
}

TEST_F(ServerCheckTest, BackslashesAtTheEndOfValues) {
    const auto told = [](const std::string& count) {
        return "5:6: error: " + count +
               " of DeviceID with a backslash at the end: the file of all scripts cannot be read "
               "by CA\n";
    };
    fans.setFans(fanXml("C:\\Temp", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), "");
    fans.setFans(fanXml("x\\", "2", "1") + fanXml("y\\\\", "2", "1") + fanXml("z", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), told("2 values"));
    texts.set("CIM_Fan.DeviceID.Size", "255");
    fans.setFans(fanXml(std::string(254, 'x') + "\\", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), told("1 value"));
    fans.setFans(fanXml(std::string(254, 'x') + "\\x", "2", "1"));
    EXPECT_NE(check("G[0]=CIM_Fan\nA[0]=DeviceID\n").find(told("1 value")), std::string::npos)
        << "the value is cut behind the backslash";
    fans.setFans(fanXml(std::string(255, 'x') + "\\", "2", "1"));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n").find("backslash"), std::string::npos)
        << "the value is cut before it";
}

TEST_F(ServerCheckTest, SizesThatAreLessThanTheTypeNeeds) {
    wantNotes = true;
    const std::string counted = "4:6: note: CIM_Fan: 2 instances\n";
    texts.set("CIM_Fan.Bytes.Size", "9");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Bytes\n"),
              counted +
                  "5:6: note: the size 9 of the column Bytes is less than the 10 characters "
                  "that its type may need\n");
    texts.set("CIM_Fan.Bytes.Size", "10");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Bytes\n"), counted);
}

TEST_F(ServerCheckTest, SizesThatCutArraysAndDatesInSql) {
    fans.server.onGetClass(
        "CIM_Fan", Reply::ok(R"(<CLASS NAME="CIM_Fan"><PROPERTY.ARRAY NAME="Roles" TYPE="string"/>)"
                             R"(<PROPERTY NAME="Since" TYPE="datetime"/></CLASS>)"));
    fans.setFans(instanceXml(
        "CIM_Fan", "a",
        R"(<PROPERTY.ARRAY NAME="Roles" TYPE="string"><VALUE.ARRAY><VALUE>ab</VALUE>)"
        R"(<VALUE>c</VALUE></VALUE.ARRAY></PROPERTY.ARRAY>)"
        R"(<PROPERTY NAME="Since" TYPE="datetime"><VALUE>20260102030405.000000+060</VALUE>)"
        R"(</PROPERTY>)"));
    texts.set("CIM_Fan.Roles.Size", "3");
    texts.set("CIM_Fan.Since.Size", "5");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Roles,Since\n"),
              "5:6: warning: 1 value of Roles longer than the column of 3 in QVE's schema scripts\n"
              "5:12: warning: 1 value of Since longer than the column of 5 in QVE's schema "
              "scripts\n")
        << "ab,c and 1/2/26";
    texts.set("CIM_Fan.Roles.Size", "4");
    texts.set("CIM_Fan.Since.Size", "6");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Roles,Since\n"), "");
}

TEST_F(ServerCheckTest, ValuesThatAreMissingInSomeRows) {
    wantNotes = true;
    fans.setFans(fanXml("a", "2", "1") + instanceXml("CIM_Fan", "b", ""));
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,Bytes\n"),
              "4:6: note: CIM_Fan: 2 instances\n"
              "5:15: note: 1 value of Bytes missing: 0 (for QVE null) is written\n");
}

TEST_F(ServerCheckTest, EmptyColumnsAndTheirReason) {
    wantNotes = true;
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Spare\n"),
              "4:6: note: CIM_Fan: 2 instances\n5:6: note: the column Spare is empty\n");
    addMissing("CIM_Fan", "Spare");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=Spare\n"),
              "4:6: note: CIM_Fan: 2 instances\n"
              "5:6: note: the column Spare is empty: Needs Root, run as root or let the service "
              "run\n");
}

// The service may not look into other users' processes, and root through it may not either.
TEST_F(ServerCheckTest, WhatTheServiceCannotReadIsNotExpectedOfIt) {
    wantNotes = true;
    fans.server.onGetClass(
        "Velmira_UnixProcess",
        Reply::ok(R"(<CLASS NAME="Velmira_UnixProcess"><PROPERTY NAME="ModulePath" TYPE="string"/>)"
                  R"(</CLASS>)"));
    fans.server.onEnumerateInstances("Velmira_UnixProcess",
                                     Reply::ok(instanceXml("Velmira_UnixProcess", "p", "")));
    addMissing("Velmira_UnixProcess", "ModulePath");
    EXPECT_EQ(check("G[0]=Velmira_UnixProcess\nA[0]=ModulePath\n"),
              "4:6: note: Velmira_UnixProcess: 1 instance\n"
              "5:6: note: the column ModulePath is empty: Needs Root, run as root by hand, without "
              "the service\n");
}

TEST_F(ServerCheckTest, ColumnsWithoutASize) {
    wantSizes = true;
    texts.set("CIM_Fan.State.Size", "16");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes,Spare\n"),
              "5:27: warning: neither the class nor the resource properties (CIM_Fan.Spare.Size) "
              "give a size: 255 are taken\n");
}

TEST_F(ServerCheckTest, NamesThatCollideForAllProducts) {
    texts.set("CIM_Fan.DeviceID", "Thing");
    texts.set("CIM_Fan.State", " Thing ");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State\n"),
              "5:15: warning: two columns are called Thing: for all products this one becomes "
              "Thing3\n");
}

// That it is listed twice is told without a server.
TEST_F(ServerCheckTest, ARepeatedPropertyIsNotToldAgain) {
    std::vector<Finding> findings;
    ScriptModel model = ScriptReader("x.script.inv", findings)
                            .read(
                                "[DEFAULT]\ntitle=Fans\n[CIM]\nG[0]=CIM_Fan\n"
                                "A[0]=DeviceID,deviceid\n");
    checkScript(model, findings);
    LocalServer server;
    MissingValues missing(server);
    ServerCheck(server, missing, texts, {}, findings).check(model);
    ASSERT_EQ(findings.size(), 2U);
    EXPECT_EQ(findings[0].message,
              "the property deviceid is listed twice, and so gets two columns");
    EXPECT_EQ(findings[1].message, "CIM_Fan: 2 instances");
}

TEST_F(ServerCheckTest, NamesThatBreakTheFile) {
    texts.set("CIM_Fan.DeviceID", "Fan 17\"");
    texts.set("CIM_Fan.State", "a\tb");
    const std::string told = check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes\n");
    EXPECT_EQ(told,
              "5:6: error: the name Fan 17\" has a double quote or a control character: the MIF "
              "file cannot be read\n"
              "5:15: error: the name a\tb has a double quote or a control character: the MIF file "
              "cannot be read\n");
}

TEST_F(ServerCheckTest, NamesThatTheScriptsOfQveCannotHave) {
    texts.set("CIM_Fan.DeviceID", "1st Fan");
    texts.set("CIM_Fan.State", "Free %");
    texts.set("CIM_Fan.Bytes", "Size (B)");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes\n"),
              "5:6: warning: the name 1st Fan begins with a digit: for QVE databases refuse the "
              "table\n"
              "5:15: warning: the name Free % has characters besides letters, digits and blanks: "
              "databases or shells refuse it in QVE's scripts, where it has no quotes\n")
        << "blanks and parentheses are written as underscores";
}

TEST_F(ServerCheckTest, NamesThatAreWordsOfSql) {
    texts.set("CIM_Fan.DeviceID", "user");
    texts.set("CIM_Fan.State", "Order");
    texts.set("CIM_Fan.Bytes", "Order Number");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes\n"),
              "5:6: warning: the name user is a word of SQL: for QVE some databases refuse the "
              "table\n"
              "5:15: warning: the name Order is a word of SQL: for QVE some databases refuse the "
              "table\n");
}

TEST_F(ServerCheckTest, NamesThatQveWritesOtherwise) {
    wantNotes = true;
    texts.set("CIM_Fan.DeviceID", "Level");
    texts.set("CIM_Fan.State", "SIZE");
    texts.set("CIM_Fan.Bytes", "Resource (B) Size");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State,Bytes\n"),
              "4:6: note: CIM_Fan: 2 instances\n"
              "5:6: note: the name Level becomes level_ for QVE, for databases have a word that is "
              "called so\n"
              "5:15: note: the name SIZE becomes siz_ for QVE, for databases have a word that is "
              "called so\n");
}

TEST_F(ServerCheckTest, AColumnCalledAsTheNumbersOfRows) {
    texts.set("CIM_Fan.DeviceID", "Index");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "5:6: error: the name Index is that of the numbers of rows, too: readers refuse two "
              "attributes of one name\n");
    texts.set("CIM_Fan.DeviceID", "INDEX");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"), "");
}

TEST_F(ServerCheckTest, AColumnCalledAsOneThatQveHasAnyway) {
    texts.set("CIM_Fan.DeviceID", "Row index");
    EXPECT_EQ(
        check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
        "5:6: error: each table of QVE has a column Row_index already: it refuses this one\n");
    texts.set("CIM_Fan.DeviceID", "cfg chg type");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n"),
              "5:6: error: each table of QVE with Lumo has a column cfg_chg_type already: it "
              "refuses this one\n");
}

TEST_F(ServerCheckTest, NamesThatDifferInCaseOnly) {
    texts.set("CIM_Fan.DeviceID", "ver");
    texts.set("CIM_Fan.State", "VER");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State\n")
                  .rfind("5:15: warning: the names ver and VER differ in case only: for QVE the "
                         "table has one twice\n",
                         0),
              0U);
}

TEST_F(ServerCheckTest, NamesThatCollideWhereTheyAreCut) {
    texts.set("CIM_Fan.DeviceID", "Twenty characters 20");
    texts.set("CIM_Fan.State", "Twenty characters 21");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State\n"),
              "5:6: warning: the name Twenty characters 20 is cut to Twenty_characters_ for QVE "
              "with Lumo\n"
              "5:15: warning: the name Twenty characters 21 is cut to Twenty_characters_ for QVE "
              "with Lumo\n");
}

TEST_F(ServerCheckTest, NamesThatCollideWhereWordsAreAbbreviated) {
    texts.set("CIM_Fan.DeviceID", "DeviceID");
    texts.set("CIM_Fan.State", "Device");
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID,State\n"),
              "5:15: warning: two columns are called DEV for QVE with Lumo, which refuses the "
              "table\n");
}

TEST_F(ServerCheckTest, TitlesThatAreShortened) {
    EXPECT_EQ(check("G[0]=CIM_Fan\nA[0]=DeviceID\n", "Thirteen char"), "");
    const std::string told = check("G[0]=CIM_Fan\nA[0]=DeviceID\n", "Fourteen chars");
    EXPECT_EQ(told.rfind("2:7: warning: the title Fourteen_chars is shortened to Fourteen_c", 0),
              0U);
    EXPECT_EQ(told.substr(told.size() - 19), " for QVE with Lumo\n");
}

}  // namespace
}  // namespace sennetctl
