#include "system/Fact.h"

#include <gtest/gtest.h>

#include <string>

namespace cimomd {
namespace {

TEST(Fact, keepsAValueOrAReason) {
    const Fact<std::string> known("text");
    EXPECT_TRUE(known);
    EXPECT_EQ(*known, "text");
    EXPECT_EQ(known, "text");
    const Fact<std::string> hidden(Absence::NeedsRoot);
    EXPECT_FALSE(hidden);
    EXPECT_EQ(hidden.reason(), Absence::NeedsRoot);
    EXPECT_EQ(hidden, std::nullopt);
    EXPECT_EQ(hidden.value_or("other"), "other");
    EXPECT_EQ(Fact<int>(std::optional<int>()).reason(), Absence::Absent);
}

TEST(Fact, isConvertedWithItsReason) {
    const auto length = [](const std::string& text) {
        return text.empty() ? std::nullopt : std::optional(text.size());
    };
    EXPECT_EQ(Fact<std::string>("abc").then(length), 3U);
    EXPECT_EQ(Fact<std::string>("").then(length).reason(), Absence::Filtered);
    EXPECT_EQ(Fact<std::string>("").then(length, Absence::Absent).reason(), Absence::Absent);
    EXPECT_EQ(Fact<std::string>(Absence::TimedOut).then(length).reason(), Absence::TimedOut);
}

TEST(Fact, mayComeFromASecondSource) {
    using Text = Fact<std::string>;
    EXPECT_EQ(Text("first").orElse("second"), "first");
    EXPECT_EQ(Text(Absence::Filtered).orElse("second"), "second");
    EXPECT_EQ(Text(Absence::Filtered).orElse(Absence::NeedsRoot).reason(), Absence::Filtered);
    EXPECT_EQ(Text(Absence::Absent).orElse(Absence::NeedsRoot).reason(), Absence::NeedsRoot);
}

}  // namespace
}  // namespace cimomd
