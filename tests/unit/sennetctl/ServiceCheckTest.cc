#include "script/ServiceCheck.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>

#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

namespace fs = std::filesystem;

class ServiceCheckTest : public testing::Test {
  protected:
    ServiceCheckTest() { rules.isReadOnly = true; }

    std::string told(const std::string& octets) {
        std::vector<Finding> findings;
        asked.clear();
        checkServiceOutput(
            "c", octets,
            [this](const char* product) {
                asked += product;
                return isThere ? std::make_optional(rules) : std::nullopt;
            },
            findings);
        std::string text;
        for (const Finding& finding : findings) {
            text += std::to_string(finding.line) + ":" + std::to_string(finding.column) + ": " +
                    nameOf(finding.severity) + ": " + finding.message + "\n";
        }
        return text;
    }

    /// A directory that the service is allowed.
    std::string allowed(const std::string& name) {
        const std::string path = directory.path(name);
        fs::create_directory(path);
        rules.writable.push_back(path);
        return path;
    }

    static std::string notRoots(const std::string& service, const std::string& path,
                                const std::string& place) {
        return service + " writes nothing into " + path + ": " + place +
               " is not root's to write, and the service may not pass over that\n";
    }

    support::TempDirectory directory;
    ServiceRules rules;
    bool isThere = true;
    std::string asked;
};

TEST_F(ServiceCheckTest, DirectoriesOfTheServiceItself) {
    EXPECT_EQ(told("mif.directory.SMS=/var/lib/sennet/SMS\nsql.directory=/var/lib/sennet/x/y/\n"),
              "");
    EXPECT_EQ(asked, "") << "nothing has to be known of the service";
}

TEST_F(ServiceCheckTest, DirectoriesThatTheServiceIsNotAllowed) {
    EXPECT_EQ(told("#\nmif.directory.SMS = /srv/own\n"),
              "2:21: note: sennet@SMS.service writes nothing into /srv/own: its ReadWritePaths do "
              "not allow it\n");
    rules.isScheduled = true;
    EXPECT_EQ(told("mif.directory=/var/lib/sennet/../own\n"),
              "1:15: warning: sennet@SMS.service writes nothing into /var/lib/sennet/../own: its "
              "ReadWritePaths do not allow it\n")
        << "once for all products";
    rules.writable = {"/srv/ow", "/srv/own/below"};
    EXPECT_NE(told("mif.directory.SMS=/srv/own\n"), "");
}

TEST_F(ServiceCheckTest, WhatThereIsNoServiceFor) {
    isThere = false;
    EXPECT_EQ(told("mif.directory.QVE=/srv/own\n"), "");
    EXPECT_EQ(asked, "QVE");
}

TEST_F(ServiceCheckTest, WhatServicesCannotUseIsToldElsewhere) {
    EXPECT_EQ(told("mif.directory.SMS=own\nmif.directory.LD=\n"), "");
    const std::string file = directory.write("file", "");
    rules.writable = {file};
    EXPECT_EQ(told("mif.directory.SMS=" + file), "");
}

TEST_F(ServiceCheckTest, DirectoriesThatRootMayNotWriteWithoutItsPrivileges) {
    const std::string path = allowed("own");
    const std::string below = path + "/a/b";
    if (::geteuid() == 0) {
        EXPECT_EQ(told("mif.directory.LD=" + below), "") << "it is root's";
        EXPECT_EQ(::chown(path.c_str(), 65534, 65534), 0);
    }
    EXPECT_EQ(told("mif.directory.LD=" + below),
              "1:18: note: " + notRoots("sennet@LD.service", below, path));
    fs::permissions(path, fs::perms::all);
    EXPECT_EQ(told("mif.directory.LD=" + below), "");
    fs::permissions(path, fs::perms::owner_all);
    rules.isOverriding = true;
    EXPECT_EQ(told("mif.directory.LD=" + below), "");
}

TEST_F(ServiceCheckTest, AnAllowedDirectoryBehindALink) {
    const std::string path = allowed("own");
    fs::permissions(path, fs::perms::all);
    const std::string link = directory.path("link");
    fs::create_directory_symlink(path, link);
    EXPECT_EQ(told("mif.directory.CA=" + link + "/x"), "");
}

// Without ProtectSystem the service sees what others see.
TEST_F(ServiceCheckTest, AServiceThatMayWriteEverywhere) {
    rules.isReadOnly = false;
    const std::string path = directory.path("own");
    fs::create_directory(path);
    fs::permissions(path, fs::perms::all);
    EXPECT_EQ(told("mif.directory.CA=" + path), "");
}

}  // namespace
}  // namespace sennetctl
