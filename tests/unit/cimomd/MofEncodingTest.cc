#include "mof/MofEncoding.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(MofEncoding, decodesUtf16ByItsMark) {
    EXPECT_EQ(utf8TextOf(std::string("\xFF\xFE"
                                     "a\0\xE9\0\x22\x21\x3D\xD8\0\xDE",
                                     12)),
              "a\xC3\xA9\xE2\x84\xA2\xF0\x9F\x98\x80");
    EXPECT_EQ(utf8TextOf(std::string("\xFE\xFF\0a\0\xE9", 6)), "a\xC3\xA9");
}

TEST(MofEncoding, replacesHalfCharacters) {
    EXPECT_EQ(utf8TextOf(std::string("\xFE\xFF\xD8\x3D\0a\xDE\0\xD8\x3D", 10)),
              "\xEF\xBF\xBD"
              "a\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(utf8TextOf(std::string("\xFF\xFE"
                                     "a\0b",
                                     5)),
              "a");
}

TEST(MofEncoding, leavesOtherTextsAlone) {
    for (const char* text : {"", "a", "\xFF", "\xEF\xBB\xBF a", "caf\xE9"})
        EXPECT_EQ(utf8TextOf(text), text);
}

}  // namespace
}  // namespace cimomd
