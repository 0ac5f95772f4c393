#include "system/software/VersionNumbers.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

using Numbers = std::vector<std::optional<std::uint16_t>>;

Numbers numbersOf(std::string_view version) {
    const VersionNumbers numbers = versionNumbersOf(version);
    return {numbers.major, numbers.minor, numbers.revision, numbers.build};
}

TEST(VersionNumbers, readsUpToFourNumbers) {
    EXPECT_EQ(numbersOf("252"), (Numbers{252, {}, {}, {}}));
    EXPECT_EQ(numbersOf("252.38"), (Numbers{252, 38, {}, {}}));
    EXPECT_EQ(numbersOf("1.2.5.1"), (Numbers{1, 2, 5, 1}));
    EXPECT_EQ(numbersOf("1.2.3.4.5"), (Numbers{1, 2, 3, 4}));
    EXPECT_EQ(numbersOf("0.09"), (Numbers{0, 9, {}, {}}));
}

TEST(VersionNumbers, endsAtTheFirstOtherCharacter) {
    EXPECT_EQ(numbersOf("1.1.1n"), (Numbers{1, 1, 1, {}}));
    EXPECT_EQ(numbersOf("4.2+dfsg.7"), (Numbers{4, 2, {}, {}}));
    EXPECT_EQ(numbersOf("9~rc1"), (Numbers{9, {}, {}, {}}));
    EXPECT_EQ(numbersOf("1..2"), (Numbers{1, {}, {}, {}}));
    EXPECT_EQ(numbersOf("1."), (Numbers{1, {}, {}, {}}));
    EXPECT_EQ(numbersOf("v1.2"), (Numbers{{}, {}, {}, {}}));
    EXPECT_EQ(numbersOf(""), (Numbers{{}, {}, {}, {}}));
}

TEST(VersionNumbers, leavesOutNumbersThatDoNotFit) {
    EXPECT_EQ(numbersOf("65535.65536.7"), (Numbers{65535, {}, 7, {}}));
    EXPECT_EQ(numbersOf("1.3.4.20200120"), (Numbers{1, 3, 4, {}}));
    EXPECT_EQ(versionNumbersOf("1.3.4.20200120").build.reason(), Absence::Filtered);
    EXPECT_EQ(versionNumbersOf("99999999999999999999999").major.reason(), Absence::Filtered);
    EXPECT_EQ(versionNumbersOf("99999999999999999999999").minor.reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
