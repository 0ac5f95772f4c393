#include "script/PassedOver.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>

#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

constexpr const char* kConsequence = ", which sennet passes over: files of an earlier run stay\n";

std::string told(const std::string& directory) {
    std::vector<Finding> findings;
    checkPassedOver(directory, findings);
    std::string text;
    for (const Finding& finding : findings) {
        text += finding.file + ": " + nameOf(finding.severity) + ": " + finding.message + "\n";
    }
    return text;
}

TEST(PassedOverTest, FilesAndLinksToThem) {
    const support::TempDirectory directory;
    std::filesystem::create_symlink(directory.write("a.script.inv", ""),
                                    directory.path("b.script.inv"));
    std::filesystem::create_directory(directory.path("scripts"));
    std::filesystem::create_symlink("gone", directory.path("c.script.inv.old"));
    EXPECT_EQ(told(directory.path(".")), "");
}

TEST(PassedOverTest, WhatIsNoFile) {
    const support::TempDirectory directory;
    std::filesystem::create_symlink("gone", directory.path("a.script.inv"));
    std::filesystem::create_symlink("b.script.inv", directory.path("b.script.inv"));
    std::filesystem::create_directory(directory.path("C.SCRIPT.INV"));
    ASSERT_EQ(::mkfifo(directory.path("d.script.inv").c_str(), 0600), 0);
    std::filesystem::create_symlink("/dev/zero", directory.path("e.script.inv"));
    const std::string place = directory.path("x").substr(0, directory.path("x").size() - 2);
    EXPECT_EQ(told(place),
              place + "/C.SCRIPT.INV: warning: a directory" + kConsequence + place +
                  "/a.script.inv: warning: a link that leads nowhere" + kConsequence + place +
                  "/b.script.inv: warning: a link that leads nowhere" + kConsequence + place +
                  "/d.script.inv: warning: a device, pipe or socket" + kConsequence + place +
                  "/e.script.inv: warning: a device, pipe or socket" + kConsequence);
}

TEST(PassedOverTest, ADirectoryThatIsNotThere) {
    const support::TempDirectory directory;
    EXPECT_EQ(told(directory.path("none")), "");
}

}  // namespace
}  // namespace sennetctl
