#include "script/ColumnNames.h"

#include <gtest/gtest.h>

namespace sennetctl {
namespace {

TEST(ColumnNamesTest, ReadableNamesStayWhereTheySuit) {
    ColumnNames names;
    EXPECT_EQ(names.choose("Max Clock Speed"), "Max Clock Speed");
    EXPECT_EQ(names.choose("Eighteen Letters x"), "Eighteen Letters x");
    EXPECT_EQ(names.choose("Size"), "Size");
}

TEST(ColumnNamesTest, LongNamesLoseTheEndsOfTheirLongestWords) {
    ColumnNames names;
    EXPECT_EQ(names.choose("Number Of Enabled Cores"), "Numbe Of Enab Core");
    EXPECT_EQ(names.choose("Abcdefghijklmnopqrstuvwxyz"), "Abcdefghijklmnopqr");
}

TEST(ColumnNamesTest, NamesDifferForEveryProduct) {
    ColumnNames names;
    EXPECT_EQ(names.choose("Name"), "Name");
    EXPECT_EQ(names.choose("NAME"), "NAME 2");
    EXPECT_EQ(names.choose("name"), "name 3");
    EXPECT_EQ(names.choose("Device ID"), "Device ID");
    EXPECT_EQ(names.choose("Dev ID"), "Dev ID 2") << "QVE with Lumo calls both DEV_ID";
    EXPECT_EQ(names.choose("Index"), "Index 2") << "the numbers of rows are called so";
    EXPECT_EQ(names.choose("Row Index"), "Row Index 2") << "for QVE they are called Row_Index";
    EXPECT_EQ(names.choose("Cfg Chg Time"), "Cfg Chg Time 2") << "QVE with Lumo has CFG_CHG_TIME";
}

TEST(ColumnNamesTest, NumberedNamesAreNotLonger) {
    ColumnNames names;
    EXPECT_EQ(names.choose("Eighteen Letters x"), "Eighteen Letters x");
    EXPECT_EQ(names.choose("Eighteen Letters x"), "Eightee Letter x 2");
}

TEST(ColumnNamesTest, NamesThatThereAreAlready) {
    ColumnNames names;
    EXPECT_TRUE(names.take("Fan"));
    EXPECT_FALSE(names.take("FAN"));
    EXPECT_FALSE(names.take("Index"));
    EXPECT_EQ(names.choose("Fan"), "Fan 2");
}

TEST(WithShorterWordsTest, ShortensTheLongest) {
    EXPECT_EQ(withShorterWords("Fans", 13), "Fans");
    EXPECT_EQ(withShorterWords(" Fans   of ", 13), "Fans of");
    EXPECT_EQ(withShorterWords("Disk Space of all", 13), "Dis Spa of al");
    EXPECT_EQ(withShorterWords("a b c d e f g h", 13), "a b c d e f g");
    EXPECT_EQ(withShorterWords("M\xC3\xBCller", 2), "M");
    EXPECT_EQ(withShorterWords("", 2), "");
}

TEST(ReadableNameTest, WordsBeginWithCapitals) {
    EXPECT_EQ(readableName("MaxClockSpeed"), "Max Clock Speed");
    EXPECT_EQ(readableName("DeviceID"), "Device ID");
    EXPECT_EQ(readableName("OSType"), "OS Type");
    EXPECT_EQ(readableName("own_name"), "Own name");
    EXPECT_EQ(readableName(""), "");
}

}  // namespace
}  // namespace sennetctl
