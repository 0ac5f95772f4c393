#include "providers/software/AccountProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "providers/software/GroupProvider.h"

namespace cimomd {
namespace {

class AccountProviderTest : public testing::Test {
  protected:
    AccountProviderTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    FixedSystemCalls calls;
};

TEST_F(AccountProviderTest, publishesAccounts) {
    // 1700000000 is 0x6553F100, in a little-endian record.
    tree.file("etc/passwd",
              "root:$1$secret:0:0:root:/root:/bin/bash\n"
              "anna:x:1:100:Anna Berg,Room 4:/home/anna:/bin/zsh\nsvc:x:999:999:::\n")
        .file("var/log/lastlog",
              std::string(292, '\0') + std::string("\x00\xF1\x53\x65", 4) + std::string(288, '\0'));
    const AccountProvider provider(tree.paths(), calls);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 3U);
    EXPECT_EQ(textOf(instances[0], "Name"), "root");
    EXPECT_EQ(textOf(instances[0], "LastLogin"), "null");
    const auto& anna = instances[1];
    EXPECT_EQ(textOf(anna, "SystemCreationClassName"), "Velmira_ComputerSystem");
    EXPECT_EQ(textOf(anna, "SystemName"), "node7");
    EXPECT_EQ(textOf(anna, "CreationClassName"), "Velmira_Account");
    EXPECT_EQ(textOf(anna, "Name"), "anna");
    EXPECT_EQ(textOf(anna, "Caption"), "Anna Berg");
    EXPECT_EQ(textOf(anna, "UserID"), "1");
    EXPECT_EQ(textOf(anna, "PrimaryGroupID"), "100");
    EXPECT_EQ(textOf(anna, "Descriptions"), "Anna Berg Room 4 ");
    EXPECT_EQ(textOf(anna, "Host"), "node7 ");
    EXPECT_EQ(textOf(anna, "LastLogin"), "20231114231320.000000+060");
    EXPECT_EQ(textOf(anna, "HomeDirectory"), "/home/anna");
    EXPECT_EQ(textOf(anna, "LoginShell"), "/bin/zsh");
    EXPECT_EQ(textOf(instances[2], "Caption"), "svc");
    for (const char* property : {"Descriptions", "HomeDirectory", "LoginShell", "LastLogin",
                                 "EnabledState", "OperationalStatus"})
        EXPECT_EQ(textOf(instances[2], property), "null") << property;
    expectServesItsClass(provider);
}

TEST_F(AccountProviderTest, tellsNoPassword) {
    tree.file("etc/passwd", "root:$1$secret:0:0:root:/root:/bin/bash\n")
        .file("etc/group", "root:$1$secret:0:\n")
        .file("etc/shadow", "root:$1$secret:19000:0:99999:7:::\n");
    std::vector<Pegasus::CIMInstance> instances =
        all(AccountProvider(tree.paths(), calls).enumerate());
    ASSERT_EQ(instances.size(), 1U);
    instances.push_back(all(GroupProvider(tree.paths()).enumerate()).at(0));
    for (Pegasus::CIMInstance& instance : instances) {
        for (Pegasus::Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
            const auto& value = instance.getProperty(i).getValue();
            EXPECT_EQ(utf8Of(value.toString()).find("secret"), std::string::npos);
        }
    }
}

TEST_F(AccountProviderTest, saysWhyThereAreNoAccounts) {
    EXPECT_EQ(AccountProvider(tree.paths(), calls).enumerate()->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
