// What the converter base reads from CIM values: integers, value maps and sizes.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ConverterFixture.h"
#include "SennetConverter/framework/CimConverter.h"

namespace {

using namespace Pegasus;
using namespace generatortest;
using Numbers = std::vector<Uint64>;

class ReadingConverter : public CimConverter {
  public:
    using CimConverter::CimConverter;
    void printOutput(CimScriptParser&, Array<CIMClass>&, CimInstanceLists&) override {}
};

class CimConverterValuesTest : public ConverterFixture {
  protected:
    Numbers numbers(const CIMValue& value, CIMType type) {
        const Array<Uint64> found = converter.getUint64Array(value, type);
        Numbers result;
        for (Uint32 i = 0; i < found.size(); ++i) {
            result.push_back(found[i]);
        }
        return result;
    }
    std::string decimal(const CIMValue& value) {
        return utf8(converter.mapInteger(value, value.getType()));
    }
    std::string length(const CIMProperty& described, const char* name = "P") {
        return utf8(converter.getMaxLength(cimClass("CIM_X", {described}), name));
    }
    std::string lengthOf(const CIMValue& value) { return length(property("P", value)); }

    ReadingConverter converter{outputName(), properties, 30};
};

TEST_F(CimConverterValuesTest, KnowsTheIntegerTypes) {
    for (CIMType type : {CIMTYPE_UINT8, CIMTYPE_SINT8, CIMTYPE_UINT16, CIMTYPE_SINT16,
                         CIMTYPE_UINT32, CIMTYPE_SINT32, CIMTYPE_UINT64, CIMTYPE_SINT64}) {
        EXPECT_TRUE(converter.isInteger(type)) << type;
    }
    for (CIMType type : {CIMTYPE_BOOLEAN, CIMTYPE_REAL32, CIMTYPE_REAL64, CIMTYPE_CHAR16,
                         CIMTYPE_STRING, CIMTYPE_DATETIME, CIMTYPE_REFERENCE}) {
        EXPECT_FALSE(converter.isInteger(type)) << type;
    }
}

TEST_F(CimConverterValuesTest, ReadsUnsignedNumbersWhole) {
    EXPECT_EQ(converter.getUint64(CIMValue(Uint8(255)), CIMTYPE_UINT8), 255U);
    EXPECT_EQ(converter.getUint64(CIMValue(Uint16(65535)), CIMTYPE_UINT16), 65535U);
    EXPECT_EQ(converter.getUint64(CIMValue(Uint32(4294967295U)), CIMTYPE_UINT32), 4294967295U);
    EXPECT_EQ(converter.getUint64(CIMValue(Uint64(18446744073709551615U)), CIMTYPE_UINT64),
              18446744073709551615U);
}

TEST_F(CimConverterValuesTest, ClampsNegativeNumbersToZero) {
    EXPECT_EQ(converter.getUint64(CIMValue(Sint8(-1)), CIMTYPE_SINT8), 0U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint16(-300)), CIMTYPE_SINT16), 0U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint32(-5)), CIMTYPE_SINT32), 0U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint64(-5)), CIMTYPE_SINT64), 0U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint8(127)), CIMTYPE_SINT8), 127U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint16(300)), CIMTYPE_SINT16), 300U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint32(70000)), CIMTYPE_SINT32), 70000U);
    EXPECT_EQ(converter.getUint64(CIMValue(Sint64(5000000000)), CIMTYPE_SINT64), 5000000000U);
}

TEST_F(CimConverterValuesTest, ReadsZeroFromOtherTypes) {
    EXPECT_EQ(converter.getUint64(text("7"), CIMTYPE_STRING), 0U);
    EXPECT_EQ(converter.getUint64(CIMValue(true), CIMTYPE_BOOLEAN), 0U);
}

TEST_F(CimConverterValuesTest, ReadsArraysInPlace) {
    EXPECT_EQ(numbers(CIMValue(arrayOf<Sint16>({3, -1, 7})), CIMTYPE_SINT16), (Numbers{3, 0, 7}));
    EXPECT_EQ(numbers(CIMValue(arrayOf<Uint8>({0, 255})), CIMTYPE_UINT8), (Numbers{0, 255}));
    EXPECT_EQ(numbers(CIMValue(arrayOf<Sint8>({-128, 127})), CIMTYPE_SINT8), (Numbers{0, 127}));
    EXPECT_EQ(numbers(CIMValue(arrayOf<Uint16>({65535})), CIMTYPE_UINT16), Numbers{65535});
    EXPECT_EQ(numbers(CIMValue(arrayOf<Uint32>({4294967295U})), CIMTYPE_UINT32),
              Numbers{4294967295U});
    EXPECT_EQ(numbers(CIMValue(arrayOf<Sint32>({-1, 1})), CIMTYPE_SINT32), (Numbers{0, 1}));
    EXPECT_EQ(numbers(CIMValue(arrayOf<Uint64>({18446744073709551615U})), CIMTYPE_UINT64),
              Numbers{18446744073709551615U});
    EXPECT_EQ(numbers(CIMValue(arrayOf<Sint64>({-1, 9})), CIMTYPE_SINT64), (Numbers{0, 9}));
}

TEST_F(CimConverterValuesTest, ReadsNoArrayFromOtherValues) {
    EXPECT_EQ(numbers(nullArray(CIMTYPE_UINT16), CIMTYPE_UINT16), Numbers{});
    EXPECT_EQ(numbers(CIMValue(Uint16(3)), CIMTYPE_UINT16), Numbers{});
    EXPECT_EQ(numbers(CIMValue(strings({"3"})), CIMTYPE_STRING), Numbers{});
    EXPECT_EQ(numbers(CIMValue(arrayOf<Uint16>({})), CIMTYPE_UINT16), Numbers{});
}

TEST_F(CimConverterValuesTest, WritesSmallIntegersInDecimal) {
    EXPECT_EQ(decimal(CIMValue(Uint8(200))), "200");
    EXPECT_EQ(decimal(CIMValue(Sint8(-128))), "-128");
    EXPECT_EQ(decimal(CIMValue(Uint16(65535))), "65535");
    EXPECT_EQ(decimal(CIMValue(Sint16(-32768))), "-32768");
    EXPECT_EQ(decimal(CIMValue(Sint32(-2147483647 - 1))), "-2147483648");
    EXPECT_EQ(decimal(CIMValue(Sint32(2147483647))), "2147483647");
}

TEST_F(CimConverterValuesTest, WritesUint32AsSigned) {
    EXPECT_EQ(decimal(CIMValue(Uint32(2147483647))), "2147483647");
    EXPECT_EQ(decimal(CIMValue(Uint32(2147483648U))), "-2147483648");
    EXPECT_EQ(decimal(CIMValue(Uint32(4294967295U))), "-1");
}

TEST_F(CimConverterValuesTest, WritesTheLowWordOf64Bits) {
    EXPECT_EQ(decimal(CIMValue(Uint64(4294967296U))), "0");
    EXPECT_EQ(decimal(CIMValue(Uint64(4294967295U))), "4294967295");
    EXPECT_EQ(decimal(CIMValue(Uint64(5000000000U))), "705032704");
    EXPECT_EQ(decimal(CIMValue(Sint64(-1))), "-1");
    EXPECT_EQ(decimal(CIMValue(Sint64(4294967295))), "-1");
    EXPECT_EQ(decimal(CIMValue(Sint64(-4294967296))), "0");
    EXPECT_EQ(decimal(CIMValue(Sint64(-2147483649))), "2147483647");
    EXPECT_EQ(decimal(CIMValue(Sint64(2147483648))), "-2147483648");
}

TEST_F(CimConverterValuesTest, WritesNothingForOtherTypes) {
    EXPECT_EQ(decimal(text("7")), "");
    EXPECT_EQ(decimal(CIMValue(true)), "");
}

TEST_F(CimConverterValuesTest, FindsMappedValues) {
    const CIMClass described = cimClass(
        "CIM_X", {property("Mapped", CIMValue(Uint16(1)),
                           {textsQualifier("ValueMap", {"1"}), textsQualifier("vALUES", {"One"})}),
                  property("MapOnly", CIMValue(Uint16(1)), {textsQualifier("ValueMap", {"1"})}),
                  property("Plain", CIMValue(Uint16(1)))});
    EXPECT_TRUE(converter.hasMappedValues(described, "Mapped"));
    EXPECT_TRUE(converter.hasMappedValues(described, "mapped"));
    EXPECT_FALSE(converter.hasMappedValues(described, "MapOnly"));
    EXPECT_FALSE(converter.hasMappedValues(described, "Plain"));
    EXPECT_FALSE(converter.hasMappedValues(described, "Missing"));
}

TEST_F(CimConverterValuesTest, GivesIntegersALength) {
    EXPECT_EQ(lengthOf(null(CIMTYPE_UINT16)), "20");
    EXPECT_EQ(lengthOf(null(CIMTYPE_SINT64)), "20");
    EXPECT_EQ(length(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "255");
    EXPECT_EQ(length(property("P", null(CIMTYPE_UINT16), {textsQualifier("ValueMap", {"1"})})),
              "20");
    EXPECT_EQ(length(property("P", null(CIMTYPE_UINT16), {maxLen(64)})), "20");
}

TEST_F(CimConverterValuesTest, GivesOtherTypesALength) {
    EXPECT_EQ(lengthOf(null(CIMTYPE_DATETIME)), "25");
    EXPECT_EQ(lengthOf(null(CIMTYPE_BOOLEAN)), "32");
    EXPECT_EQ(lengthOf(null(CIMTYPE_REAL32)), "32");
    EXPECT_EQ(lengthOf(null(CIMTYPE_REAL64)), "32");
    EXPECT_EQ(lengthOf(null(CIMTYPE_CHAR16)), "32");
    EXPECT_EQ(lengthOf(null(CIMTYPE_REFERENCE)), "32");
}

TEST_F(CimConverterValuesTest, PassesOverAMaxLenThatIsNoNumber) {
    Array<Uint32> numbers;
    numbers.append(7);
    const auto with = [](const CIMValue& value) {
        return property("P", null(CIMTYPE_STRING), {CIMQualifier(CIMName("MaxLen"), value)});
    };
    EXPECT_EQ(length(with(CIMValue(numbers))), "255");
    EXPECT_EQ(length(with(CIMValue(String("12")))), "255");
    EXPECT_EQ(length(with(CIMValue(Boolean(true)))), "255");
}

TEST_F(CimConverterValuesTest, GivesStringsTheirMaxLen) {
    EXPECT_EQ(lengthOf(null(CIMTYPE_STRING)), "255");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING), {maxLen(64)})), "64");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING), {maxLen(1024)})), "1024");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING),
                              {CIMQualifier(CIMName("MAXLEN"), CIMValue(Uint64(12)))})),
              "12");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING), {maxLen(4294967295U)})), "255");
}

TEST_F(CimConverterValuesTest, StopsLookingAtQualifiersAtValues) {
    EXPECT_EQ(
        length(property("P", null(CIMTYPE_STRING), {maxLen(64), textsQualifier("Values", {"A"})})),
        "64");
    EXPECT_EQ(
        length(property("P", null(CIMTYPE_STRING), {textsQualifier("Values", {"A"}), maxLen(64)})),
        "255");
}

TEST_F(CimConverterValuesTest, GivesArraysAndUnknownNames255) {
    EXPECT_EQ(lengthOf(nullArray(CIMTYPE_UINT16)), "255");
    EXPECT_EQ(length(property("P", nullArray(CIMTYPE_STRING), {maxLen(64)})), "255");
    EXPECT_EQ(length(property("P", null(CIMTYPE_BOOLEAN)), "Missing"), "255");
}

TEST_F(CimConverterValuesTest, LooksUpNamesWithUnderscores) {
    EXPECT_EQ(length(property("Free_Space", null(CIMTYPE_STRING), {maxLen(10)}), "Free Space"),
              "10");
}

TEST_F(CimConverterValuesTest, LetsASizeOverrideEveryRule) {
    properties.set("CIM_X.P.Size", "500");
    properties.set("CIM_X.Missing.Size", "as it stands");
    properties.set("CIM_X.Free_Space.Size", "7");
    EXPECT_EQ(lengthOf(null(CIMTYPE_UINT16)), "500");
    EXPECT_EQ(lengthOf(nullArray(CIMTYPE_STRING)), "500");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING), {maxLen(64)})), "500");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING)), "Missing"), "as it stands");
    EXPECT_EQ(length(property("P", null(CIMTYPE_STRING)), "Free Space"), "7");
}

TEST_F(CimConverterValuesTest, TakesASizeOfThisClassOnly) {
    properties.set("CIM_Y.P.Size", "500");
    EXPECT_EQ(lengthOf(null(CIMTYPE_UINT16)), "20");
}

}  // namespace
