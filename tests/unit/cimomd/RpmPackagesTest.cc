#include "system/software/RpmPackages.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "system/BoundedCommand.h"

namespace cimomd {
namespace {

const std::filesystem::path kRpm = "/usr/bin/rpm";

std::string listed(std::initializer_list<std::string> fields) {
    std::string record;
    for (const std::string& field : fields)
        record += (record.empty() ? "" : "\x1f") + field;
    return record + "\x1e";
}

TEST(RpmPackages, readsAListing) {
    const auto packages = parseRpmPackages(
        listed({"kernel", "(none)", "5.14.0", "362.8.1.el9_3", "x86_64", "Red Hat, Inc.", "(none)",
                "Unspecified", "4194304", "1700000000", "The Linux kernel"}) +
        listed({"kernel", "(none)", "5.14.0", "427.el9", "x86_64", "(none)", "Somebody", "System",
                "8589934592", "soon", "The Linux kernel\nsecond line"}) +
        listed({"gpg-pubkey", "(none)", "8483c65d", "5ccc5b19", "(none)", "(none)", "K",
                "Public Keys", "0", "1700000000", "a key"}) +
        listed({"bind", "32", "9.16.23", "14.el9", "i686", "V", "P", "G", "no", "-1", ""}));
    ASSERT_EQ(packages.size(), 3U);
    EXPECT_EQ(packages[0].identity, "kernel-5.14.0-362.8.1.el9_3.x86_64");
    EXPECT_EQ(packages[0].version, "5.14.0-362.8.1.el9_3");
    EXPECT_EQ(packages[0].upstreamVersion, "5.14.0");
    EXPECT_EQ(packages[0].manufacturer, "Red Hat, Inc.");
    EXPECT_EQ(packages[0].section, std::nullopt);
    EXPECT_EQ(packages[0].section.reason(), Absence::Filtered);
    EXPECT_EQ(packages[0].installedKB, 4096U);
    EXPECT_EQ(packages[0].installTime, 1700000000);
    EXPECT_EQ(packages[0].summary, "The Linux kernel");
    EXPECT_EQ(packages[1].identity, "kernel-5.14.0-427.el9.x86_64");
    EXPECT_EQ(packages[1].manufacturer, "Somebody");
    EXPECT_EQ(packages[1].section, "System");
    EXPECT_EQ(packages[1].installedKB, 8388608U);
    EXPECT_EQ(packages[1].installTime, std::nullopt);
    EXPECT_EQ(packages[2].version, "32:9.16.23-14.el9");
    EXPECT_EQ(packages[2].installedKB, std::nullopt);
}

TEST(RpmPackages, dropsRecordsThatAreNone) {
    EXPECT_TRUE(parseRpmPackages("").empty());
    EXPECT_TRUE(parseRpmPackages("error: cannot open Packages database\n").empty());
    EXPECT_TRUE(parseRpmPackages(listed({"kernel", "1", "2"})).empty());
}

class RpmDatabaseTest : public testing::Test {
  protected:
    void install(const std::string& name, const std::string& header) {
        const std::string root = tree.root.string();
        tree.file(name + ".spec", "Name: " + name + "\n" + header +
                                      "License: MIT\nBuildArch: noarch\n%description\nx\n%files\n");
        ASSERT_TRUE(outputOf("/usr/bin/rpmbuild",
                             {"-bb", "--define", "_topdir " + root + "/build", "--define",
                              "_rpmdir " + root + "/packages", "--define",
                              "_build_name_fmt " + name + ".rpm", root + "/" + name + ".spec"}));
        ASSERT_TRUE(outputOf(kRpm, {"--dbpath", tree.paths().rpmPackages().string(), "-i",
                                    "--justdb", "--nodeps", root + "/packages/" + name + ".rpm"}));
    }

    RecordedTree tree;
};

TEST_F(RpmDatabaseTest, readsARealDatabase) {
    install("sample",
            "Epoch: 2\nVersion: 1.20.3\nRelease: 4.el9\nSummary: A sample\n"
            "Vendor: Sample Ltd\n");
    install("other", "Version: 7\nRelease: 1\nSummary: Another\n");
    auto packages = readRpmPackages(tree.paths().rpmPackages(), kRpm);
    ASSERT_TRUE(packages);
    ASSERT_EQ(packages->size(), 2U);
    const SoftwarePackage& sample =
        packages->front().name == "sample" ? packages->front() : packages->back();
    EXPECT_EQ(sample.identity, "sample-2:1.20.3-4.el9.noarch");
    EXPECT_EQ(sample.upstreamVersion, "1.20.3");
    EXPECT_EQ(sample.manufacturer, "Sample Ltd");
    EXPECT_EQ(sample.summary, "A sample");
    EXPECT_EQ(sample.installedKB, 0U);
    EXPECT_GT(sample.installTime.value(), 1700000000);
}

TEST_F(RpmDatabaseTest, runsNothingWithoutADatabase) {
    EXPECT_EQ(readRpmPackages(tree.paths().rpmPackages(), kRpm).reason(), Absence::Absent);
    // rpm would have made one.
    EXPECT_FALSE(std::filesystem::exists(tree.paths().rpmPackages()));
}

TEST_F(RpmDatabaseTest, saysWhyADatabaseCannotBeRead) {
    tree.file("var/lib/rpm/rpmdb.sqlite", "this is no database, as its first bytes show\n");
    EXPECT_EQ(readRpmPackages(tree.paths().rpmPackages(), kRpm).reason(), Absence::Unreadable);
    EXPECT_EQ(readRpmPackages(tree.paths().rpmPackages(), tree.root / "none").reason(),
              Absence::Absent);
}

}  // namespace
}  // namespace cimomd
