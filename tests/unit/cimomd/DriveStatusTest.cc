#include "providers/storage/DriveStatus.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(DriveStatus, followsTheDriversWord) {
    for (const char* word : {"running", "live"}) {
        EXPECT_EQ(driveStatusOf(std::string(word)), 2) << word;
        EXPECT_EQ(driveEnabledStateOf(std::string(word)), 2) << word;
    }
    for (const char* word : {"offline", "transport-offline", "dead"}) {
        EXPECT_EQ(driveStatusOf(std::string(word)), 6) << word;
        EXPECT_EQ(driveEnabledStateOf(std::string(word)), 6) << word;
    }
    for (const char* word : {"blocked", "quiesce", "resetting", "new word"}) {
        EXPECT_EQ(driveStatusOf(std::string(word)), 1) << word;
        EXPECT_EQ(driveEnabledStateOf(std::string(word)), 2) << word;
    }
}

TEST(DriveStatus, isUnknownWithoutAWord) {
    EXPECT_EQ(driveStatusOf(Absence::NeedsRoot), 0);
    EXPECT_EQ(driveEnabledStateOf(Absence::NeedsRoot).reason(), Absence::NeedsRoot);
}

}  // namespace
}  // namespace cimomd
