#include "files/BoundedFile.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include "RecordedTree.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

TEST(BoundedFile, readsUpToTheBound) {
    RecordedTree tree;
    tree.file("five", "12345").file("empty", "");
    EXPECT_EQ(readBoundedFile(tree.root / "five", 5).bytes, "12345");
    EXPECT_EQ(readBoundedFile(tree.root / "five", 5).status, FileStatus::Read);
    EXPECT_EQ(readBoundedFile(tree.root / "five", 4).status, FileStatus::TooLong);
    EXPECT_EQ(readBoundedFile(tree.root / "five", 4).bytes, "");
    EXPECT_EQ(readBoundedFile(tree.root / "empty", 0).status, FileStatus::Read);
}

TEST(BoundedFile, readsAFileOfSeveralPiecesWhole) {
    RecordedTree tree;
    std::string text;
    for (int i = 0; i < 200000; ++i)
        text += std::to_string(i % 10);
    tree.file("long", text);
    EXPECT_EQ(readBoundedFile(tree.root / "long", text.size()).bytes, text);
}

TEST(BoundedFile, readsAPart) {
    RecordedTree tree;
    tree.file("five", "12345");
    EXPECT_EQ(readFilePart(tree.root / "five", 0, 3).bytes, "123");
    EXPECT_EQ(readFilePart(tree.root / "five", 1, 2).bytes, "23");
    EXPECT_EQ(readFilePart(tree.root / "five", 3, 9).bytes, "45");
    EXPECT_EQ(readFilePart(tree.root / "five", 5, 9).bytes, "");
    EXPECT_EQ(readFilePart(tree.root / "five", 900, 9).bytes, "");
    EXPECT_EQ(readFilePart(tree.root / "five", UINT64_MAX, 9).bytes, "");
    EXPECT_EQ(readFilePart(tree.root / "five", UINT64_MAX, 9).status, FileStatus::Read);
    EXPECT_EQ(readFilePart(tree.root / "none", 0, 9).status, FileStatus::Absent);
}

TEST(BoundedFile, tellsAbsentFromUnreadable) {
    RecordedTree tree;
    tree.directory("directory").file("file", "");
    ASSERT_EQ(::mkfifo((tree.root / "pipe").c_str(), 0600), 0);
    EXPECT_EQ(readBoundedFile(tree.root / "none", 10).status, FileStatus::Absent);
    EXPECT_EQ(readBoundedFile(tree.root / "file/none", 10).status, FileStatus::Absent);
    EXPECT_EQ(readBoundedFile(tree.root / "directory", 10).status, FileStatus::Unreadable);
    EXPECT_EQ(readBoundedFile(tree.root / "pipe", 10).status, FileStatus::Unreadable);
}

TEST(BoundedFile, neverEndsAnEndlessFile) {
    EXPECT_EQ(readBoundedFile("/dev/zero", 10).status, FileStatus::Unreadable);
}

TEST(TextFile, readsFactsAndNumbers) {
    RecordedTree tree;
    tree.file("text", " abc\n").file("nul", std::string_view("abc\0", 4)).file("blank", "\n");
    tree.file("number", "12\n").file("negative", "-1\n").file("words", "12 kB\n");
    EXPECT_EQ(readFact(tree.root / "text"), "abc");
    EXPECT_EQ(readFact(tree.root / "nul"), "abc");
    EXPECT_EQ(readFact(tree.root / "blank"), std::nullopt);
    EXPECT_EQ(readFact(tree.root / "none"), std::nullopt);
    EXPECT_EQ(readNumber(tree.root / "number"), 12U);
    EXPECT_EQ(readNumber(tree.root / "negative"), std::nullopt);
    EXPECT_EQ(readSignedNumber(tree.root / "negative"), -1);
    EXPECT_EQ(readNumber(tree.root / "words"), std::nullopt);
}

TEST(TextFile, listsNamesInByteOrder) {
    RecordedTree tree;
    tree.file("d/b", "").file("d/a", "").directory("d/B");
    EXPECT_EQ(listDirectory(tree.root / "d"), (std::vector<std::string>{"B", "a", "b"}));
    EXPECT_EQ(listDirectory(tree.root / "none"), std::nullopt);
}

// A part of the names looked like all of them.
TEST(TextFile, listsAllNamesOrNone) {
    RecordedTree tree;
    tree.file("d/a", "").file("d/b", "").file("d/c", "");
    EXPECT_EQ(listDirectory(tree.root / "d", 3), (std::vector<std::string>{"a", "b", "c"}));
    const auto tooMany = listDirectory(tree.root / "d", 2);
    ASSERT_FALSE(tooMany);
    EXPECT_EQ(tooMany.reason(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
