#include "Velm/Properties.h"

#include <gtest/gtest.h>

#include <utility>

namespace Velm {
namespace {

TEST(Properties, EmptySetHasNoValue) {
    const Properties properties;
    EXPECT_EQ(properties.getPropertyValue("key"), nullptr);
    EXPECT_EQ(properties.getPropertyValue(""), nullptr);
}

TEST(Properties, NullKeyHasNoValue) {
    Properties properties;
    properties.set("", "value of the empty key");
    EXPECT_EQ(properties.getPropertyValue(nullptr), nullptr);
    EXPECT_STREQ(properties.getPropertyValue(""), "value of the empty key");
}

TEST(Properties, KeysAreComparedExactly) {
    Properties properties;
    properties.set("title.Cpu", "Processor");
    EXPECT_STREQ(properties.getPropertyValue("title.Cpu"), "Processor");
    EXPECT_EQ(properties.getPropertyValue("title.cpu"), nullptr);
    EXPECT_EQ(properties.getPropertyValue("title.Cpu "), nullptr);
    EXPECT_EQ(properties.getPropertyValue("title"), nullptr);
}

TEST(Properties, AnEmptyValueIsNotAnAbsentOne) {
    Properties properties;
    properties.set("key", "");
    EXPECT_STREQ(properties.getPropertyValue("key"), "");
}

TEST(Properties, TheLastSetWins) {
    Properties properties;
    properties.set("key", "first");
    properties.set("key", "second");
    EXPECT_STREQ(properties.getPropertyValue("key"), "second");
}

TEST(Properties, ACopyStandsAlone) {
    Properties original;
    original.set("key", "old");
    const Properties copy(original);
    original.set("key", "new");
    original.set("other", "x");
    EXPECT_STREQ(copy.getPropertyValue("key"), "old");
    EXPECT_EQ(copy.getPropertyValue("other"), nullptr);
}

TEST(Properties, ATextOutlivesTheCopyItWasAskedOf) {
    Properties original;
    original.set("key", "value");
    const char* text = nullptr;
    {
        const Properties copy(original);
        text = copy.getPropertyValue("key");
    }
    EXPECT_STREQ(text, "value");
}

TEST(Properties, AMovedFromSetIsEmptyAndCanBeFilled) {
    Properties source;
    source.set("key", "value");
    const Properties target(std::move(source));
    source = Properties();
    EXPECT_EQ(source.getPropertyValue("key"), nullptr);
    source.set("key", "again");
    EXPECT_STREQ(source.getPropertyValue("key"), "again");
    EXPECT_STREQ(target.getPropertyValue("key"), "value");
}

}  // namespace
}  // namespace Velm
