#include "providers/storage/VolumeStatus.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

using Statuses = std::vector<std::uint16_t>;

Volume array(const std::string& state, const std::string& action, std::uint64_t missing) {
    Volume volume;
    volume.isRaid = true;
    volume.raid.arrayState = state;
    volume.raid.syncAction = action;
    volume.raid.missingDisks = missing;
    return volume;
}

TEST(VolumeStatus, ofAnArray) {
    struct Case {
        Volume volume;
        std::uint16_t status;
        std::uint16_t enabledState;
        Statuses extentStatus;
    };
    for (const Case& expected : std::vector<Case>{{array("clean", "idle", 0), 2, 2, {2}},
                                                  {array("active", "resync", 0), 2, 2, {12}},
                                                  {array("clean", "idle", 1), 3, 2, {6}},
                                                  {array("active", "recover", 1), 3, 2, {6, 11}},
                                                  {array("clean", "reshape", 0), 2, 2, {5}},
                                                  {array("clean", "check", 0), 2, 2, {14}},
                                                  {array("clean", "repair", 0), 2, 2, {14}},
                                                  {array("broken", "idle", 2), 6, 2, {3, 6}},
                                                  {array("inactive", "idle", 0), 10, 3, {2}},
                                                  {array("clear", "idle", 0), 10, 3, {2}}}) {
        SCOPED_TRACE(*expected.volume.raid.arrayState + " " + *expected.volume.raid.syncAction);
        EXPECT_EQ(volumeStatusOf(expected.volume), expected.status);
        EXPECT_EQ(volumeEnabledStateOf(expected.volume), expected.enabledState);
        EXPECT_EQ(extentStatusOf(expected.volume), expected.extentStatus);
    }
}

TEST(VolumeStatus, ofAnArrayThatTellsNothing) {
    Volume volume;
    volume.isRaid = true;
    EXPECT_EQ(volumeStatusOf(volume), 0);
    EXPECT_EQ(volumeEnabledStateOf(volume), std::nullopt);
    EXPECT_EQ(extentStatusOf(volume), Statuses{2});
}

TEST(VolumeStatus, ofTheDeviceMapper) {
    Volume volume;
    EXPECT_EQ(volumeStatusOf(volume), 0);
    EXPECT_EQ(volumeEnabledStateOf(volume), std::nullopt);
    volume.isSuspended = false;
    EXPECT_EQ(volumeStatusOf(volume), 2);
    EXPECT_EQ(volumeEnabledStateOf(volume), 2);
    volume.isSuspended = true;
    EXPECT_EQ(volumeStatusOf(volume), 15);
    EXPECT_EQ(volumeEnabledStateOf(volume), 9);
    EXPECT_EQ(extentStatusOf(volume), Statuses{2});
}

}  // namespace
}  // namespace cimomd
