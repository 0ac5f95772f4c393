// What numbers are called, by position and by map.

#include "SennetConverter/mif/ValueNames.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ConverterFixture.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

constexpr Uint64 kLargest = 18446744073709551615ULL;

std::string nameOf(const ValueNames& names, Uint64 number) {
    return utf8(names.nameOf(number));
}

TEST(ValueNames, AreFoundByPositionWithoutAMap) {
    const ValueNames names(strings({"Off", "On"}), strings({}), false);
    EXPECT_EQ(nameOf(names, 0), "Off");
    EXPECT_EQ(nameOf(names, 1), "On");
    EXPECT_EQ(nameOf(names, 2), "2");
    EXPECT_EQ(nameOf(names, 4294967295ULL), "4294967295");
    // Its low word is a position.
    EXPECT_EQ(nameOf(names, 4294967296ULL), "4294967296");
    EXPECT_EQ(nameOf(names, kLargest), "18446744073709551615");
}

TEST(ValueNames, AreFoundByTheMap) {
    const ValueNames names(strings({"Five", "Zero", "Largest"}),
                           strings({"5", "0", "18446744073709551615"}), true);
    EXPECT_EQ(nameOf(names, 5), "Five");
    EXPECT_EQ(nameOf(names, 0), "Zero");
    EXPECT_EQ(nameOf(names, kLargest), "Largest");
    EXPECT_EQ(nameOf(names, 1), "1");
    EXPECT_EQ(nameOf(names, 2), "2");
}

TEST(ValueNames, AreThoseOfTheFirstOfEqualNumbers) {
    const ValueNames names(strings({"first", "second"}), strings({"3", "3"}), true);
    EXPECT_EQ(nameOf(names, 3), "first");
}

TEST(ValueNames, AreNotFoundByOtherSpellingsAndRanges) {
    const ValueNames names(
        strings({"a", "b", "c", "d", "e", "f", "g", "h", "i"}),
        strings({"007", "+1", " 2", "3 ", "-4", "..", "8..9", "18446744073709551616", ""}), true);
    for (const Uint64 number : {0, 1, 2, 3, 4, 7, 8, 9}) {
        EXPECT_EQ(nameOf(names, number), std::to_string(number));
    }
}

TEST(ValueNames, MayBeFewerThanNumbers) {
    const ValueNames names(strings({"One"}), strings({"1", "2"}), true);
    EXPECT_EQ(nameOf(names, 1), "One");
    EXPECT_EQ(nameOf(names, 2), "2");
    EXPECT_EQ(nameOf(ValueNames(strings({}), strings({"1"}), true), 1), "1");
    EXPECT_EQ(nameOf(ValueNames(strings({"One"}), strings({}), true), 0), "0");
}

CIMProperty enumerated(std::initializer_list<const char*> values,
                       std::initializer_list<const char*> map) {
    return property("P", null(CIMTYPE_UINT16),
                    {textsQualifier("ValueMap", map), textsQualifier("Values", values)});
}

std::string cached(ValueNamesCache& cache, const CIMProperty& property, Uint64 number) {
    return nameOf(cache.of(property, property.findQualifier("Values")), number);
}

TEST(ValueNamesCache, GivesEachPropertyItsOwn) {
    const CIMProperty one = enumerated({"One"}, {"1"});
    const CIMProperty two = enumerated({"Two", "One"}, {"2", "1"});
    const CIMProperty bare = property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"x"})});
    ValueNamesCache cache;
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(cached(cache, one, 1), "One");
        EXPECT_EQ(cached(cache, one, 2), "2");
        EXPECT_EQ(cached(cache, two, 2), "Two");
        EXPECT_EQ(cached(cache, bare, 0), "x");
    }
    EXPECT_EQ(&cache.of(one, 1), &cache.of(one, 1));
}

// One and the same array of names may stand with several maps.
TEST(ValueNamesCache, TellsMapsApart) {
    const CIMQualifier values = textsQualifier("Values", {"a", "b"});
    const CIMProperty up =
        property("P", null(CIMTYPE_UINT16), {values, textsQualifier("ValueMap", {"1", "2"})});
    const CIMProperty down =
        property("P", null(CIMTYPE_UINT16), {values, textsQualifier("ValueMap", {"2", "1"})});
    const CIMProperty bare = property("P", null(CIMTYPE_UINT16), {values});
    const CIMProperty noStrings = property("P", null(CIMTYPE_UINT16),
                                           {values, CIMQualifier("ValueMap", CIMValue(Uint16(1)))});
    const CIMProperty nullMap = property(
        "P", null(CIMTYPE_UINT16), {values, CIMQualifier("ValueMap", nullArray(CIMTYPE_STRING))});
    ValueNamesCache cache;
    EXPECT_EQ(cached(cache, up, 1), "a");
    EXPECT_EQ(cached(cache, down, 1), "b");
    EXPECT_EQ(cached(cache, bare, 1), "b");
    EXPECT_EQ(cached(cache, bare, 2), "2");
    EXPECT_EQ(cached(cache, noStrings, 0), "a");
    EXPECT_EQ(cached(cache, nullMap, 0), "0");
}

TEST(ValueNamesCache, KnowsMorePropertiesThanItKeeps) {
    std::vector<CIMProperty> properties;
    for (int i = 0; i < 200; ++i) {
        properties.push_back(enumerated({std::to_string(1000 + i).c_str()}, {"1"}));
    }
    ValueNamesCache cache;
    for (int round = 0; round < 2; ++round) {
        for (int i = 0; i < 200; ++i) {
            EXPECT_EQ(cached(cache, properties[static_cast<std::size_t>(i)], 1),
                      std::to_string(1000 + i));
        }
    }
}

// Properties come and go, and storage is used again.
TEST(ValueNamesCache, DoesNotTakeALaterPropertyForAnEarlierOne) {
    ValueNamesCache cache;
    for (int i = 0; i < 200; ++i) {
        const CIMProperty passing = enumerated({std::to_string(i).c_str()}, {"7"});
        EXPECT_EQ(cached(cache, passing, 7), std::to_string(i));
    }
}

}  // namespace
