#include "files/TextFields.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(TextFields, readsHexadecimalDigits) {
    EXPECT_EQ(parseHexDigits("046d"), 0x046DU);
    EXPECT_EQ(parseHexDigits("FFFFFFFFFFFFFFFF"), UINT64_MAX);
    for (const char* text : {"", "0x1", "-1", "+1", " 1", "1 ", "g", "10000000000000000"})
        EXPECT_FALSE(parseHexDigits(text).has_value()) << text;
}

TEST(TextFields, readsHexadecimalNumbersBehindTheirMark) {
    EXPECT_EQ(parseHexadecimal("0x8086"), 0x8086U);
    for (const char* text : {"", "0x", "8086", "0x-1", "0x0x1"})
        EXPECT_FALSE(parseHexadecimal(text).has_value()) << text;
}

using Parts = std::vector<std::string_view>;

TEST(TextFields, keepsEmptyParts) {
    EXPECT_EQ(partsOf("a::b", ':'), (Parts{"a", "", "b"}));
    EXPECT_EQ(partsOf(":a:", ':'), (Parts{"", "a", ""}));
    EXPECT_EQ(partsOf("a", ':'), Parts{"a"});
    EXPECT_EQ(partsOf("", ':'), Parts{""});
}

}  // namespace
}  // namespace cimomd
