#include "cim/ValueText.h"

#include <Pegasus/Common/CIMQualifier.h>
#include <gtest/gtest.h>

#include "report/CannotRun.h"

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

class ValueTextTest : public testing::Test {
  protected:
    AnswerRoom room;
    ValueText values{room};
};

TEST_F(ValueTextTest, NumbersHaveTheirNames) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, false));
    EXPECT_EQ(values.shown(CIMValue(Uint16(3)), &declared), "Disabled");
    EXPECT_EQ(values.shown(CIMValue(Uint16(9)), &declared), "9");
    EXPECT_EQ(values.json(CIMValue(Uint16(2)), &declared).dump(),
              R"({"value":2,"text":"Enabled"})");
}

TEST_F(ValueTextTest, ANegativeNumberHasNoName) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_SINT16, false));
    EXPECT_EQ(values.shown(CIMValue(Sint16(-3)), &declared), "-3");
    EXPECT_EQ(values.shown(CIMValue(Sint16(3)), &declared), "Disabled");
}

TEST_F(ValueTextTest, ElementsOfArraysHaveTheirNames) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, true));
    Array<Uint16> numbers;
    numbers.append(3);
    numbers.append(7);
    EXPECT_EQ(values.shown(CIMValue(numbers), &declared), "Disabled, 7");
    EXPECT_EQ(values.json(CIMValue(numbers), &declared).dump(),
              R"({"value":[3,7],"text":["Disabled","7"]})");
}

TEST_F(ValueTextTest, ValuesKeepTheirWholeSize) {
    EXPECT_EQ(values.shown(CIMValue(Uint64(18446744073709551615ULL)), nullptr),
              "18446744073709551615");
    EXPECT_EQ(values.shown(CIMValue(Sint8(-128)), nullptr), "-128");
    EXPECT_EQ(values.json(CIMValue(Uint32(4294967295U)), nullptr).dump(), "4294967295");
    EXPECT_EQ(values.json(CIMValue(Real64(1.5)), nullptr).dump(), "1.5");
}

TEST_F(ValueTextTest, OtherTypesAreShownAsTheyAre) {
    EXPECT_EQ(values.shown(CIMValue(Boolean(true)), nullptr), "true");
    EXPECT_EQ(values.json(CIMValue(Boolean(false)), nullptr).dump(), "false");
    EXPECT_EQ(values.shown(CIMValue(String("a \"b\"")), nullptr), "a \"b\"");
    EXPECT_EQ(values.shown(CIMValue(Char16('x')), nullptr), "x");
    EXPECT_EQ(values.shown(CIMValue(CIMDateTime("20260102030405.000000+060")), nullptr),
              "20260102030405.000000+060");
}

TEST_F(ValueTextTest, NullIsEmptyOrNull) {
    const CIMProperty declared = withNames(CIMValue(CIMTYPE_UINT16, false));
    EXPECT_EQ(values.shown(CIMValue(CIMTYPE_UINT16, false), &declared), "");
    EXPECT_TRUE(values.json(CIMValue(CIMTYPE_STRING, true), nullptr).is_null());
}

/// A property whose number 0 has a name of 1,048,576 octets.
CIMProperty withALongName() {
    Array<String> names;
    names.append(String(std::string(1U << 20U, 'x').c_str()));
    CIMProperty property(CIMName("State"), CIMValue(CIMTYPE_UINT16, true));
    property.addQualifier(CIMQualifier(CIMName("Values"), CIMValue(names)));
    return property;
}

CIMValue zeros(Uint32 count) {
    const Array<Uint16> numbers(count, 0);
    return CIMValue(numbers);
}

TEST_F(ValueTextTest, ALongTextIsCut) {
    Array<String> texts;
    texts.append("abcd");
    texts.append("efgh");
    EXPECT_EQ(values.shown(CIMValue(texts), nullptr, 10), "abcd, efgh");
    EXPECT_EQ(values.shown(CIMValue(texts), nullptr, 9), "abcd, efg...");
    EXPECT_EQ(values.shown(CIMValue(texts), nullptr, 3), "abc...");
    EXPECT_EQ(values.shown(CIMValue(String("a\xC3\xA4")), nullptr, 2), "a...");
}

TEST_F(ValueTextTest, ALongNameIsCut) {
    const CIMProperty declared = withALongName();
    EXPECT_EQ(values.shown(zeros(1), &declared, 4), "xxxx...");
    EXPECT_EQ(values.shown(zeros(5), &declared), std::string(65536, 'x') + "...");
    const CIMProperty named = withNames(CIMValue(CIMTYPE_UINT16, false));
    EXPECT_EQ(values.shown(CIMValue(Uint16(3)), &named, 8), "Disabled");
    EXPECT_EQ(values.shown(CIMValue(Uint16(3)), &named, 7), "Disable...");
}

TEST_F(ValueTextTest, ManyLongNamesFindNoRoom) {
    const CIMProperty declared = withALongName();
    EXPECT_EQ(values.json(zeros(2), &declared)["text"].size(), 2U);
    try {
        values.json(zeros(1000), &declared);
        FAIL() << "a thousand names of 1 MiB are one document";
    } catch (const CannotRun& failure) {
        EXPECT_STREQ(failure.what(), "the answer is too large to show");
    }
}

TEST_F(ValueTextTest, ManyCellsFindNoRoom) {
    const CIMProperty declared = withALongName();
    const auto showTenThousand = [&] {
        const CIMValue value = zeros(1);
        for (int cell = 0; cell < 10000; ++cell) {
            values.shown(value, &declared);
        }
    };
    EXPECT_THROW(showTenThousand(), CannotRun);
}

}  // namespace
}  // namespace sennetctl
