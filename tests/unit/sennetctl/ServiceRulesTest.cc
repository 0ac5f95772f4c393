#include "script/ServiceRules.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

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

TEST(ServiceRulesTest, NoServiceOrOneOfAnotherUser) {
    EXPECT_FALSE(parseServiceRules(""));
    EXPECT_FALSE(parseServiceRules("nonsense"));
    EXPECT_FALSE(parseServiceRules(with("LoadState=loaded", "LoadState=not-found")));
    EXPECT_FALSE(parseServiceRules(with("User=", "User=inventory")));
    EXPECT_TRUE(parseServiceRules(with("User=", "User=root")));
}

}  // namespace
}  // namespace sennetctl
