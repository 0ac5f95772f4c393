#include "system/computer/SmbiosTable.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "SmbiosBytes.h"

namespace cimomd {
namespace {

std::string bytesOf(std::initializer_list<int> values) {
    std::string bytes;
    for (const int value : values)
        bytes += static_cast<char>(value);
    return bytes;
}

TEST(SmbiosEntryPoint, tellsTheVersion) {
    const auto version3 = parseSmbiosEntryPoint(smbiosEntryPoint64(3, 4));
    EXPECT_EQ(version3->majorNumber, 3U);
    EXPECT_EQ(version3->minorNumber, 4U);
    const auto version2 = parseSmbiosEntryPoint(smbiosEntryPoint32(2, 8));
    EXPECT_EQ(version2->majorNumber, 2U);
    EXPECT_EQ(version2->minorNumber, 8U);
}

TEST(SmbiosEntryPoint, refusesWhatIsNone) {
    for (const std::string& bytes :
         {std::string(), std::string("_SM"), std::string("_SM3_"),
          smbiosEntryPoint64(3, 0).substr(0, 8), smbiosEntryPoint32(2, 0).substr(0, 7),
          std::string("_DMI_") + std::string(20, '\0')}) {
        const auto version = parseSmbiosEntryPoint(bytes);
        EXPECT_FALSE(version.has_value());
        EXPECT_EQ(version.reason(), Absence::Unreadable);
    }
}

TEST(SmbiosVersion, isCompared) {
    EXPECT_TRUE((SmbiosVersion{2, 6}.atLeast(2, 6)));
    EXPECT_TRUE((SmbiosVersion{3, 0}.atLeast(2, 6)));
    EXPECT_FALSE((SmbiosVersion{2, 5}.atLeast(2, 6)));
    EXPECT_FALSE((SmbiosVersion{1, 9}.atLeast(2, 6)));
}

TEST(SmbiosStructures, haveFieldsAndTexts) {
    const auto structures = parseSmbiosStructures(
        bytesOf({1, 12, 0x34, 0x12, 1, 2, 3, 0xFE, 0x78, 0x56, 0x34, 0x92}) +
        std::string("Maker\0 Board 7 \0\0", 17) + bytesOf({2, 4, 0, 0, 0, 0}) +
        bytesOf({127, 4, 0, 0, 0, 0}) + bytesOf({9, 4, 0, 0, 0, 0}));
    ASSERT_EQ(structures.size(), 2U);
    const SmbiosStructure& first = structures[0];
    EXPECT_EQ(first.type(), 1);
    EXPECT_EQ(first.handle(), 0x1234);
    EXPECT_EQ(first.length(), 12U);
    EXPECT_EQ(first.byte(7), 0xFE);
    EXPECT_EQ(first.word(8), 0x5678);
    EXPECT_EQ(first.doubleWord(8), 0x92345678U);
    EXPECT_EQ(first.bytes(4, 3), std::string("\x01\x02\x03"));
    EXPECT_EQ(first.text(4), "Maker");
    EXPECT_EQ(first.text(5), "Board 7");
    EXPECT_EQ(structures[1].type(), 2);
}

TEST(SmbiosStructures, haveNoFieldsBeyondTheirLength) {
    const auto structures = parseSmbiosStructures(bytesOf({17, 6, 0, 0, 1, 3}) +
                                                  std::string("Text\0Default string\0\0", 21));
    ASSERT_EQ(structures.size(), 1U);
    const SmbiosStructure& structure = structures[0];
    for (const auto& [found, reason] : {std::pair(structure.text(6), Absence::Absent),
                                        {structure.text(5), Absence::Unreadable}}) {
        EXPECT_EQ(found, std::nullopt);
        EXPECT_EQ(found.reason(), reason);
    }
    EXPECT_EQ(structure.byte(5), 3);
    EXPECT_EQ(structure.byte(6), std::nullopt);
    EXPECT_EQ(structure.word(5), std::nullopt);
    EXPECT_EQ(structure.doubleWord(3), std::nullopt);
    EXPECT_EQ(structure.byte(SIZE_MAX), std::nullopt);
    EXPECT_EQ(structure.bytes(SIZE_MAX, 1), std::nullopt);
    EXPECT_EQ(structure.bytes(5, SIZE_MAX), std::nullopt);
    EXPECT_EQ(structure.byte(6).reason(), Absence::Absent);
}

TEST(SmbiosStructures, tellPlaceholdersFromMissingTexts) {
    const auto structures = parseSmbiosStructures(bytesOf({1, 6, 0, 0, 1, 0}) +
                                                  std::string("To Be Filled By O.E.M.\0\0", 24));
    ASSERT_EQ(structures.size(), 1U);
    EXPECT_EQ(structures[0].text(4).reason(), Absence::Filtered);
    EXPECT_EQ(structures[0].text(5).reason(), Absence::Absent);
}

TEST(SmbiosStructures, endWhereTheBytesDo) {
    const std::string whole = bytesOf({2, 4, 1, 0, 0, 0});
    for (const std::string& rest :
         {std::string(), bytesOf({1}), bytesOf({1, 5, 0}), bytesOf({1, 3, 0, 0, 0, 0}),
          bytesOf({1, 200, 0, 0, 0, 0}), bytesOf({1, 0, 0, 0, 0, 0}), bytesOf({1, 4, 0, 0}),
          bytesOf({1, 4, 0, 0, 'a'}), bytesOf({1, 4, 0, 0, 'a', 0})}) {
        const auto structures = parseSmbiosStructures(whole + rest);
        ASSERT_EQ(structures.size(), 1U);
        EXPECT_EQ(structures[0].handle(), 1);
    }
}

// A last structure without texts may lack the second NUL: the table's length cut it off.
TEST(SmbiosStructures, acceptOneNulByteAtTheVeryEnd) {
    EXPECT_EQ(parseSmbiosStructures(bytesOf({2, 4, 1, 0, 0})).size(), 1U);
}

TEST(SmbiosStructures, areNotMoreThanHandles) {
    std::string bytes;
    for (int i = 0; i < 70000; ++i)
        bytes += bytesOf({2, 4, 0, 0, 0, 0});
    EXPECT_EQ(parseSmbiosStructures(bytes).size(), 65536U);
}

TEST(SmbiosTable, isReadFromTheKernelsFiles) {
    RecordedTree tree;
    recordSmbios(tree, {SmbiosFields(17, 4, 5), SmbiosFields(2, 4, 6), SmbiosFields(17, 4, 7)});
    const auto table = readSmbiosTable(tree.paths());
    ASSERT_TRUE(table.has_value());
    EXPECT_TRUE(table->version.atLeast(3, 2));
    EXPECT_FALSE(table->version.atLeast(3, 3));
    ASSERT_EQ(table->structures.size(), 3U);
    const auto modules = table->ofType(17);
    ASSERT_EQ(modules.size(), 2U);
    EXPECT_EQ(modules[0]->handle(), 5);
    EXPECT_EQ(modules[1]->handle(), 7);
    EXPECT_TRUE(table->ofType(4).empty());
}

TEST(SmbiosTable, saysWhyItIsMissing) {
    RecordedTree tree;
    const std::string entryPoint = "sys/firmware/dmi/tables/smbios_entry_point";
    EXPECT_EQ(readSmbiosTable(tree.paths()).reason(), Absence::Absent);
    tree.file(entryPoint, smbiosEntryPoint64(3, 0));
    EXPECT_EQ(readSmbiosTable(tree.paths()).reason(), Absence::Absent);
    tree.file("sys/firmware/dmi/tables/DMI", std::string((std::size_t{1} << 20) + 1, '\0'));
    EXPECT_EQ(readSmbiosTable(tree.paths()).reason(), Absence::Unreadable);
    tree.file(entryPoint, "nonsense");
    EXPECT_EQ(readSmbiosTable(tree.paths()).reason(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
