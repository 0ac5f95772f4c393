#include "providers/software/GroupProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

TEST(GroupProvider, publishesGroups) {
    RecordedTree tree;
    tree.file("etc/group", "root:x:0:\nsudo:x:27:anna,ben\nlast:x:4294967294:\n");
    const GroupProvider provider(tree.paths());
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 3U);
    EXPECT_EQ(textOf(instances[0], "Members"), "");
    EXPECT_EQ(textOf(instances[1], "CreationClassName"), "Velmira_Group");
    EXPECT_EQ(textOf(instances[1], "Name"), "sudo");
    EXPECT_EQ(textOf(instances[1], "CommonName"), "sudo");
    EXPECT_EQ(textOf(instances[1], "Caption"), "sudo");
    EXPECT_EQ(textOf(instances[1], "GroupID"), "27");
    EXPECT_EQ(textOf(instances[1], "Members"), "anna ben ");
    EXPECT_EQ(textOf(instances[2], "GroupID"), "4294967294");
    expectServesItsClass(provider);
}

TEST(GroupProvider, saysWhyThereAreNoGroups) {
    const RecordedTree tree;
    EXPECT_EQ(GroupProvider(tree.paths()).enumerate()->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
