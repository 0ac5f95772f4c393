#include "report/TextTable.h"

#include <gtest/gtest.h>

#include "CapturedOutput.h"

namespace sennetctl {
namespace {

TEST(TextTableTest, ColumnsAreAsWideAsTheirWidestCell) {
    TextTable table({"A", "LONG TITLE", "C"});
    table.addRow({"four", "x", "1"});
    table.addRow({"\xC3\xA9", "y"});
    CapturedOutput output;
    table.print(output.plain());
    EXPECT_EQ(output.text(),
              "A     LONG TITLE  C\n"
              "four  x           1\n"
              "\xC3\xA9     y\n");
}

TEST(TextTableTest, ForeignTextIsHarmless) {
    TextTable table({"A"});
    table.addRow({"\x1B[1m"});
    CapturedOutput output;
    table.print(output.plain());
    EXPECT_EQ(output.text(), "A\n [1m\n");
}

// Aligned, each of the thousand lines would have a hundred thousand octets.
TEST(TextTableTest, OneLongCellDoesNotMakeManyLinesLong) {
    const std::string wide(100000, 'x');
    TextTable table({"A", "B"});
    table.addRow({wide, "1"});
    std::string expected = "A  B\n" + wide + "  1\n";
    for (int i = 0; i < 1000; ++i) {
        table.addRow({"four", "2"});
        expected += "four  2\n";
    }
    CapturedOutput output;
    table.print(output.plain());
    EXPECT_TRUE(output.text() == expected) << output.text().size() << " octets";
}

// 26 + 2 + 26 + 2 + 2 are more than the 50 of the terminal: the long cells get 22 each.
TEST(TextTableTest, LongCellsAreCutToTheWidthOfTheTerminal) {
    const std::string letters = "abcdefghijklmnopqrstuvwxyz";
    TextTable table({"A", "B", "C"}, TextTable::Cells::Fitting);
    table.addRow({letters, letters, "xy"});
    CapturedOutput output;
    Output terminal = output.plain();
    terminal.width = 50;
    table.print(terminal);
    EXPECT_EQ(output.text(),
              "A                       B                       C\n"
              "abcdefghijklmnopqrstu\xE2\x80\xA6  abcdefghijklmnopqrstu\xE2\x80\xA6  xy\n");
}

TEST(TextTableTest, CellsAreWholeWhereTheyFitOrThereIsNoTerminal) {
    const std::string letters = "abcdefghijklmnopqrstuvwxyz";
    TextTable table({"A"}, TextTable::Cells::Fitting);
    table.addRow({letters});
    CapturedOutput output;
    table.print(output.plain());
    EXPECT_EQ(output.text(), "A\n" + letters + "\n");
    CapturedOutput fitting;
    Output terminal = fitting.plain();
    terminal.width = 26;
    table.print(terminal);
    EXPECT_EQ(fitting.text(), output.text());
}

TEST(TextTableTest, CellsAndTitlesStayReadableOnANarrowTerminal) {
    TextTable table({"A TITLE OF 20 LETTER", "B"}, TextTable::Cells::Fitting);
    table.addRow({"x", "abcdefghijklmnopqrstuvwxyz"});
    CapturedOutput output;
    Output terminal = output.plain();
    terminal.width = 10;
    table.print(terminal);
    EXPECT_EQ(output.text(),
              "A TITLE OF 20 LETTER  B\n"
              "x                     abcdefghijklmno\xE2\x80\xA6\n");
}

TEST(TextTableTest, PlacesAndSuchAreNeverCut) {
    TextTable table({"A"});
    table.addRow({"abcdefghijklmnopqrstuvwxyz"});
    CapturedOutput output;
    Output terminal = output.plain();
    terminal.width = 10;
    table.print(terminal);
    EXPECT_EQ(output.text(), "A\nabcdefghijklmnopqrstuvwxyz\n");
}

TEST(TextTableTest, TitlesAreBoldWhereThereAreColours) {
    const TextTable table({"A"});
    CapturedOutput output;
    table.print(output.coloured());
    EXPECT_EQ(output.text(), "\x1B[1mA\x1B[0m\n");
}

}  // namespace
}  // namespace sennetctl
