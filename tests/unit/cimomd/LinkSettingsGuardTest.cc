// Network drivers that answer, that refuse, and that never answer.

#include "system/network/LinkSettingsGuard.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cerrno>
#include <string_view>

namespace cimomd {
namespace {

using std::chrono::milliseconds;
using Clock = std::chrono::steady_clock;

constexpr SilenceLimits kShort{milliseconds(100), milliseconds(60000), 3};

void scriptedDriver(const char* interfaceName, DriverAnswer& answer) {
    const std::string_view name(interfaceName);
    while (name == "dead0")
        ::pause();
    if (name == "end0")
        ::_exit(0);
    answer.addressError = name == "private0" ? EPERM : 0;
    answer.address = {'\x52', '\x54', '\x00', '\x12', '\x34', '\x56'};
    answer.addressBytes = 6;
    answer.portError = name == "virtual0" ? EOPNOTSUPP : 0;
    answer.port = 3;
}

TEST(LinkSettingsGuard, bringsTheAnswerOfTheDriver) {
    LinkSettingsGuard guard(scriptedDriver);
    const LinkSettings settings = guard.ask("eth0");
    EXPECT_EQ(settings.permanentAddress, "52:54:00:12:34:56");
    EXPECT_EQ(settings.connector, PortConnector::Fibre);
}

TEST(LinkSettingsGuard, tellsWhyThereIsNoAnswer) {
    LinkSettingsGuard guard(scriptedDriver, kShort);
    EXPECT_EQ(guard.ask("private0").permanentAddress.reason(), Absence::NeedsRoot);
    EXPECT_FALSE(guard.ask("private0").permanentAddress.has_value());
    EXPECT_FALSE(guard.ask("virtual0").connector.has_value());
    EXPECT_EQ(guard.ask("virtual0").connector.reason(), Absence::Absent);
    EXPECT_EQ(guard.ask("end0").connector.reason(), Absence::Unreadable);
    EXPECT_FALSE(guard.ask("end0").permanentAddress.has_value());
}

TEST(LinkSettingsGuard, givesUpAtTheDeadlineAndLeavesTheDriverAlone) {
    LinkSettingsGuard guard(scriptedDriver, kShort);
    const auto start = Clock::now();
    EXPECT_EQ(guard.ask("dead0").permanentAddress.reason(), Absence::TimedOut);
    const auto firstEnd = Clock::now();
    EXPECT_GE(firstEnd - start, milliseconds(100));
    EXPECT_LT(firstEnd - start, milliseconds(1900));
    const LinkSettings again = guard.ask("dead0");
    EXPECT_FALSE(again.permanentAddress.has_value() || again.connector.has_value());
    EXPECT_EQ(again.connector.reason(), Absence::TimedOut);
    EXPECT_LT(Clock::now() - firstEnd, milliseconds(100));
    EXPECT_EQ(guard.ask("eth0").connector, PortConnector::Fibre);
}

TEST(LinkSettingsGuard, knowsNothingAboutInterfacesThatDoNotExist) {
    LinkSettingsGuard guard;
    for (const char* name : {"no-such-port", "a-name-longer-than-any-interface-has", ""}) {
        const LinkSettings settings = guard.ask(name);
        EXPECT_FALSE(settings.permanentAddress.has_value()) << name;
        EXPECT_FALSE(settings.connector.has_value()) << name;
        EXPECT_EQ(settings.permanentAddress.reason(), Absence::Absent) << name;
    }
}

}  // namespace
}  // namespace cimomd
