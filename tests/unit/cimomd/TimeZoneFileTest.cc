#include "system/software/TimeZoneFile.h"

#include <gtest/gtest.h>

#include "ZoneBytes.h"

namespace cimomd {
namespace {

constexpr std::int64_t kNow = 1700000000;

// Local mean time, then standard time, then daylight time and back.
const std::vector<ZoneType> kTypes{{3208, false}, {3600, false}, {7200, true}};

TEST(TimeZoneFile, readsTheRules) {
    const auto file = parseTimeZoneFile(zoneBytes({{0, false}}, {}, "UTC0"), kNow);
    ASSERT_TRUE(file);
    EXPECT_EQ(file->rules, "UTC0");
    EXPECT_EQ(file->standardSince, std::nullopt);
    EXPECT_EQ(parseTimeZoneFile(zoneBytes({{0, false}}, {}, ""), kNow)->rules, "");
}

TEST(TimeZoneFile, findsWhenStandardTimeBegan) {
    const auto since = [](const std::vector<ZoneChange>& changes) {
        return parseTimeZoneFile(zoneBytes(kTypes, changes, "CET-1CEST"), kNow)->standardSince;
    };
    EXPECT_EQ(since({{-2422054408, 1}}), -2422054408);
    EXPECT_EQ(since({{-2422054408, 1}, {100, 2}, {200, 1}, {300, 2}}), -2422054408);
    EXPECT_EQ(since({{-2422054408, 1}, {100, 0}, {200, 1}}), 200);
    EXPECT_EQ(since({{kNow, 1}}), kNow);
    EXPECT_EQ(since({{kNow + 1, 1}}), std::nullopt);
    EXPECT_EQ(since({{5, 9}}), std::nullopt);
}

TEST(TimeZoneFile, refusesEveryCutFile) {
    const std::string bytes = zoneBytes(kTypes, {{-2422054408, 1}, {100, 2}}, "CET-1CEST");
    ASSERT_TRUE(parseTimeZoneFile(bytes, kNow));
    for (std::size_t length = 0; length < bytes.size(); ++length)
        EXPECT_FALSE(parseTimeZoneFile(bytes.substr(0, length), kNow)) << length;
}

TEST(TimeZoneFile, refusesCountsThatTheFileDoesNotHold) {
    const std::string good = zoneBytes({{0, false}}, {}, "UTC0");
    // Behind both headers' versions stand six counts of four bytes.
    for (const std::size_t header : {std::size_t{0}, good.rfind("TZif")}) {
        for (std::size_t place = header + 20; place < header + 44; place += 4) {
            std::string bytes = good;
            bytes.replace(place, 4, "\xFF\xFF\xFF\xFF");
            EXPECT_FALSE(parseTimeZoneFile(bytes, kNow)) << place;
        }
    }
    std::string withoutTypes = good;
    withoutTypes.replace(good.rfind("TZif") + 36, 4, std::string(4, '\0'));
    EXPECT_FALSE(parseTimeZoneFile(withoutTypes, kNow));
    std::string firstVersion = good;
    firstVersion[4] = '\0';
    EXPECT_FALSE(parseTimeZoneFile(firstVersion, kNow));
    EXPECT_FALSE(parseTimeZoneFile("no zone " + good, kNow));
}

}  // namespace
}  // namespace cimomd
