#include "mif/MifCommands.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "CapturedOutput.h"
#include "MifTexts.h"
#include "report/WholeFile.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::HasSubstr;

class MifCommandsTest : public testing::Test {
  protected:
    std::string file(const std::string& name, const std::string& text) const {
        return directory.write(name, text);
    }
    std::string fans(const std::string& name, const std::string& rows) const {
        return file(name, mifOf(tableMif(2, "Fan", rows)));
    }
    std::string difference(const std::string& before, const std::string& after) {
        CapturedOutput captured;
        const int status = compareMifFiles(before, after, captured.plain());
        EXPECT_EQ(status, captured.text() == "0 differences\n" ? 0 : 1);
        return captured.text();
    }

    support::TempDirectory directory;
    CapturedOutput output;
};

TEST_F(MifCommandsTest, CheckTellsTheFindingsOfAllFiles) {
    const std::string good = fans("good", "{ 1, \"a\", 3 }\n");
    const std::string bad = fans("bad", "{ 1, \"a\", \"b\" }\n");
    EXPECT_EQ(checkMifFiles({good, bad}, {}, output.plain()), 1);
    EXPECT_EQ(output.text(), bad +
                                 ":20:11: error: literal where the type is an integer\n"
                                 "2 files: 1 error, 0 warnings\n");
    CapturedOutput fine;
    EXPECT_EQ(checkMifFiles({good}, {}, fine.plain()), 0);
}

TEST_F(MifCommandsTest, CheckTellsTheFindingsOfTheFilesThatItCanRead) {
    const std::string none = directory.path("none");
    const std::string bad = fans("bad", "{ 1, \"a\", \"b\" }\n");
    EXPECT_EQ(checkMifFiles({none, bad}, {}, output.plain()), 2);
    EXPECT_EQ(output.text(), bad +
                                 ":20:11: error: literal where the type is an integer\n"
                                 "1 file: 1 error, 0 warnings\n");
    EXPECT_EQ(output.errors(), "sennetctl: " + none + ": there is no such file\n");
}

TEST_F(MifCommandsTest, ProgressOfACheckIsTakenAwayAtTheEnd) {
    const std::string good = fans("good", "{ 1, \"a\", 3 }\n");
    Output shown = output.plain();
    shown.progress = true;
    checkMifFiles({good}, {}, shown);
    EXPECT_EQ(output.errors(), "\r\x1B[Kchecking " + good + "\r\x1B[K");
}

TEST_F(MifCommandsTest, FilesThatCannotBeReadEndTheCommand) {
    EXPECT_THROW(showMifFile(directory.path("none"), output.plain()), CannotRun);
    const std::string broken = file("broken", "Start Component\nName = 7\n");
    try {
        showMifFile(broken, output.plain());
        ADD_FAILURE() << "this is no MIF file";
    } catch (const CannotRun& failure) {
        EXPECT_EQ(failure.what(), broken + ":2:8: expected a literal, found 7");
    }
}

TEST_F(MifCommandsTest, ShowsTables) {
    const std::string path =
        fans("fans", "{ 2, \"M\xFCller\", 4000000000 }\n{ 3, , unsupported }\n");
    EXPECT_EQ(showMifFile(path, output.plain()), 0);
    EXPECT_EQ(output.text(),
              "Component Machine\n"
              "\nComponentID (DMTF|ComponentID|001, 1 row)\n"
              "Product\n"
              "Disk\n"
              "\nFan (Own|Fan|001, 2 rows)\n"
              "Index  Device  Speed\n"
              "2      M\xC3\xBCller  4000000000\n"
              "3              unsupported\n");
}

TEST_F(MifCommandsTest, ShowsGroupsOfOneClassAsOneTable) {
    const std::string path =
        file("cards", kMifStart +
                          groupMif(2, "Card", "Own|Card|001",
                                   "Key = 1\n" + attributeMif(1, "Index", "Integer", "1")) +
                          groupMif(3, "Card", "Own|Card|001",
                                   "Key = 1\n" + attributeMif(1, "Index", "Integer", "-2")) +
                          kMifEnd);
    EXPECT_EQ(showMifFile(path, output.json()), 0);
    EXPECT_EQ(output.document()["tables"].dump(),
              R"([{"name":"Card","class":"Own|Card|001","attributes":[{"name":"Index",)"
              R"("type":"Integer","key":true}],"rows":[{"Index":1},{"Index":-2}]}])");
}

TEST_F(MifCommandsTest, NumbersAreShownByTheirNames) {
    const std::string fan =
        kMifStart +
        "Start Group Name = \"Fan\" Class = \"Own|Fan|001\" Id = 2\n"
        "Start Attribute Name = \"State\" Id = 1 Type = Integer Value = -2\n"
        "Start Enum -2 = \"Off\" 3 = \"On\" End Enum End Attribute\n"
        "Start Attribute Name = \"Speed\" Id = 2 Type = Integer Value = 3 End Attribute\n"
        "End Group\n" +
        kMifEnd;
    EXPECT_EQ(showMifFile(file("fan", fan), output.plain()), 0);
    EXPECT_THAT(output.text(), HasSubstr("State  Speed\nOff    3\n"));
    CapturedOutput json;
    showMifFile(file("fan", fan), json.json());
    EXPECT_EQ(json.document()["tables"][0]["rows"][0].dump(), R"({"State":-2,"Speed":3})");
}

// Rows may leave out what the template has, so that a small file can have a huge table.
TEST_F(MifCommandsTest, TablesThatCannotBeHeldAreRefused) {
    std::string rows;
    for (int i = 0; i < 25; ++i) {
        rows += "{ }\n";
    }
    std::string quotes;
    for (int i = 0; i < 1000000; ++i) {
        quotes += "\\\"";
    }
    const std::string className = "\"Own|Big|001\"";
    const std::string path =
        file("big", kMifStart + "Start Group Name = \"Big\" Class = " + className + " Key = 1\n" +
                        attributeMif(1, "Text", "String(9)", "\"" + quotes + "\"") +
                        "End Group\nStart Table Name = \"Big\" Class = " + className + " Id = 2\n" +
                        rows + "End Table\n" + kMifEnd);
    try {
        showMifFile(path, output.plain());
        ADD_FAILURE() << "25 times a million &quot;";
    } catch (const CannotRun& failure) {
        EXPECT_EQ(failure.what(), path + ": its tables are larger than 128 MiB");
    }
}

TEST_F(MifCommandsTest, JsonKeepsNumbersTextsAndWhatIsMissing) {
    const std::string path =
        file("odd", kMifStart +
                        groupMif(2, "Odd", "Own|Odd|001",
                                 attributeMif(1, "Same", "Counter64", "18446744073709551615") +
                                     attributeMif(2, "Same", "String(3)", "\"C:\\x\"") +
                                     attributeMif(3, "None", "Integer64", "unsupported") +
                                     attributeMif(4, "Low", "Integer64", "-9223372036854775808")) +
                        kMifEnd);
    EXPECT_EQ(showMifFile(path, output.json()), 0);
    EXPECT_EQ(output.document()["tables"][0]["rows"].dump(),
              R"j([{"Same":18446744073709551615,"Same (2)":"C:\\x","None":null,)j"
              R"j("Low":-9223372036854775808}])j");
    EXPECT_EQ(output.document()["tables"][0]["attributes"][1]["type"], "String(3)");
}

TEST_F(MifCommandsTest, TheOrderAndTheNumbersOfRowsAreNoDifference) {
    EXPECT_EQ(difference(fans("old", "{ 1, \"a\", 3 }\n{ 2, \"b\", 4 }\n"),
                         fans("new", "{ 1, \"b\", 4 }\n{ 2, \"a\", 3 }\n")),
              "0 differences\n");
}

TEST_F(MifCommandsTest, RowsAreToldByTheirFirstAttribute) {
    EXPECT_EQ(difference(fans("old", "{ 1, \"a\", 3 }\n{ 2, \"b\", 4 }\n"),
                         fans("new", "{ 1, \"c\", 5 }\n{ 2, \"a\", 9 }\n")),
              "Fan\n"
              "  ~ a: Speed: '3' is now '9'\n"
              "  - b\n"
              "  + c\n"
              "3 differences\n");
}

TEST_F(MifCommandsTest, RowsThatNothingTellsApartAreComparedAsAWhole) {
    EXPECT_EQ(difference(fans("old", "{ 1, \"a\", 3 }\n{ 2, \"a\", 3 }\n"),
                         fans("new", "{ 1, \"a\", 3 }\n{ 2, \"a\", 4 }\n")),
              "Fan\n"
              "  - a, 3\n"
              "  + a, 4\n"
              "2 differences\n");
}

TEST_F(MifCommandsTest, RowsComparedAsAWholeShowWhatIsMissingInThem) {
    EXPECT_EQ(difference(fans("old", "{ 1, \"a\", 3 }\n{ 2, \"a\", 3 }\n{ 3, \"\", 4 }\n"),
                         fans("new", "{ 1, \"a\", unsupported }\n{ 2, \"a\", 3 }\n{ 3, \"b\" }\n")),
              "Fan\n"
              "  - a, 3\n"
              "  - 4\n"
              "  + a, unsupported\n"
              "  + b, 0\n"
              "4 differences\n");
}

TEST_F(MifCommandsTest, TablesAndAttributesComeAndGo) {
    const std::string one = attributeMif(1, "One", "Integer", "1");
    const std::string two = attributeMif(2, "Two", "Integer", "2");
    const std::string before = file("old", kMifStart + groupMif(2, "A", "Own|A|1", one) +
                                               groupMif(3, "B", "Own|B|1", one) + kMifEnd);
    const std::string after = file("new", kMifStart + groupMif(2, "A", "Own|A|1", one + two) +
                                              groupMif(3, "C", "Own|C|1", one) + kMifEnd);
    EXPECT_EQ(difference(before, after),
              "A\n  + attribute Two\n"
              "B\n  - table\n"
              "C\n  + table\n"
              "3 differences\n");
}

// A reader that has made its table by the old definition cuts or refuses the new values.
TEST_F(MifCommandsTest, DefinitionsOfAttributesAreCompared) {
    const std::string size = attributeMif(1, "Size", "Integer", "1");
    const std::string wide = attributeMif(1, "Size", "Integer64", "1");
    const std::string name = attributeMif(2, "Name", "String(8)", "\"x\"");
    const std::string longName = attributeMif(2, "Name", "String(64)", "\"x\"");
    const std::string before =
        file("old", kMifStart + groupMif(2, "A", "Own|A|1", size + name) + kMifEnd);
    const std::string after = file(
        "new", kMifStart + groupMif(2, "A", "Own|A|1", "Key = 1\n" + wide + longName) + kMifEnd);
    EXPECT_EQ(difference(before, after),
              "A\n"
              "  ~ attribute Size: 'Integer' is now 'Integer64, key'\n"
              "  ~ attribute Name: 'String(8)' is now 'String(64)'\n"
              "2 differences\n");
    CapturedOutput json;
    compareMifFiles(before, after, json.json());
    EXPECT_EQ(json.document()["changes"][1].dump(),
              R"j({"table":"A","change":"changed","row":null,"attribute":"Name",)j"
              R"j("old":"String(8)","new":"String(64)"})j");
}

TEST_F(MifCommandsTest, NamesOfComponentAndTableAreCompared) {
    const std::string one = attributeMif(1, "One", "Integer", "1");
    const std::string before = file("old", kMifStart + groupMif(2, "A", "Own|A|1", one) + kMifEnd);
    const std::string after = file(
        "new", "Start Component\n Name = \"Other\"\n" + groupMif(2, "B", "Own|A|1", one) + kMifEnd);
    EXPECT_EQ(difference(before, after),
              "Component\n"
              "  ~ name: 'Machine' is now 'Other'\n"
              "B\n"
              "  ~ name: 'A' is now 'B'\n"
              "2 differences\n");
    CapturedOutput json;
    compareMifFiles(before, after, json.json());
    EXPECT_EQ(json.document()["changes"][0].dump(),
              R"({"table":null,"change":"changed","row":null,"attribute":null,)"
              R"("old":"Machine","new":"Other"})");
}

TEST_F(MifCommandsTest, DifferencesInJson) {
    EXPECT_EQ(compareMifFiles(fans("old", "{ 1, \"a\", 3 }\n"), fans("new", "{ 1, \"a\", 9 }\n"),
                              output.json()),
              1);
    EXPECT_EQ(output.document().dump(),
              R"({"changes":[{"table":"Fan","change":"changed","row":"a","attribute":"Speed",)"
              R"("old":"3","new":"9"}]})");
}

}  // namespace
}  // namespace sennetctl
