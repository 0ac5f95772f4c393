#include "script/NameFaults.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sennetctl {
namespace {

using ::testing::ElementsAre;

std::vector<std::string> told(const std::vector<NameFault>& faults) {
    std::vector<std::string> texts;
    for (const NameFault& fault : faults) {
        texts.push_back(std::string(nameOf(fault.severity)) + fault.message);
    }
    return texts;
}

constexpr const char* kBroken =
    "error has a double quote or a control character: the MIF file cannot be read";
constexpr const char* kBeyondAscii =
    "error has letters beyond ASCII: other characters arrive, or readers refuse the MIF file";
constexpr const char* kReserved =
    "error is one of Configuration Manager's own: for SMS the file would alter the machine's own "
    "record";
constexpr const char* kBar =
    "warning has a '|': the MIF class is then not of the form body|name|version";

TEST(NameFaultsTest, WhatEveryReaderTakes) {
    EXPECT_THAT(told(groupNameFaults("Disk Drives (2), 50 % // {full}")), ElementsAre());
    EXPECT_THAT(told(classFaults("Identification")), ElementsAre());
}

TEST(NameFaultsTest, QuotesAndControlCharacters) {
    for (const char* text : {"17\" Fans", "\"", "a\tb", "\x7F", "\\\""}) {
        EXPECT_THAT(told(literalFaults(text)), ElementsAre(kBroken)) << text;
    }
}

TEST(NameFaultsTest, EscapesThatReadersRefuse) {
    for (const char* text : {"Back\\slash", "Sel\\x", "\\ ", "\\777"}) {
        EXPECT_THAT(told(literalFaults(text)),
                    ElementsAre("error has a backslash, which begins an escape: the MIF file "
                                "cannot be read but by CA"))
            << text;
    }
    EXPECT_THAT(told(literalFaults("End\\")),
                ElementsAre("error has a backslash, which begins an escape: the MIF file cannot "
                            "be read"))
        << "the quote behind it does not end the literal";
}

TEST(NameFaultsTest, EscapesThatReadersTake) {
    for (const char* text : {"C:\\temp", "End\\\\", "\\x41", "\\101"}) {
        EXPECT_THAT(told(literalFaults(text)),
                    ElementsAre("warning has a backslash, which begins an escape: other "
                                "characters arrive"))
            << text;
    }
}

TEST(NameFaultsTest, LettersBeyondAscii) {
    for (const char* text : {"L\xC3\xBC"
                             "fter",
                             "\xE2\x82\xAC", "\xEF\xBF\xBD"}) {
        EXPECT_THAT(told(literalFaults(text)), ElementsAre(kBeyondAscii)) << text;
    }
    EXPECT_THAT(told(literalFaults("\"\xC3\xBC")), ElementsAre(kBroken, kBeyondAscii));
}

TEST(NameFaultsTest, NamesOfTheMachinesOwnRecord) {
    EXPECT_THAT(told(groupNameFaults("Identification")), ElementsAre(kReserved));
    EXPECT_THAT(told(groupNameFaults("aRCHITECTURE")), ElementsAre(kReserved));
    EXPECT_THAT(told(groupNameFaults("Identification 2")), ElementsAre());
}

TEST(NameFaultsTest, TitlesThatPartTheirClass) {
    EXPECT_THAT(told(classFaults("Pipe|x|y")), ElementsAre(kBar));
    EXPECT_THAT(told(classFaults("a|architecture|b")), ElementsAre(kBar, kReserved));
    EXPECT_THAT(told(classFaults("a|Identification")), ElementsAre(kBar, kReserved));
    EXPECT_THAT(told(classFaults("Identification|a")), ElementsAre(kBar));
}

TEST(NameFaultsTest, WhatTheShellReplaces) {
    constexpr const char* kShell =
        "error has a '$' or a backquote: the shell replaces it in QVE's query script, or runs it";
    for (const char* text : {"x$(id)", "5 $", "`id`"}) {
        EXPECT_THAT(told(shellTextFaults(text)), ElementsAre(kShell)) << text;
    }
    EXPECT_THAT(told(shellTextFaults("Disks; id & (all) 'of' <them>")), ElementsAre());
    EXPECT_THAT(told(sqlNameFaults("5 $")), ElementsAre(kShell));
}

TEST(NameFaultsTest, NamesThatDatabasesRefuse) {
    for (const char* name : {"Wi-Fi", "a;b", "a'b", "<", "a.b", "a|b", "Disks (2)", "50 %", "a#"}) {
        EXPECT_THAT(told(sqlNameFaults(name)),
                    ElementsAre("warning has characters besides letters, digits and blanks: "
                                "databases or shells refuse it in QVE's scripts, where it has no "
                                "quotes"))
            << name;
    }
    for (const char* name : {"Disk_Drives 2", "a\\b", "L\xC3\xBC"}) {
        EXPECT_THAT(told(sqlNameFaults(name)), ElementsAre())
            << "no more than the literal's faults: " << name;
    }
}

}  // namespace
}  // namespace sennetctl
