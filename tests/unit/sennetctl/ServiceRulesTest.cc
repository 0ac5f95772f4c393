#include "script/ServiceRules.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

#include "support/ScopedEnvironment.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

// As systemd 252 prints it, the properties in its own order.
constexpr const char* kShipped =
    "User=\nReadWritePaths=\nStateDirectory=sennet\nProtectSystem=strict\n"
    "CapabilityBoundingSet=cap_dac_read_search\nLoadState=loaded\nUnitFileState=static\n"
    "\nLoadState=loaded\nUnitFileState=disabled\n";

std::string with(const std::string& line, const std::string& instead) {
    std::string text = kShipped;
    return text.replace(text.find(line), line.size(), instead);
}

TEST(ServiceRulesTest, TheShippedService) {
    const std::optional<ServiceRules> rules = parseServiceRules(kShipped);
    ASSERT_TRUE(rules);
    EXPECT_TRUE(rules->isReadOnly);
    EXPECT_FALSE(rules->isOverriding);
    EXPECT_FALSE(rules->isScheduled);
    EXPECT_THAT(rules->writable, ElementsAre("/var/lib/sennet"));
}

TEST(ServiceRulesTest, WhatAnAdministratorChanges) {
    EXPECT_THAT(
        parseServiceRules(with("ReadWritePaths=", "ReadWritePaths=/srv/a -/srv/b +/c"))->writable,
        ElementsAre("/srv/a", "/srv/b", "/c", "/var/lib/sennet"));
    EXPECT_THAT(parseServiceRules(with("StateDirectory=sennet", "StateDirectory="))->writable,
                IsEmpty());
    EXPECT_TRUE(
        parseServiceRules(with("cap_dac_read_search", "cap_chown cap_dac_override"))->isOverriding);
    EXPECT_FALSE(parseServiceRules(with("ProtectSystem=strict", "ProtectSystem=full"))->isReadOnly);
    EXPECT_TRUE(parseServiceRules(with("=disabled", "=enabled"))->isScheduled);
    EXPECT_TRUE(parseServiceRules(with("=disabled", "=enabled-runtime"))->isScheduled);
    EXPECT_FALSE(parseServiceRules(with("=static", "=enabled"))->isScheduled)
        << "only the timer runs it";
}

TEST(ServiceRulesTest, SystemctlIsAskedForServiceAndTimer) {
    const support::TempDirectory directory;
    const std::string program = directory.write(
        "systemctl",
        "#!/bin/sh\n[ \"$1 $2 $4 $5\" = 'show -p sennet@CA.service sennet@CA.timer' ] || exit 1\n"
        "printf 'LoadState=loaded\\nReadWritePaths=/srv/a\\n\\nUnitFileState=enabled\\n'\n");
    std::filesystem::permissions(program, std::filesystem::perms::owner_all);
    const support::ScopedEnvironment path("PATH", directory.path(""));
    const std::optional<ServiceRules> rules = askServiceRules("CA");
    ASSERT_TRUE(rules);
    EXPECT_TRUE(rules->isScheduled);
    EXPECT_THAT(rules->writable, ElementsAre("/srv/a"));
    EXPECT_FALSE(askServiceRules("LD"));
}

TEST(ServiceRulesTest, NoServiceOrOneOfAnotherUser) {
    EXPECT_FALSE(parseServiceRules(""));
    EXPECT_FALSE(parseServiceRules("nonsense"));
    EXPECT_FALSE(parseServiceRules(with("LoadState=loaded", "LoadState=not-found")));
    EXPECT_FALSE(parseServiceRules(with("User=", "User=inventory")));
    EXPECT_TRUE(parseServiceRules(with("User=", "User=root")));
}

}  // namespace
}  // namespace sennetctl
