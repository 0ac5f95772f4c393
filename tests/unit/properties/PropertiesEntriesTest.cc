// The keys and values of all forms of an entry are tested with PropertiesFile; here, their places.

#include "properties/PropertiesEntries.h"

#include <gtest/gtest.h>

namespace Velm {
namespace {

/// "line:keyColumn:valueColumn key=value" for each entry; "key" alone where nothing separates.
std::string entriesOf(std::string_view text) {
    std::string told;
    PropertiesEntries entries(text);
    while (const std::optional<PropertiesEntry> entry = entries.next()) {
        told += std::to_string(entry->line) + ":" + std::to_string(entry->keyColumn) + ":" +
                std::to_string(entry->valueColumn) + " " + entry->key +
                (entry->hasSeparator ? "=" + entry->value : "") + "\n";
    }
    return told;
}

TEST(PropertiesEntriesTest, PlacesAreCountedFromOne) {
    EXPECT_EQ(entriesOf("a=b\n# c\n\n  d = e\r\nf\n"), "1:1:3 a=b\n4:3:7 d=e\n5:1:1 f\n");
}

TEST(PropertiesEntriesTest, ACarriageReturnAloneEndsALine) {
    EXPECT_EQ(entriesOf("a=b\rc=d\r\ne=f"), "1:1:3 a=b\n2:1:3 c=d\n3:1:3 e=f\n");
}

TEST(PropertiesEntriesTest, AByteOrderMarkIsPartOfTheFirstLine) {
    EXPECT_EQ(entriesOf("\xEF\xBB\xBF"
                        "a=b\nc=d"),
              "1:4:6 a=b\n2:1:3 c=d\n");
}

TEST(PropertiesEntriesTest, AnEntryStandsWhereItBegins) {
    EXPECT_EQ(entriesOf("a=b\\\n  c\\\n  d\ne=f"), "1:1:3 a=bcd\n4:1:3 e=f\n");
    EXPECT_EQ(entriesOf("a\\\n  b = c\nd=e"), "1:1:1 ab=c\n3:1:3 d=e\n");
}

TEST(PropertiesEntriesTest, ACommentDoesNotGoOn) {
    EXPECT_EQ(entriesOf("# a\\\nb=c"), "2:1:3 b=c\n");
}

TEST(PropertiesEntriesTest, EveryTextIsAccepted) {
    EXPECT_EQ(entriesOf(""), "");
    EXPECT_EQ(entriesOf("="), "1:1:2 =\n");
    EXPECT_EQ(entriesOf("\\"), "");
    EXPECT_EQ(entriesOf("a\xFF=\xFE"), "1:1:4 a\xFF=\xFE\n");
}

TEST(PropertiesEntriesTest, TheLastEntryOfAKeyCounts) {
    const auto last = lastEntriesIn("a=b\nc=d\na\n c =e\n");
    ASSERT_EQ(last.size(), 2U);
    EXPECT_EQ(last.at("a").line, 3U);
    EXPECT_FALSE(last.at("a").hasSeparator);
    EXPECT_EQ(last.at("c").value, "e");
    EXPECT_EQ(last.at("c").keyColumn, 2U);
}

}  // namespace
}  // namespace Velm
