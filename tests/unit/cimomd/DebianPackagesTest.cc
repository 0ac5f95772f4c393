#include "system/software/DebianPackages.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

const std::filesystem::path kDpkgQuery = "/usr/bin/dpkg-query";

std::string listed(std::initializer_list<std::string> fields) {
    std::string record;
    for (const std::string& field : fields)
        record += (record.empty() ? "" : "\x1f") + field;
    return record + "\x1e";
}

TEST(DebianPackages, readsTheInstalledOnes) {
    const auto packages = parseDebianPackages(
        listed({"installed", "vim", "amd64", "2:9.0.1378-2+deb12u2", "Maintainers <m@example.org>",
                "editors", "3738", "Vi IMproved\tan editor", "1718000000"}) +
        listed({"config-files", "nano", "amd64", "7.2-1", "M", "editors", "1", "gone", ""}) +
        listed({"half-installed", "joe", "amd64", "1", "M", "editors", "1", "broken", ""}) +
        listed({"installed", "odd", "all", "1-2-3", "", "", "many", "", ""}));
    ASSERT_EQ(packages.size(), 2U);
    EXPECT_EQ(packages[0].name, "vim");
    EXPECT_EQ(packages[0].architecture, "amd64");
    EXPECT_EQ(packages[0].identity, "vim:amd64");
    EXPECT_EQ(packages[0].version, "2:9.0.1378-2+deb12u2");
    EXPECT_EQ(packages[0].upstreamVersion, "9.0.1378");
    EXPECT_EQ(packages[0].manufacturer, "Maintainers <m@example.org>");
    EXPECT_EQ(packages[0].section, "editors");
    EXPECT_EQ(packages[0].installedKB, 3738U);
    EXPECT_EQ(packages[0].summary, "Vi IMproved\tan editor");
    EXPECT_EQ(packages[0].installTime, 1718000000);
    EXPECT_EQ(packages[1].upstreamVersion, "1-2");
    EXPECT_EQ(packages[1].manufacturer, std::nullopt);
    EXPECT_EQ(packages[1].section, std::nullopt);
    EXPECT_EQ(packages[1].installedKB, std::nullopt);
    EXPECT_EQ(packages[1].summary, std::nullopt);
    EXPECT_EQ(packages[1].installTime, std::nullopt);
}

TEST(DebianPackages, dropsRecordsThatAreNone) {
    EXPECT_TRUE(parseDebianPackages("").empty());
    EXPECT_TRUE(parseDebianPackages("no database\n").empty());
    EXPECT_TRUE(parseDebianPackages(listed({"installed", "vim", "amd64"})).empty());
    EXPECT_TRUE(parseDebianPackages(listed({"installed", "", "amd64", "1", "M", "s", "1", "t", ""}))
                    .empty());
}

class DebianDatabaseTest : public testing::Test {
  protected:
    std::string package(const std::string& name, const std::string& more) {
        return "Package: " + name + "\nMaintainer: M <m@example.org>\nDescription: d\n" + more +
               "\n";
    }
    void installedAt(const std::string& list, std::int64_t time) {
        const std::string path = "var/lib/dpkg/info/" + list;
        tree.file(path, "/.\n");
        const timespec times[2] = {{time, 0}, {time, 0}};
        ASSERT_EQ(::utimensat(AT_FDCWD, (tree.root / path).c_str(), times, 0), 0);
    }

    RecordedTree tree;
};

TEST_F(DebianDatabaseTest, readsARealDatabase) {
    tree.file("var/lib/dpkg/status",
              package("libc6",
                      "Status: install ok installed\nArchitecture: amd64\n"
                      "Multi-Arch: same\nVersion: 2.36-9\n") +
                  package("libc6",
                          "Status: install ok installed\nArchitecture: i386\n"
                          "Multi-Arch: same\nVersion: 2.36-9\n") +
                  package("hold", "Status: hold ok installed\nArchitecture: all\nVersion: 1\n") +
                  package("gone",
                          "Status: deinstall ok config-files\nArchitecture: all\n"
                          "Version: 1\n"));
    installedAt("libc6:amd64.list", 1700000000);
    installedAt("hold.list", 1600000000);
    const auto packages = readDebianPackages(tree.paths().debianPackages(), kDpkgQuery);
    ASSERT_TRUE(packages);
    ASSERT_EQ(packages->size(), 3U);
    EXPECT_EQ((*packages)[0].name, "hold");
    EXPECT_EQ((*packages)[0].installTime, 1600000000);
    EXPECT_EQ((*packages)[1].identity, "libc6:amd64");
    EXPECT_EQ((*packages)[1].installTime, 1700000000);
    EXPECT_EQ((*packages)[2].identity, "libc6:i386");
    EXPECT_EQ((*packages)[2].installTime, std::nullopt);
}

TEST_F(DebianDatabaseTest, runsNothingWithoutADatabase) {
    tree.file("tool", "#!/bin/sh\ntouch \"$(dirname \"$0\")/ran\"\n");
    std::filesystem::permissions(tree.root / "tool", std::filesystem::perms::owner_all);
    EXPECT_EQ(readDebianPackages(tree.paths().debianPackages(), tree.root / "tool").reason(),
              Absence::Absent);
    EXPECT_FALSE(std::filesystem::exists(tree.root / "ran"));
    tree.file("var/lib/dpkg/status", "");
    EXPECT_TRUE(readDebianPackages(tree.paths().debianPackages(), tree.root / "tool"));
}

TEST_F(DebianDatabaseTest, saysWhyADatabaseCannotBeRead) {
    tree.file("var/lib/dpkg/status", "this is no database\n");
    EXPECT_EQ(readDebianPackages(tree.paths().debianPackages(), kDpkgQuery).reason(),
              Absence::Unreadable);
    EXPECT_EQ(readDebianPackages(tree.paths().debianPackages(), tree.root / "none").reason(),
              Absence::Absent);
}

}  // namespace
}  // namespace cimomd
