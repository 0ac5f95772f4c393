#include "mif/MifLint.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "MifTexts.h"

namespace sennetctl {
namespace {

constexpr MifProfile kProfiles[] = {MifProfile::Dmi, MifProfile::Sms, MifProfile::Ca,
                                    MifProfile::LanDesk};

std::vector<Finding> check(MifProfile profile, const std::string& text) {
    LintOptions options;
    options.profile = profile;
    return MifLint(options).check("f.mif", text);
}

std::string told(const std::vector<Finding>& findings) {
    std::string text;
    for (const Finding& finding : findings) {
        text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                nameOf(finding.severity) + ": " + finding.message + "\n";
    }
    return text;
}

/// One letter per profile, in their order: E, W, or - for silence.
std::string severities(const std::string& text) {
    std::string letters;
    for (const MifProfile profile : kProfiles) {
        const std::vector<Finding> findings = check(profile, text);
        EXPECT_LE(findings.size(), 1U) << told(findings);
        letters += findings.empty() ? '-' : findings[0].severity == Severity::Error ? 'E' : 'W';
    }
    return letters;
}

std::string withAttribute(const std::string& type, const std::string& value,
                          const std::string& name = "Speed") {
    return mifOf(groupMif(2, "Fan", "Own|Fan|001", attributeMif(1, name, type, value)));
}

TEST(MifLintTest, AFileWithoutFaultHasNoFindings) {
    EXPECT_EQ(severities(withAttribute("Integer", "7")), "----");
    EXPECT_EQ(severities(mifOf(tableMif(2, "Fan", "{ 1, \"a\", 3 }\n"))), "----");
}

TEST(MifLintTest, BrokenStructureIsAnErrorForAll) {
    EXPECT_EQ(severities("Start Component\n"), "EEEE");
    EXPECT_EQ(severities(withAttribute("Counter", "4294967296")), "EEEE");
    EXPECT_EQ(told(check(MifProfile::Sms, "Start Component\nName = 7\n")),
              "2:8: error: expected a literal, found 7\n");
}

TEST(MifLintTest, TextWhereTheTypeIsAnInteger) {
    EXPECT_EQ(severities(withAttribute("Integer", "\"7\"")), "EEEE");
}

TEST(MifLintTest, IntegerWhereTheTypeIsAString) {
    EXPECT_EQ(severities(withAttribute("String(8)", "7")), "EWW-");
}

TEST(MifLintTest, IntegersBeyond32Bits) {
    EXPECT_EQ(severities(withAttribute("Integer", "2147483647")), "----");
    EXPECT_EQ(severities(withAttribute("Integer", "-2147483648")), "----");
    EXPECT_EQ(severities(withAttribute("Integer", "2147483648")), "EWWW");
    EXPECT_EQ(severities(withAttribute("Integer", "-2147483649")), "EWWW");
    EXPECT_EQ(severities(withAttribute("Integer64", "2147483648")), "----");
}

TEST(MifLintTest, LiteralsLongerThanTheirType) {
    EXPECT_EQ(severities(withAttribute("String(3)", "\"abc\"")), "----");
    EXPECT_EQ(severities(withAttribute("String(3)", "\"abcd\"")), "EWWW");
}

TEST(MifLintTest, TextsThatAProductCuts) {
    EXPECT_EQ(severities(withAttribute("String(999)", "\"" + std::string(255, 'x') + "\"")),
              "----");
    EXPECT_EQ(severities(withAttribute("String(999)", "\"" + std::string(256, 'x') + "\"")),
              "-W-W");
}

TEST(MifLintTest, SeveralInstancesWithoutAKey) {
    const std::string attribute = attributeMif(1, "Speed", "Integer", "7");
    EXPECT_EQ(severities(mifOf(groupMif(2, "Fan", "Own|Fan|001", attribute) +
                               groupMif(3, "Fan", "Own|Fan|001", attribute))),
              "EEWW");
    EXPECT_EQ(severities(mifOf(groupMif(2, "Fan", "Own|Fan|001", "Key = 1\n" + attribute) +
                               groupMif(3, "Fan", "Own|Fan|001", "Key = 1\n" + attribute))),
              "----");
}

TEST(MifLintTest, RowsWithOneKey) {
    EXPECT_EQ(severities(mifOf(tableMif(2, "Fan", "{ 1, \"a\", 3 }\n{ 2, \"a\", 3 }\n"))), "----");
    EXPECT_EQ(severities(mifOf(tableMif(2, "Fan", "{ 1, \"a\", 3 }\n{ 1, \"b\", 4 }\n"))), "EEWW");
    // The number of the second row is the default of the group, 1.
    EXPECT_EQ(severities(mifOf(tableMif(2, "Fan", "{ 1, \"a\", 3 }\n{ , \"b\", 4 }\n"))), "EEWW");
}

// Two texts of which one is the default of the group, an integer and a text of its digits, and keys
// that only look alike when they are strung together.
TEST(MifLintTest, KeysOfSeveralAttributes) {
    const std::string group =
        "Start Group Name = \"Fan\" Class = \"Own|Fan|001\" Key = 3, 1\n" +
        attributeMif(1, "Slot", "String(9)", "\"a\"") + attributeMif(2, "Speed", "Integer", "7") +
        attributeMif(3, "Bus", "String(9)", "\"1\"") +
        "End Group\nStart Table Name = \"Fan\" Class = \"Own|Fan|001\" Id = 2\n";
    const auto keys = [&group](const std::string& rows) {
        return told(check(MifProfile::LanDesk, mifOf(group + rows + "End Table\n")));
    };
    const std::string repeated =
        "21:3: warning: one more row with the key of an earlier one: it overwrites that\n";
    EXPECT_EQ(keys("{ \"b\" }\n{ \"a\" }\n{ \"b\", 1, \"2\" }\n{ , 1, \"2\" }\n"), "");
    EXPECT_EQ(keys("{ \"a\", 1, \"1\" }\n{ , 2 }\n"), repeated);
    EXPECT_EQ(keys("{ , 1, 1 }\n{ \"a\" }\n"), repeated);
    EXPECT_EQ(keys("{ \"a1\", 1, \"\" }\n{ \"\", 1, \"a1\" }\n"), "");
    EXPECT_EQ(keys("{ \"x\", 1, \"2:1\" }\n{ \"x2:1\", 1, \"\" }\n"), "");
}

// Rows of two octets stand for keys of two thousand values, or of one of a million octets.
TEST(MifLintTest, ShortRowsOfLongKeysTakeNoLongerThanTheirTextIs) {
    std::string key = "1";
    std::string attributes =
        attributeMif(1, "A1", "String(9)", "\"" + std::string(1 << 20, 'x') + "\"");
    for (int i = 2; i <= 2000; ++i) {
        key += "," + std::to_string(i);
        attributes += attributeMif(i, "A" + std::to_string(i), "Integer", "1");
    }
    std::string rows;
    for (int i = 0; i < 20000; ++i) {
        rows += "{}";
    }
    const std::vector<Finding> findings =
        check(MifProfile::Sms,
              mifOf("Start Group Name = \"Fan\" Class = \"Own|Fan|001\" Key = " + key + "\n" +
                    attributes +
                    "End Group\nStart Table Name = \"Fan\" Class = \"Own|Fan|001\" Id = 2\n" +
                    rows + "End Table\n"));
    ASSERT_EQ(findings.size(), 1001U);
    EXPECT_EQ(findings[1000].message, "there are more findings, which are not told");
}

TEST(MifLintTest, ClassesOfTheMachinesOwnRecord) {
    const std::string attribute = attributeMif(1, "Speed", "Integer", "7");
    EXPECT_EQ(severities(mifOf(groupMif(2, "ARCHITECTURE", "Own|Fan|001", attribute))), "-E--");
    EXPECT_EQ(severities(mifOf(groupMif(2, "Fan", "Own|Identification|001", attribute))), "-E--");
}

TEST(MifLintTest, NamesAndTextsThatOldReadersRefuse) {
    EXPECT_EQ(severities(withAttribute("Integer", "7", "Speed ")), "-E--");
    EXPECT_EQ(severities(withAttribute("Integer", "7", "Top \\\"Speed\\\"")), "-E--");
    EXPECT_EQ(severities(withAttribute("String(9)", "\"3.5\\\"\"")), "-E--");
}

TEST(MifLintTest, UnsupportedAsAValue) {
    EXPECT_EQ(severities(withAttribute("Integer", "unsupported")), "-W--");
}

TEST(MifLintTest, OctetsBeyondAscii) {
    EXPECT_EQ(severities(withAttribute("String(9)", "\"M\xFCller\"")), "-EWW");
    EXPECT_EQ(severities("\xEF\xBB\xBF" + withAttribute("Integer", "7")), "-EWW");
    std::string twoOctets = "\xFE\xFF";
    for (const char c : withAttribute("Integer", "7")) {
        twoOctets += '\0';
        twoOctets += c;
    }
    EXPECT_EQ(severities(twoOctets), "-EWW");
}

TEST(MifLintTest, TheFirstOctetBeyondAsciiIsTheOneTold) {
    EXPECT_EQ(told(check(MifProfile::Ca, withAttribute("String(9)", "\"\xE2\x80\x99\""))),
              "16:65: warning: 3 octets beyond ASCII, of which this is the first: other "
              "characters arrive\n");
}

TEST(MifLintTest, LineEndsInLiterals) {
    EXPECT_EQ(severities(withAttribute("String(9)", "\"a\nb\"")), "E---");
    EXPECT_EQ(severities(withAttribute("String(9)", "\"a\\\r\\\nb\"")), "E---");
}

TEST(MifLintTest, ClassesOffTheConvention) {
    const std::string attribute = attributeMif(1, "Speed", "Integer", "7");
    EXPECT_EQ(severities(mifOf(groupMif(2, "Fan", "Own|Fan", attribute))), "W-W-");
    EXPECT_EQ(severities(mifOf(groupMif(2, "Fan", "Own||001", attribute))), "W-W-");
}

TEST(MifLintTest, AFileWithoutComponentId) {
    EXPECT_EQ(
        severities(kMifStart +
                   groupMif(2, "Fan", "Own|Fan|001", attributeMif(1, "Speed", "Integer", "7")) +
                   kMifEnd),
        "W-W-");
}

TEST(MifLintTest, Dates) {
    EXPECT_EQ(severities(withAttribute("Date", "\"20260131235959.000000+060\"")), "----");
    EXPECT_EQ(severities(withAttribute("Date", "\"20261331235959.000000+060\"")), "EWWW");
    EXPECT_EQ(severities(withAttribute("Date", "7")), "EWWW");
    EXPECT_EQ(severities(withAttribute("Date", "\"\"")), "E---");
}

TEST(MifLintTest, TemplatesWithoutATable) {
    EXPECT_EQ(severities(mifOf("Start Group Name = \"Fan\" Class = \"Own|Fan|001\" Key = 1\n" +
                               attributeMif(1, "Index", "Integer", "1") + "End Group\n")),
              "WWWW");
}

TEST(MifLintTest, OnlyTheTemplatesWithoutATableAreTold) {
    const auto group = [](const std::string& name) {
        return "Start Group Name = \"" + name + "\" Class = \"Own|" + name + "|001\" Key = 1\n" +
               attributeMif(1, "Index", "Integer", "1") + "End Group\n";
    };
    const std::string table = "Start Table Name = \"B\" Class = \"Own|B|001\" Id = 2 End Table\n";
    EXPECT_EQ(told(check(MifProfile::Sms, mifOf(group("A") + group("B") + group("C") + table))),
              "14:20: warning: the group A describes rows, and no table has any\n"
              "20:20: warning: the group C describes rows, and no table has any\n");
}

TEST(MifLintTest, PlainBackslashesAreForOneProductOnly) {
    EXPECT_EQ(severities(withAttribute("String(9)", "\"C:\\dir\"")), "EE-E");
}

TEST(MifLintTest, ValuesInTablesAreChecked) {
    const std::vector<Finding> findings = check(
        MifProfile::Sms, mifOf(tableMif(2, "Fan", "{ 1, \"a\", 3000000000 }\n{ 2, 7, \"x\" }\n")));
    EXPECT_EQ(told(findings),
              "20:11: warning: integer beyond the type Integer, 32 bits with sign: arrives wrong "
              "or negative\n"
              "21:6: warning: integer where the type is a string\n"
              "21:9: error: literal where the type is an integer\n");
}

TEST(MifLintTest, NobodyReadsMoreThanAThousandFindings) {
    std::string rows;
    for (int i = 0; i < 2000; ++i) {
        rows += "{ 1, 7 }\n";
    }
    const std::vector<Finding> findings = check(MifProfile::Sms, mifOf(tableMif(2, "Fan", rows)));
    ASSERT_EQ(findings.size(), 1001U);
    EXPECT_EQ(findings.back().message, "there are more findings, which are not told");
}

TEST(MifLintTest, LongTextsAreToldByTheirBegin) {
    const auto finding = [](const std::string& name) {
        return check(MifProfile::Sms, withAttribute("Integer", "7", name)).at(0).message;
    };
    EXPECT_EQ(finding("\xE9" + std::string(253, 'x') + " "),
              "trailing blank in the name '\xC3\xA9" + std::string(253, 'x') +
                  " ': old versions refuse the file");
    EXPECT_EQ(finding("\xE9" + std::string(254, 'x') + " "),
              "trailing blank in the name '\xC3\xA9" + std::string(253, 'x') +
                  "\xE2\x80\xA6': old versions refuse the file");
}

// A thousand findings that each tell a class of a million octets, of two thousand that there are.
TEST(MifLintTest, AClassWithALongNameMayLoseManyAttributes) {
    LintOptions options;
    options.profile = MifProfile::Sms;
    MifLint lint(options);
    const std::string className = "Own|" + std::string(1 << 20, 'x') + "|001";
    std::string attributes;
    for (int i = 1; i <= 2000; ++i) {
        attributes += attributeMif(i, "A" + std::to_string(i), "Integer", "1");
    }
    lint.check("old", mifOf(groupMif(2, "Fan", className, attributes)));
    const std::vector<Finding> findings = lint.check(
        "new", mifOf(groupMif(2, "Fan", className, attributeMif(1, "B", "Integer", "1"))));
    ASSERT_EQ(findings.size(), 1001U);
    EXPECT_EQ(findings[1].message, "the attribute A1 of the class Own|" + std::string(250, 'x') +
                                       "\xE2\x80\xA6, which an earlier file had, is missing: it "
                                       "becomes NULL");
}

TEST(MifLintTest, LargeFiles) {
    LintOptions options{MifProfile::Sms, 1};
    const std::string text = withAttribute("Integer", "7");
    const std::string padding = "// " + std::string(1021 - text.size(), 'x');
    EXPECT_EQ(told(MifLint(options).check("f", text + padding)), "");
    EXPECT_EQ(told(MifLint(options).check("f", text + padding + "x")),
              "1:1: warning: file of 2 KB: the site takes 1\n");
}

TEST(MifLintTest, AttributesThatAnEarlierFileHad) {
    LintOptions options;
    options.profile = MifProfile::Sms;
    MifLint lint(options);
    lint.check("old", mifOf(groupMif(2, "Fan", "Own|Fan|001",
                                     attributeMif(1, "Speed", "Integer", "7") +
                                         attributeMif(2, "Colour", "Integer", "7"))));
    EXPECT_EQ(told(lint.check("new", withAttribute("Integer", "7"))),
              "14:20: warning: the attribute Colour of the class Own|Fan|001, which an earlier "
              "file had, is missing: it becomes NULL\n");
    EXPECT_EQ(told(lint.check("newer", withAttribute("Integer", "7"))), "");
}

}  // namespace
}  // namespace sennetctl
