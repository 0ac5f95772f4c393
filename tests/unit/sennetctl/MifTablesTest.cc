#include "mif/MifTables.h"

#include <gtest/gtest.h>

#include "MifTexts.h"
#include "mif/MifDifference.h"
#include "report/CannotRun.h"

namespace sennetctl {
namespace {

constexpr std::size_t kOneMiB = std::size_t(1) << 20;

/// A table of one number in each of so many rows.
std::string numbers(const std::string& attribute, int rows) {
    std::string text = "Start Group Name = \"T\" Class = \"Own|T|001\" Key = 1\n" + attribute +
                       "End Group\nStart Table Name = \"T\" Class = \"Own|T|001\" Id = 2\n";
    for (int i = 1; i <= rows; ++i) {
        text += "{ " + std::to_string(i % 2) + " }\n";
    }
    return kMifStart + text + "End Table\n" + kMifEnd;
}

std::string refusalOf(const std::string& mif) {
    try {
        mifContentOf("f.mif", mif, kOneMiB);
    } catch (const CannotRun& failure) {
        return failure.what();
    }
    return "none";
}

constexpr const char* kTooLarge = "f.mif: its tables are larger than 1 MiB";

TEST(MifTablesTest, NumbersTakeTheRoomOfTheirNames) {
    const auto named = [](std::size_t length) {
        return "Start Attribute Name = \"A\" Id = 1 Type = Integer\nStart Enum 1 = \"" +
               std::string(length, 'x') + "\" End Enum End Attribute\n";
    };
    EXPECT_EQ(refusalOf(numbers(named(700), 2000)), "none");
    EXPECT_EQ(refusalOf(numbers(named(1000), 2000)), kTooLarge);
    EXPECT_EQ(refusalOf(numbers(named(700), 2600)), kTooLarge);
}

TEST(MifTablesTest, EveryRowTakesTheRoomOfTheNamesOfItsColumns) {
    EXPECT_EQ(refusalOf(numbers(attributeMif(1, std::string(400, 'x'), "Integer", "1"), 2000)),
              "none");
    EXPECT_EQ(refusalOf(numbers(attributeMif(1, std::string(600, 'x'), "Integer", "1"), 2000)),
              kTooLarge);
}

// A control character is \u0001 in JSON, and a quotation mark &quot; in HTML.
TEST(MifTablesTest, TextsTakeTheRoomOfTheirLongestForm) {
    const auto withText = [](const std::string& character) {
        std::string text;
        for (int i = 0; i < 200000; ++i) {
            text += character;
        }
        return mifOf(
            groupMif(2, "T", "Own|T|001", attributeMif(1, "A", "String(9)", '"' + text + '"')));
    };
    EXPECT_EQ(refusalOf(withText("x")), "none");
    EXPECT_EQ(refusalOf(withText("\\001")), kTooLarge);
    EXPECT_EQ(refusalOf(withText("\\\"")), kTooLarge);
}

std::string differenceRefusal(const std::string& table, const std::string& row, int columns) {
    const auto content = [&](const std::string& value) {
        std::string attributes =
            "Key = 1\n" + attributeMif(1, "Name", "String(9)", '"' + row + '"');
        for (int i = 2; i <= columns; ++i) {
            attributes += attributeMif(i, "A" + std::to_string(i), "Integer", value);
        }
        return mifContentOf("f.mif", mifOf(groupMif(2, table, "Own|T|001", attributes)));
    };
    try {
        differencesOf(content("1"), content("2"), kOneMiB);
    } catch (const CannotRun& failure) {
        return failure.what();
    }
    return "none";
}

TEST(MifTablesTest, EveryChangeTakesTheRoomOfItsRowAndItsTable) {
    const std::string shortText = "x";
    const std::string longText(5000, 'x');
    EXPECT_EQ(differenceRefusal(shortText, shortText, 300), "none");
    EXPECT_EQ(differenceRefusal(longText, shortText, 300), "the differences are larger than 1 MiB");
    EXPECT_EQ(differenceRefusal(shortText, longText, 300), "the differences are larger than 1 MiB");
    EXPECT_EQ(differenceRefusal(longText, longText, 10), "none");
}

}  // namespace
}  // namespace sennetctl
