// Names are made once per spelling, and only of what CIM allows.

#include "xml/NameCache.h"

#include <gtest/gtest.h>

#include <string>

namespace Pegasus {
namespace {

TEST(NameCache, GivesTheSameNameForTheSameSpelling) {
    NameCache names;
    const CIMName* first = names.find("CIM_Thing");
    ASSERT_NE(first, nullptr);
    for (int i = 0; i < 1000; ++i) {
        ASSERT_NE(names.find("Name" + std::to_string(i)), nullptr);
    }
    EXPECT_EQ(names.find("CIM_Thing"), first);
    EXPECT_STREQ(first->getString().getCString(), "CIM_Thing");
}

TEST(NameCache, KeepsTheSpelling) {
    NameCache names;
    EXPECT_STREQ(names.find("abc")->getString().getCString(), "abc");
    EXPECT_STREQ(names.find("ABC")->getString().getCString(), "ABC");
}

TEST(NameCache, RefusesWhatIsNoName) {
    NameCache names;
    for (const char* text : {"", " ", "1a", "a-b", "a b", "Name,"}) {
        EXPECT_EQ(names.find(text), nullptr) << text;
        EXPECT_EQ(names.find(text), nullptr) << text;
    }
    EXPECT_NE(names.find("_\xC3\xA9"), nullptr);
}

}  // namespace
}  // namespace Pegasus
