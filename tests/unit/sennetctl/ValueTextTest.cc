#include "cim/ValueText.h"

#include <Pegasus/Common/CIMQualifier.h>
#include <gtest/gtest.h>

namespace sennetctl {
namespace {

using namespace Pegasus;

/// A property of this type whose numbers 2 and 3 are Enabled and Disabled.
CIMProperty withNames(const CIMValue& typical) {
    Array<String> numbers;
    numbers.append("2");
    numbers.append("3");
    Array<String> names;
    names.append("Enabled");
    names.append("Disabled");
    CIMProperty property(CIMName("State"), typical);
    property.addQualifier(CIMQualifier(CIMName("ValueMap"), CIMValue(numbers)));
    property.addQualifier(CIMQualifier(CIMName("Values"), CIMValue(names)));
    return property;
}

TEST(ValueTextTest, NumbersHaveTheirNames) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, false));
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(Uint16(3)), &declared), "Disabled");
    EXPECT_EQ(values.shown(CIMValue(Uint16(9)), &declared), "9");
    EXPECT_EQ(values.json(CIMValue(Uint16(2)), &declared).dump(),
              R"({"value":2,"text":"Enabled"})");
}

TEST(ValueTextTest, ANegativeNumberHasNoName) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_SINT16, false));
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(Sint16(-3)), &declared), "-3");
    EXPECT_EQ(values.shown(CIMValue(Sint16(3)), &declared), "Disabled");
}

TEST(ValueTextTest, ElementsOfArraysHaveTheirNames) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, true));
    Array<Uint16> numbers;
    numbers.append(3);
    numbers.append(7);
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(numbers), &declared), "Disabled, 7");
    EXPECT_EQ(values.json(CIMValue(numbers), &declared).dump(),
              R"({"value":[3,7],"text":["Disabled","7"]})");
}

TEST(ValueTextTest, ValuesKeepTheirWholeSize) {
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(Uint64(18446744073709551615ULL)), nullptr),
              "18446744073709551615");
    EXPECT_EQ(values.shown(CIMValue(Sint8(-128)), nullptr), "-128");
    EXPECT_EQ(values.json(CIMValue(Uint32(4294967295U)), nullptr).dump(), "4294967295");
    EXPECT_EQ(values.json(CIMValue(Real64(1.5)), nullptr).dump(), "1.5");
}

TEST(ValueTextTest, OtherTypesAreShownAsTheyAre) {
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(Boolean(true)), nullptr), "true");
    EXPECT_EQ(values.json(CIMValue(Boolean(false)), nullptr).dump(), "false");
    EXPECT_EQ(values.shown(CIMValue(String("a \"b\"")), nullptr), "a \"b\"");
    EXPECT_EQ(values.shown(CIMValue(Char16('x')), nullptr), "x");
    EXPECT_EQ(values.shown(CIMValue(CIMDateTime("20260102030405.000000+060")), nullptr),
              "20260102030405.000000+060");
}

TEST(ValueTextTest, NullIsEmptyOrNull) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, false));
    ValueText values;
    EXPECT_EQ(values.shown(CIMValue(CIMTYPE_UINT16, false), &declared), "");
    EXPECT_TRUE(values.json(CIMValue(CIMTYPE_STRING, true), nullptr).is_null());
}

}  // namespace
}  // namespace sennetctl
