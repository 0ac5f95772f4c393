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

TEST(TextTableTest, LongCellsAreCutAndForeignTextIsHarmless) {
    TextTable table({"A"}, 5);
    table.addRow({"abcdefg"});
    table.addRow({"\x1B[1m"});
    CapturedOutput output;
    table.print(output.plain());
    EXPECT_EQ(output.text(), "A\nabcd\xE2\x80\xA6\n [1m\n");
}

TEST(TextTableTest, TitlesAreBoldWhereThereAreColours) {
    const TextTable table({"A"});
    CapturedOutput output;
    table.print(output.coloured());
    EXPECT_EQ(output.text(), "\x1B[1mA\x1B[0m\n");
}

}  // namespace
}  // namespace sennetctl
