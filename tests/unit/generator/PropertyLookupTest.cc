// Where value, type and qualifiers of a cell come from.

#include "SennetConverter/framework/PropertyLookup.h"

#include <gtest/gtest.h>

#include "ConverterFixture.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

CIMClass fanClass() {
    return cimClass("CIM_Fan", {property("Name", text("default"), {maxLen(64)}),
                                property("Speed", null(CIMTYPE_UINT16))});
}

TEST(PropertyLookup, TakesTheInstancesValueAndTheClassesQualifiers) {
    CIMClass described = fanClass();
    const PropertyLookup lookup(described, "NAME");
    const CIMInstance fan = cimInstance("CIM_Fan", {property("name", text("own"))});
    const ResolvedProperty found = lookup.in(&fan);
    EXPECT_EQ(utf8(found.value.toString()), "own");
    EXPECT_EQ(found.type, CIMTYPE_STRING);
    EXPECT_NE(found.property.findQualifier("MaxLen"), PEG_NOT_FOUND);
    EXPECT_EQ(utf8(lookup.getName().getString()), "NAME");
}

TEST(PropertyLookup, TakesTheInstancesTypeWhereThatDiffers) {
    CIMClass described = fanClass();
    const PropertyLookup lookup(described, "Speed");
    const CIMInstance number = cimInstance("CIM_Fan", {property("Speed", CIMValue(Uint16(7)))});
    const CIMInstance word = cimInstance("CIM_Fan", {property("Speed", text("fast"))});
    EXPECT_EQ(lookup.in(&number).type, CIMTYPE_UINT16);
    EXPECT_EQ(lookup.in(&word).type, CIMTYPE_STRING);
    EXPECT_EQ(utf8(lookup.in(&word).value.toString()), "fast");
    EXPECT_EQ(utf8(lookup.in(&number).value.toString()), "7");
}

TEST(PropertyLookup, TakesTheDefaultOfTheClassWhereTheInstanceHasNone) {
    CIMClass described = fanClass();
    const PropertyLookup lookup(described, "Name");
    const CIMInstance bare = cimInstance("CIM_Fan", {});
    EXPECT_EQ(utf8(lookup.in(&bare).value.toString()), "default");
    EXPECT_EQ(utf8(lookup.in(nullptr).value.toString()), "default");
    const CIMInstance blank = cimInstance("CIM_Fan", {property("Name", null(CIMTYPE_STRING))});
    EXPECT_TRUE(lookup.in(&blank).value.isNull());
}

TEST(PropertyLookup, TakesAllFromAnInstanceWhoseClassDoesNotDeclareIt) {
    CIMClass described = fanClass();
    const PropertyLookup lookup(described, "Extra");
    const CIMInstance fan = cimInstance(
        "CIM_Fan", {property("Extra", CIMValue(Uint8(1)), {textsQualifier("Values", {"a", "b"})})});
    const ResolvedProperty found = lookup.in(&fan);
    EXPECT_EQ(found.type, CIMTYPE_UINT8);
    EXPECT_EQ(utf8(found.value.toString()), "1");
    EXPECT_EQ(found.property.findQualifier("Values"), 0U);
}

TEST(PropertyLookup, GivesANullTextForWhatNobodyHas) {
    CIMClass described = fanClass();
    const PropertyLookup lookup(described, "Extra");
    const CIMInstance bare = cimInstance("CIM_Fan", {});
    for (const CIMInstance* instance : {&bare, static_cast<const CIMInstance*>(nullptr)}) {
        const ResolvedProperty found = lookup.in(instance);
        EXPECT_TRUE(found.property.isUninitialized());
        EXPECT_TRUE(found.value.isNull());
        EXPECT_EQ(found.type, CIMTYPE_STRING);
    }
}

}  // namespace
