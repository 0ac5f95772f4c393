#include "text/DeviceNameOrder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace cimomd {
namespace {

TEST(DeviceNameOrder, countsAsTheKernelDoes) {
    std::vector<std::string> names{"sdaa",  "nvme10n1", "sdb", "nvme2n1", "sda",
                                   "sda10", "sda2",     "vda", "nvme2n12"};
    std::sort(names.begin(), names.end(), deviceNameLess);
    EXPECT_EQ(names, (std::vector<std::string>{"sda", "sda2", "sda10", "sdb", "vda", "nvme2n1",
                                               "nvme2n12", "nvme10n1", "sdaa"}));
}

TEST(DeviceNameOrder, isStrict) {
    EXPECT_FALSE(deviceNameLess("", ""));
    EXPECT_TRUE(deviceNameLess("", "a"));
    EXPECT_FALSE(deviceNameLess("a", ""));
    EXPECT_FALSE(deviceNameLess("sd1", "sd1"));
    EXPECT_TRUE(deviceNameLess("sd01", "sd1"));
    EXPECT_FALSE(deviceNameLess("sd1", "sd01"));
    EXPECT_TRUE(deviceNameLess("sd00000000000000000000000000009", "sd10"));
    EXPECT_TRUE(deviceNameLess("md9", "md99999999999999999999999999999"));
}

}  // namespace
}  // namespace cimomd
