#include "providers/CimTime.h"

#include <gtest/gtest.h>

#include "InstanceText.h"

namespace cimomd {
namespace {

TEST(CimTime, writesLocalTimeWithItsOffset) {
    EXPECT_EQ(utf8Of(cimTimeOf(0, 0)->toString()), "19700101000000.000000+000");
    EXPECT_EQ(utf8Of(cimTimeOf(0, -90)->toString()), "19691231223000.000000-090");
    EXPECT_EQ(utf8Of(cimTimeOf(253402300799, 0)->toString()), "99991231235959.000000+000");
    EXPECT_FALSE(cimTimeOf(253402300800, 0));
    EXPECT_FALSE(cimTimeOf(253402300799, 1));
    EXPECT_FALSE(cimTimeOf(INT64_MAX, 60));
    EXPECT_FALSE(cimTimeOf(0, 1000));
}

}  // namespace
}  // namespace cimomd
