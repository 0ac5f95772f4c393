#include "system/software/UserGroup.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

using Texts = std::vector<std::string>;

TEST(UserGroup, readsGroups) {
    const auto groups = parseUserGroups("root:x:0:\nsudo:!:27:anna, ben,,\nroot:x:5:eve");
    ASSERT_EQ(groups.size(), 2U);
    EXPECT_EQ(groups[0].name, "root");
    EXPECT_EQ(groups[0].groupId, 0U);
    EXPECT_EQ(groups[0].members, Texts{});
    EXPECT_EQ(groups[1].name, "sudo");
    EXPECT_EQ(groups[1].groupId, 27U);
    EXPECT_EQ(groups[1].members, (Texts{"anna", "ben"}));
}

TEST(UserGroup, dropsLinesThatAreNoGroup) {
    for (const char* line : {"", "root", "root:x:0", "root:x:0::", ":x:0:", "a:x::", "a:x:-1:",
                             "a:x:4294967295:", "+:::", "-:::", "# a:x:1:"})
        EXPECT_TRUE(parseUserGroups(line).empty()) << line;
}

}  // namespace
}  // namespace cimomd
