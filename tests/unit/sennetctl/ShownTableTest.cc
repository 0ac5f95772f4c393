#include "html/ShownTable.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sennetctl {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

Mif::Value number(std::uint64_t magnitude) {
    Mif::Value value;
    value.kind = Mif::Value::Kind::Integer;
    value.magnitude = magnitude;
    return value;
}

Mif::Value text(const std::string& octets) {
    Mif::Value value;
    value.kind = Mif::Value::Kind::Text;
    value.text = octets;
    return value;
}

MifColumn column(const std::string& name, bool isKey = false) {
    return {name, {}, isKey, {}, {}};
}

MifTable table(std::vector<MifColumn> columns, std::vector<std::vector<Mif::Value>> rows) {
    return {"Disk", "Own|Disk|001", std::move(columns), std::move(rows), {}};
}

std::vector<std::string> namesOf(const ShownTable& shown) {
    std::vector<std::string> names;
    for (const ShownColumn& column : shown.columns) {
        names.push_back(column.name);
    }
    return names;
}

// The generator puts the first row behind the others: its values are those of the template, too.
TEST(ShownTableTest, RowsComeInTheOrderOfTheirNumbersWhichAreLeftOut) {
    const ShownTable shown = shownTable(
        table({column("Index", true), column("Name")},
              {{number(2), text("b")}, {number(10), text("j")}, {number(1), text("a")}}));
    EXPECT_THAT(namesOf(shown), ElementsAre("Name"));
    EXPECT_THAT(shown.rows, ElementsAre(ElementsAre("a"), ElementsAre("b"), ElementsAre("j")));
}

TEST(ShownTableTest, RowNumbersMayBePaddedTexts) {
    const ShownTable shown =
        shownTable(table({column("Row_Index", true), column("Name")},
                         {{text("10   "), text("j")}, {text("9    "), text("i")}}));
    EXPECT_THAT(shown.rows, ElementsAre(ElementsAre("i"), ElementsAre("j")));
}

TEST(ShownTableTest, OtherKeysStay) {
    const ShownTable shown = shownTable(table({column("Index"), column("Slot", true)},
                                              {{number(7), number(2)}, {number(1), number(1)}}));
    EXPECT_THAT(namesOf(shown), ElementsAre("Index", "Slot"));
    EXPECT_THAT(shown.rows, ElementsAre(ElementsAre("7", "2"), ElementsAre("1", "1")));
}

TEST(ShownTableTest, ColumnsWithoutAValueAreOnlyNamed) {
    const ShownTable shown = shownTable(
        table({column("Model"), column("Serial"), column("Media")},
              {{text("x"), text(""), Mif::Value()}, {text(""), text("  "), Mif::Value()}}));
    EXPECT_THAT(namesOf(shown), ElementsAre("Model"));
    EXPECT_THAT(shown.emptyColumns, ElementsAre("Serial", "Media"));
    EXPECT_THAT(shown.rows, ElementsAre(ElementsAre("x"), ElementsAre("")));
}

TEST(ShownTableTest, ATableWithoutRowsHasColumnsAndNoneIsEmpty) {
    const ShownTable shown = shownTable(table({column("Model")}, {}));
    EXPECT_THAT(namesOf(shown), ElementsAre("Model"));
    EXPECT_THAT(shown.emptyColumns, IsEmpty());
    EXPECT_THAT(shown.rows, IsEmpty());
}

TEST(ShownTableTest, ColumnsOfNumbers) {
    MifColumn state = column("State");
    state.valueNames = {{2, "Enabled"}};
    const ShownTable shown =
        shownTable(table({column("Size"), column("Text"), column("Serial"), column("Mixed"), state},
                         {{number(5), text("-12"), text("0712"), text("12"), number(2)},
                          {Mif::Value(), text("0"), text("1"), text("x"), number(9)}}));
    EXPECT_TRUE(shown.columns[0].isNumber);
    EXPECT_TRUE(shown.columns[1].isNumber) << "numbers of some products";
    EXPECT_FALSE(shown.columns[2].isNumber) << "no number begins with a zero";
    EXPECT_FALSE(shown.columns[3].isNumber);
    EXPECT_FALSE(shown.columns[4].isNumber) << "some of its numbers have names";
    EXPECT_THAT(shown.rows, ElementsAre(ElementsAre("5", "-12", "0712", "12", "Enabled"),
                                        ElementsAre("", "0", "1", "x", "9")));
}

TEST(ShownTableTest, TheDateThatStandsForNoneIsNoValue) {
    const Mif::Value none = text("19800101000000.000000+000");
    MifColumn date = column("Date");
    date.type.base = Mif::Type::Base::Date;
    MifColumn never = date;
    never.name = "Never";
    const ShownTable shown =
        shownTable(table({column("Text"), date, never},
                         {{none, text("20261121111347.000000+000"), none}, {none, none, none}}));
    EXPECT_THAT(shown.rows,
                ElementsAre(ElementsAre("19800101000000.000000+000", "20261121111347.000000+000"),
                            ElementsAre("19800101000000.000000+000", "")));
    EXPECT_THAT(shown.emptyColumns, ElementsAre("Never"));
}

}  // namespace
}  // namespace sennetctl
