#include "providers/computer/BoardProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

constexpr std::uint8_t kBoard = 2;

std::vector<Board> boardsIn(const std::vector<SmbiosFields>& structures) {
    return boardsOf({{2, 4}, parseSmbiosStructures(smbiosTableOf(structures))});
}

// Version 2.0 has no flags.
TEST(Board, isTheMainOneWhenThereIsNoOther) {
    const auto boards = boardsIn({SmbiosFields(kBoard, 8).text(4, "Maker").text(5, "M-1")});
    ASSERT_EQ(boards.size(), 1U);
    EXPECT_EQ(boards[0].manufacturer, "Maker");
    EXPECT_EQ(boards[0].model, "M-1");
    EXPECT_EQ(boards[0].hosting, true);
    EXPECT_EQ(boards[0].removable, std::nullopt);
    EXPECT_EQ(boardsIn({SmbiosFields(kBoard, 0x0F)}).at(0).hosting, true);
}

TEST(Board, tellsItsFlagsAmongOthers) {
    const auto boards = boardsIn({SmbiosFields(kBoard, 0x0F).byte(9, 0x01),
                                  SmbiosFields(kBoard, 0x0F).byte(9, 0x10).text(0x0A, "Blade 3"),
                                  SmbiosFields(kBoard, 8)});
    ASSERT_EQ(boards.size(), 3U);
    EXPECT_EQ(boards[0].hosting, true);
    EXPECT_EQ(boards[0].hotSwappable, false);
    EXPECT_EQ(boards[1].hosting, false);
    EXPECT_EQ(boards[1].hotSwappable, true);
    EXPECT_EQ(boards[1].location, "Blade 3");
    EXPECT_EQ(boards[1].index, 1U);
    EXPECT_EQ(boards[2].hosting, std::nullopt);
}

TEST(Board, isTakenFromTheKernelWithoutTables) {
    RecordedTree tree;
    EXPECT_EQ(readBoards(tree.paths()).reason(), Absence::Absent);
    tree.file("sys/class/dmi/id/board_name", "X570\n")
        .file("sys/class/dmi/id/board_version", "To be filled by O.E.M.\n")
        .file("sys/class/dmi/id/board_serial", "S-9\n");
    const auto boards = readBoards(tree.paths());
    ASSERT_TRUE(boards.has_value());
    ASSERT_EQ(boards->size(), 1U);
    EXPECT_EQ(boards->at(0).model, "X570");
    EXPECT_EQ(boards->at(0).version.reason(), Absence::Filtered);
    EXPECT_EQ(boards->at(0).serialNumber, "S-9");
    EXPECT_EQ(boards->at(0).hosting, true);
}

TEST(BoardProvider, isCalledByItsTagWithoutAModel) {
    Board board;
    board.index = 2;
    EXPECT_EQ(textOf(BoardProvider::publish(board).instance, "ElementName"), "Board 2");
    board.model = "X570";
    EXPECT_EQ(textOf(BoardProvider::publish(board).instance, "ElementName"), "X570");
}

}  // namespace
}  // namespace cimomd
