#include "system/software/TimeZoneRules.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(TimeZoneRules, readsZonesWithoutDaylightTime) {
    EXPECT_EQ(parseTimeZoneRules("UTC0")->standardName, "UTC");
    EXPECT_EQ(parseTimeZoneRules("UTC0")->standardOffsetMinutes, 0);
    EXPECT_FALSE(parseTimeZoneRules("UTC0")->daylight);
    EXPECT_EQ(parseTimeZoneRules("IST-5:30")->standardOffsetMinutes, 330);
    EXPECT_EQ(parseTimeZoneRules("<-03>3")->standardName, "-03");
    EXPECT_EQ(parseTimeZoneRules("<-03>3")->standardOffsetMinutes, -180);
    EXPECT_EQ(parseTimeZoneRules("<+1245>-12:45")->standardOffsetMinutes, 765);
}

TEST(TimeZoneRules, readsDaylightTime) {
    const auto berlin = parseTimeZoneRules("CET-1CEST,M3.5.0,M10.5.0/3");
    ASSERT_TRUE(berlin && berlin->daylight);
    EXPECT_EQ(berlin->standardName, "CET");
    EXPECT_EQ(berlin->standardOffsetMinutes, 60);
    EXPECT_EQ(berlin->daylight->name, "CEST");
    EXPECT_EQ(berlin->daylight->offsetMinutes, 120);
    ASSERT_TRUE(berlin->daylight->start && berlin->daylight->end);
    EXPECT_EQ(berlin->daylight->start->month, 3);
    EXPECT_EQ(berlin->daylight->start->week, 5);
    EXPECT_EQ(berlin->daylight->start->weekday, 0);
    EXPECT_EQ(berlin->daylight->start->secondOfDay, 7200);
    EXPECT_EQ(berlin->daylight->end->month, 10);
    EXPECT_EQ(berlin->daylight->end->secondOfDay, 10800);
}

TEST(TimeZoneRules, readsUnusualDaylightTime) {
    // Irish summer time is the standard one; Lord Howe shifts by half an hour; Israel counts hours
    // beyond the day's end; elsewhere the change is the day before.
    EXPECT_EQ(parseTimeZoneRules("IST-1GMT0,M10.5.0,M3.5.0/1")->daylight->offsetMinutes, 0);
    EXPECT_EQ(parseTimeZoneRules("<+1030>-10:30<+11>-11,M10.1.0,M4.1.0")->daylight->offsetMinutes,
              660);
    EXPECT_EQ(parseTimeZoneRules("IST-2IDT,M3.4.4/26,M10.5.0")->daylight->start->secondOfDay,
              93600);
    EXPECT_EQ(parseTimeZoneRules("<-02>2<-01>,M3.5.0/-1,M10.5.0/0")->daylight->start->secondOfDay,
              -3600);
    EXPECT_TRUE(parseTimeZoneRules("EST5EDT")->daylight);
    EXPECT_FALSE(parseTimeZoneRules("EST5EDT")->daylight->start);
    EXPECT_FALSE(parseTimeZoneRules("EST5EDT,J60,300")->daylight->start);
    EXPECT_FALSE(parseTimeZoneRules("EST5EDT,M13.1.0,M11.6.0")->daylight->start);
    EXPECT_FALSE(parseTimeZoneRules("EST5EDT,M3.0.0,M11.1.7")->daylight->end);
}

TEST(TimeZoneRules, refusesWhatAreNoRules) {
    for (const char* text :
         {"", "UTC", "0", "AB0", "UTC0x", "UTCx", "<UTC0", "UTC--1", "UTC168", "UTC1:60",
          "UTC1:", "CET-1CEST,M3.5.0,M10.5.0,", "CET-1CE", "UTC99999999999999999999"})
        EXPECT_FALSE(parseTimeZoneRules(text)) << text;
}

}  // namespace
}  // namespace cimomd
