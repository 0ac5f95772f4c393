#include "system/software/UserAccount.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

using Texts = std::vector<std::string>;

TEST(UserAccount, readsAccounts) {
    const auto accounts = parseUserAccounts(
        "root:x:0:0:root:/root:/bin/bash\n"
        "anna:$6$hash:1000:1001:Anna Berg, Room 4,,+49 30 1:/home/anna:/bin/zsh\n"
        "nobody:*:65534:65534::/nonexistent:\n"
        "last:x:4294967294:1::/:/bin/sh");
    ASSERT_EQ(accounts.size(), 4U);
    EXPECT_EQ(accounts[0].name, "root");
    EXPECT_EQ(accounts[0].userId, 0U);
    EXPECT_EQ(accounts[0].comments, Texts{"root"});
    EXPECT_EQ(accounts[1].name, "anna");
    EXPECT_EQ(accounts[1].userId, 1000U);
    EXPECT_EQ(accounts[1].groupId, 1001U);
    EXPECT_EQ(accounts[1].comments, (Texts{"Anna Berg", "Room 4", "+49 30 1"}));
    EXPECT_EQ(accounts[1].homeDirectory, "/home/anna");
    EXPECT_EQ(accounts[1].shell, "/bin/zsh");
    EXPECT_EQ(accounts[2].comments, Texts{});
    EXPECT_EQ(accounts[2].shell, std::nullopt);
    EXPECT_EQ(accounts[3].userId, 4294967294U);
}

TEST(UserAccount, dropsLinesThatAreNoAccount) {
    for (const char* line :
         {"", "root", "root:x:0:0:root:/root", "root:x:0:0:root:/root:/bin/sh:more",
          ":x:0:0::/:/bin/sh",
          "a:x::0::/:", "a:x:-1:0::/:", "a:x:0:4294967295::/:", "a:x:99999999999999999999:0::/:",
          "+::::::", "+@admins::::::", "-bad::::::", "#a:x:1:1::/:"})
        EXPECT_TRUE(parseUserAccounts(line).empty()) << line;
}

TEST(UserAccount, takesTheFirstOfEqualNames) {
    const auto accounts = parseUserAccounts("a:x:1:1::/first:\nb:x:1:1::/:\na:x:2:2::/second:\n");
    ASSERT_EQ(accounts.size(), 2U);
    EXPECT_EQ(accounts[0].homeDirectory, "/first");
    EXPECT_EQ(accounts[1].name, "b");
}

// A record of lastlog has 292 bytes: the time in four, the terminal in 32, the host in 256.
std::string loginAt(std::uint32_t time) {
    std::string record(292, '\0');
    for (std::size_t i = 0; i < sizeof time; ++i)
        record[i] = reinterpret_cast<const char*>(&time)[i];
    record.replace(4, 5, "pts/0");
    return record;
}

TEST(UserAccount, readsALastLogin) {
    EXPECT_EQ(parseLastLogin(loginAt(1700000000)), 1700000000);
    EXPECT_EQ(parseLastLogin(loginAt(4000000000)), 4000000000);
    EXPECT_EQ(parseLastLogin(loginAt(0)), std::nullopt);
    EXPECT_EQ(parseLastLogin(loginAt(1700000000).substr(0, 291)), std::nullopt);
    EXPECT_EQ(parseLastLogin(""), std::nullopt);
}

TEST(UserAccount, findsALastLoginBehindHoles) {
    RecordedTree tree;
    tree.file("lastlog", loginAt(1600000000));
    const std::filesystem::path path = tree.root / "lastlog";
    {
        std::ofstream file(path, std::ios::binary | std::ios::in | std::ios::out);
        file.seekp(std::int64_t{292} * 100000000);
        file << loginAt(1700000000);
    }
    EXPECT_EQ(readLastLogin(path, 0), 1600000000);
    EXPECT_EQ(readLastLogin(path, 1000), std::nullopt);
    EXPECT_EQ(readLastLogin(path, 100000000), 1700000000);
    EXPECT_EQ(readLastLogin(path, 4294967294), std::nullopt);
    EXPECT_EQ(readLastLogin(tree.root / "none", 0).reason(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
