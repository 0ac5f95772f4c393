#include "script/PropertiesLint.h"

#include <gtest/gtest.h>

#include "support/TempDirectory.h"

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

std::string inResources(std::string_view octets) {
    std::vector<Finding> findings;
    checkResourcesText("r", octets, findings);
    return told(findings);
}

std::string inConfiguration(std::string_view octets) {
    std::vector<Finding> findings;
    checkConfigurationText("c", octets, findings);
    return told(findings);
}

TEST(PropertiesLintTest, GoodResources) {
    EXPECT_EQ(inResources("# Fans\n\ntitle.Fan_List = Fans\nCIM_Fan.DeviceID: Fan\n"
                          "CIM_Fan.DeviceID.Size=255\ntitle.Rev._1.Size=x\n"),
              "");
}

TEST(PropertiesLintTest, SizesThatReadersRefuse) {
    const auto refused = [](const std::string& size) {
        return "2:10: error: the size '" + size + "' is written as it is: readers refuse a MIF " +
               "file with String(" + size + "), and databases the table\n";
    };
    for (const char* size : {"abc", "-5", "0", "00", "12x", "0x40", "6 4", "9999999999999999999"}) {
        EXPECT_EQ(inResources(std::string("#\nA.B.Size=") + size), refused(size)) << size;
    }
    EXPECT_EQ(inResources("#\nA.Size=x"), "") << "a property may be called Size";
}

TEST(PropertiesLintTest, SizesThatMeanSomethingElse) {
    EXPECT_EQ(inResources("A.B.Size=064"),
              "1:10: warning: the size 064 is written as it is, and octal in a MIF file: write "
              "64\n");
    EXPECT_EQ(inResources("A.B.Size=256"),
              "1:10: warning: the size 256 is more than is used: texts end at 255 characters\n");
    EXPECT_EQ(inResources("A.B.Size=64 "), "");
}

TEST(PropertiesLintTest, LinesThatSayNothing) {
    EXPECT_EQ(inResources("title.Fans\nA.B\nC.D= \n=x\n"),
              "1:1: warning: no '=' behind the key, so an empty text is written\n"
              "2:1: warning: no '=' behind the key, so an empty text is written\n"
              "3:6: warning: an empty text is written\n"
              "4:1: warning: line without effect: it has no key\n");
}

TEST(PropertiesLintTest, KeysThatNothingLooksFor) {
    const std::string kinds =
        ":1: warning: line without effect: a key is title.TITLE, CLASS.PROPERTY or "
        "CLASS.PROPERTY.Size\n";
    EXPECT_EQ(inResources("Fans=x\nA.B C=x\nA.B.C=x\nA.B.C.Size=1\n"),
              "1" + kinds + "2" + kinds + "3" + kinds + "4" + kinds);
    EXPECT_EQ(inResources("title.Fan List=x\nTitle.Fans=x\nA.B.size=1\n"),
              "1:1: warning: line without effect: the key has _ for each blank of the title\n"
              "2:1: warning: line without effect: the key begins with title. in small letters\n"
              "3:1: warning: line without effect: the key ends in .Size with a capital S\n");
}

TEST(PropertiesLintTest, KeysThatStandTwice) {
    EXPECT_EQ(inResources("A.B=x\nA.b=x\nA.B=y\n  A.B=z"),
              "3:1: note: replaces A.B of line 1\n4:3: note: replaces A.B of line 3\n");
}

TEST(PropertiesLintTest, FaultsOfWhatALaterLineReplaces) {
    EXPECT_EQ(inResources("A.B.Size=-5\nA.B.Size=10\n"),
              "2:1: note: replaces A.B.Size of line 1\n");
    EXPECT_EQ(inResources("A.B=\xFC\nA.B=x\n"), "2:1: note: replaces A.B of line 1\n");
    EXPECT_EQ(inResources("A.B=x\nA.B\n"),
              "2:1: note: replaces A.B of line 1\n"
              "2:1: warning: no '=' behind the key, so an empty text is written\n");
    EXPECT_EQ(inConfiguration("sennet.dir=/a\nsennet.dir=/b\n"),
              "2:1: note: replaces sennet.dir of line 1\n"
              "2:1: warning: line without effect: unknown key sennet.dir\n");
}

TEST(PropertiesLintTest, Encodings) {
    EXPECT_EQ(inResources("# caf\xE9\nA.B=caf\xC3\xA9\n"), "");
    EXPECT_EQ(inResources("A.B=L\xFC"
                          "fter\n"),
              "1:5: warning: octets that are not UTF-8: sennet takes each for U+FFFD\n");
    EXPECT_EQ(inResources("A.B=x\nA.\xFC=x\nA.C=\xFC\nA.D=\xFC\n"),
              "2:1: warning: octets that are not UTF-8: sennet takes each for U+FFFD, here and in "
              "2 later lines\n");
    EXPECT_EQ(inResources(std::string_view("\xFF\xFE#\0", 4)),
              "1:1: error: UTF-16, of which sennet understands nothing: save it as UTF-8\n");
    EXPECT_EQ(inResources("\xEF\xBB\xBF"
                          "A.B=x\n"),
              "");
}

TEST(PropertiesLintTest, AFileOfAnotherKindIsNotToldLineByLine) {
    std::string octets;
    for (int i = 0; i < 2000; ++i) {
        octets += "x\n";
    }
    std::vector<Finding> findings;
    checkResourcesText("r", octets, findings);
    ASSERT_EQ(findings.size(), 1001U);
    EXPECT_EQ(findings.back().message, "from here on the file has faults that are not told");
}

TEST(PropertiesLintTest, Configurations) {
    EXPECT_EQ(inConfiguration("sennet.directory=/a\nsennet.resources = /b\nmif.directory.LD=/c\n"
                              "sql.directory=\n"),
              "");
    EXPECT_EQ(inConfiguration("sennet.dir=/a\nmif.directory.LANDESK=/b\nsql.directory\n"),
              "1:1: warning: line without effect: unknown key sennet.dir\n"
              "2:1: warning: line without effect: unknown key mif.directory.LANDESK\n"
              "3:1: warning: no '=' behind the key, so the default is taken\n");
}

TEST(PropertiesLintTest, PathsThatAreTakenToTheLetter) {
    const std::string relative =
        "1:15: warning: a relative path: sennet takes it from the directory that it is started "
        "in\n";
    EXPECT_EQ(inConfiguration("mif.directory=out/mif\n"), relative);
    EXPECT_EQ(inConfiguration("mif.directory=/tmp/trail \n"),
              "1:15: warning: blanks at its ends belong to the path: write /tmp/trail\n");
    EXPECT_EQ(inConfiguration("sql.directory=\"/tmp/x\"\n"),
              "1:15: warning: quotes belong to the path: write /tmp/x\n");
    EXPECT_EQ(inConfiguration("mif.directory='out'\n"),
              "1:15: warning: quotes belong to the path: write out\n" + relative);
    EXPECT_EQ(inConfiguration("sql.directory=/d/sql # of QVE\n"),
              "1:15: warning: a comment has a line of its own, here it belongs to the path: write "
              "/d/sql\n");
    EXPECT_EQ(inConfiguration("sql.directory=\"/d/sql\" # of QVE\n"),
              "1:15: warning: quotes belong to the path: write /d/sql\n");
    EXPECT_EQ(inConfiguration("sennet.directory=/d/a#b c\nsennet.resources=/d/it's\n"), "");
    EXPECT_EQ(inConfiguration("mif.directory=out\nmif.directory=/out\n"),
              "2:1: note: replaces mif.directory of line 1\n");
}

TEST(PropertiesLintTest, FilesThatCannotBeRead) {
    const support::TempDirectory directory;
    Places places{directory.path("none"), false, "", directory.path("")};
    std::vector<Finding> findings;
    checkConfiguration(places, findings);
    EXPECT_EQ(told(findings), "") << "no configuration need be";
    places.isConfigured = true;
    checkConfiguration(places, findings);
    EXPECT_EQ(checkResources(places, findings), std::nullopt);
    EXPECT_EQ(told(findings),
              "0:0: error: there is no such file: sennet takes its default places\n"
              "0:0: error: is no regular file: sennet shows titles and properties as the scripts "
              "have them\n");
    EXPECT_EQ(findings[0].file, directory.path("none"));
    EXPECT_EQ(findings[1].file, directory.path(""));
}

TEST(PropertiesLintTest, AFileThatIsRead) {
    const support::TempDirectory directory;
    const std::string file = directory.write("r", "A.B.Size=x\n");
    std::vector<Finding> findings;
    EXPECT_EQ(checkResources({"", false, "", file}, findings), "A.B.Size=x\n");
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_EQ(findings[0].file, file);
}

}  // namespace
}  // namespace sennetctl
