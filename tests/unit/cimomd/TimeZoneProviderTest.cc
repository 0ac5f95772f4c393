#include "providers/software/TimeZoneProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "ZoneBytes.h"

namespace cimomd {
namespace {

class TimeZoneProviderTest : public testing::Test {
  protected:
    void link(const std::string& target) {
        tree.directory("etc");
        std::filesystem::create_symlink(target, tree.root / "etc/localtime");
    }
    Pegasus::CIMInstance zone() {
        expectServesItsClass(provider);
        return all(provider.enumerate()).at(0);
    }

    const std::string berlin =
        zoneBytes({{3208, false}, {3600, false}}, {{-2422054408, 1}}, "CET-1CEST,M3.5.0,M10.5.0/3");
    RecordedTree tree;
    FixedSystemCalls calls;
    const TimeZoneProvider provider{tree.paths(), calls};
};

TEST_F(TimeZoneProviderTest, readsAZoneBehindALink) {
    for (const char* target :
         {"/usr/share/zoneinfo/Europe/Berlin", "../usr/share/zoneinfo/Europe/Berlin"}) {
        std::filesystem::remove(tree.root / "etc/localtime");
        link(target);
        tree.file("usr/share/zoneinfo/Europe/Berlin", berlin);
        const auto instance = zone();
        EXPECT_EQ(textOf(instance, "TimeZoneID"), "Europe/Berlin");
        EXPECT_EQ(textOf(instance, "Caption"), "Europe/Berlin");
        // -2422054408 is 31 March 1893, 23:06:32 UTC.
        EXPECT_EQ(textOf(instance, "TimeZoneStartDate"), "18930401000632.000000+060");
        EXPECT_EQ(textOf(instance, "StandardName"), "CET");
        EXPECT_EQ(textOf(instance, "StandardOffset"), "60");
        EXPECT_EQ(textOf(instance, "StandardMonth"), "10");
        EXPECT_EQ(textOf(instance, "StandardDay"), "-1");
        EXPECT_EQ(textOf(instance, "StandardDayOfWeek"), "-1");
        EXPECT_EQ(textOf(instance, "StandardStartInterval"), "00000000030000.000000:000");
        EXPECT_EQ(textOf(instance, "DaylightName"), "CEST");
        EXPECT_EQ(textOf(instance, "DaylightOffset"), "120");
        EXPECT_EQ(textOf(instance, "DaylightMonth"), "3");
        EXPECT_EQ(textOf(instance, "DaylightDay"), "-1");
        EXPECT_EQ(textOf(instance, "DaylightDayOfWeek"), "-1");
        EXPECT_EQ(textOf(instance, "DaylightStartInterval"), "00000000020000.000000:000");
        EXPECT_EQ(textOf(instance, "PosixRules"), "CET-1CEST,M3.5.0,M10.5.0/3");
    }
}

TEST_F(TimeZoneProviderTest, countsWeeksFromTheMonthsBeginning) {
    // The second Sunday of March is the Sunday on or after the 8th; 26 hours are none of a day.
    tree.file("etc/localtime", zoneBytes({{-18000, false}}, {}, "EST5EDT,M3.2.0/26,M11.1.6"))
        .file("etc/timezone", "America/New_York\n");
    const auto instance = zone();
    EXPECT_EQ(textOf(instance, "TimeZoneID"), "America/New_York");
    EXPECT_EQ(textOf(instance, "StandardOffset"), "-300");
    EXPECT_EQ(textOf(instance, "DaylightOffset"), "-240");
    EXPECT_EQ(textOf(instance, "DaylightDay"), "8");
    EXPECT_EQ(textOf(instance, "DaylightDayOfWeek"), "1");
    EXPECT_EQ(textOf(instance, "DaylightStartInterval"), "null");
    EXPECT_EQ(textOf(instance, "StandardDay"), "1");
    EXPECT_EQ(textOf(instance, "StandardDayOfWeek"), "7");
}

TEST_F(TimeZoneProviderTest, knowsZonesThatAlwaysWereTheSame) {
    tree.file("etc/localtime", zoneBytes({{0, false}}, {}, "UTC0"));
    const auto instance = zone();
    EXPECT_EQ(textOf(instance, "TimeZoneID"), "UTC0");
    EXPECT_EQ(textOf(instance, "TimeZoneStartDate"), "00000101000000.000000+720");
    EXPECT_EQ(textOf(instance, "StandardOffset"), "0");
    for (const char* property : {"DaylightName", "DaylightOffset", "DaylightMonth", "StandardMonth",
                                 "StandardDay", "StandardStartInterval"})
        EXPECT_EQ(textOf(instance, property), "null") << property;
}

TEST_F(TimeZoneProviderTest, knowsTheNameOfAZoneItCannotRead) {
    link("/usr/share/zoneinfo/Europe/Berlin");
    EXPECT_EQ(textOf(zone(), "TimeZoneID"), "Europe/Berlin");
    EXPECT_EQ(textOf(zone(), "StandardOffset"), "null");
    tree.file("usr/share/zoneinfo/Europe/Berlin", "no zone");
    EXPECT_EQ(textOf(zone(), "StandardOffset"), "null");
}

TEST_F(TimeZoneProviderTest, saysWhyThereIsNoZone) {
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Absent);
    tree.file("etc/localtime", "no zone");
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
