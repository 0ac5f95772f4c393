#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>
#include <type_traits>

namespace Pegasus {
namespace {

template <class T>
struct Sample;

template <>
struct Sample<Boolean> {
    static constexpr CIMType kType = CIMTYPE_BOOLEAN;
    static Boolean value() { return true; }
    static const char* text() { return "TRUE"; }
};

#define SENNET_NUMBER_SAMPLE(Type, cimType, number, numberText) \
    template <>                                                 \
    struct Sample<Type> {                                       \
        static constexpr CIMType kType = cimType;               \
        static Type value() { return number; }                  \
        static const char* text() { return numberText; }        \
    }

SENNET_NUMBER_SAMPLE(Uint8, CIMTYPE_UINT8, 255, "255");
SENNET_NUMBER_SAMPLE(Sint8, CIMTYPE_SINT8, -128, "-128");
SENNET_NUMBER_SAMPLE(Uint16, CIMTYPE_UINT16, 65535, "65535");
SENNET_NUMBER_SAMPLE(Sint16, CIMTYPE_SINT16, -32768, "-32768");
SENNET_NUMBER_SAMPLE(Uint32, CIMTYPE_UINT32, 4294967295U, "4294967295");
SENNET_NUMBER_SAMPLE(Sint32, CIMTYPE_SINT32, std::numeric_limits<Sint32>::min(), "-2147483648");
SENNET_NUMBER_SAMPLE(Uint64, CIMTYPE_UINT64, std::numeric_limits<Uint64>::max(),
                     "18446744073709551615");
SENNET_NUMBER_SAMPLE(Sint64, CIMTYPE_SINT64, std::numeric_limits<Sint64>::min(),
                     "-9223372036854775808");
SENNET_NUMBER_SAMPLE(Real32, CIMTYPE_REAL32, 0.1F, "1.0000000149011612e-01");
SENNET_NUMBER_SAMPLE(Real64, CIMTYPE_REAL64, 1.5, "1.5000000000000000e+00");

#undef SENNET_NUMBER_SAMPLE

template <>
struct Sample<Char16> {
    static constexpr CIMType kType = CIMTYPE_CHAR16;
    static Char16 value() { return Char16(0x20AC); }
    static const char* text() { return "\\x20AC"; }
};

template <>
struct Sample<String> {
    static constexpr CIMType kType = CIMTYPE_STRING;
    static String value() { return "some text"; }
    static const char* text() { return "some text"; }
};

template <>
struct Sample<CIMDateTime> {
    static constexpr CIMType kType = CIMTYPE_DATETIME;
    static CIMDateTime value() { return CIMDateTime("20050615123456.123456+120"); }
    static const char* text() { return "20050615123456.123456+120"; }
};

template <>
struct Sample<CIMObjectPath> {
    static constexpr CIMType kType = CIMTYPE_REFERENCE;
    static CIMObjectPath value() { return CIMObjectPath("root/x:B.k=\"v\""); }
    static const char* text() { return "root/x:B.k=\"v\""; }
};

template <>
struct Sample<CIMObject> {
    static constexpr CIMType kType = CIMTYPE_OBJECT;
    static CIMObject value() { return CIMObject(CIMClass("C")); }
    static const char* text() { return "<CLASS NAME=\"C\"></CLASS>"; }
};

template <>
struct Sample<CIMInstance> {
    static constexpr CIMType kType = CIMTYPE_INSTANCE;
    static CIMInstance value() { return CIMInstance("C"); }
    static const char* text() { return "<INSTANCE CLASSNAME=\"C\"></INSTANCE>"; }
};

template <class T>
class CIMValueTypesTest : public testing::Test {};

using AllTypes =
    testing::Types<Boolean, Uint8, Sint8, Uint16, Sint16, Uint32, Sint32, Uint64, Sint64, Real32,
                   Real64, Char16, String, CIMDateTime, CIMObjectPath, CIMObject, CIMInstance>;
TYPED_TEST_SUITE(CIMValueTypesTest, AllTypes);

TYPED_TEST(CIMValueTypesTest, HoldsAScalar) {
    const CIMValue value(Sample<TypeParam>::value());
    EXPECT_EQ(value.getType(), Sample<TypeParam>::kType);
    EXPECT_FALSE(value.isArray());
    EXPECT_FALSE(value.isNull());
    EXPECT_EQ(value.getArraySize(), 0U);
    EXPECT_EQ(value.toString(), Sample<TypeParam>::text());
    TypeParam out{};
    value.get(out);
    EXPECT_EQ(CIMValue(out).toString(), Sample<TypeParam>::text());
}

TYPED_TEST(CIMValueTypesTest, HoldsAnArray) {
    const CIMValue value(Array<TypeParam>(2, Sample<TypeParam>::value()));
    EXPECT_EQ(value.getType(), Sample<TypeParam>::kType);
    EXPECT_TRUE(value.isArray());
    EXPECT_FALSE(value.isNull());
    EXPECT_EQ(value.getArraySize(), 2U);
    const std::string text = Sample<TypeParam>::text();
    EXPECT_EQ(value.toString(), (text + " " + text + " ").c_str());
    Array<TypeParam> out;
    value.get(out);
    EXPECT_EQ(out.size(), 2U);
    EXPECT_TRUE(CIMValue(Array<TypeParam>()).toString() == "");
    EXPECT_FALSE(CIMValue(Array<TypeParam>()).isNull());
}

TYPED_TEST(CIMValueTypesTest, IsSet) {
    CIMValue value;
    value.set(Sample<TypeParam>::value());
    EXPECT_EQ(value.getType(), Sample<TypeParam>::kType);
    EXPECT_FALSE(value.isArray());
    EXPECT_FALSE(value.isNull());
    value.set(Array<TypeParam>(1, Sample<TypeParam>::value()));
    EXPECT_TRUE(value.isArray());
    EXPECT_EQ(value.getArraySize(), 1U);
    value.setNullValue(Sample<TypeParam>::kType, false);
    EXPECT_TRUE(value.isNull());
    EXPECT_FALSE(value.isArray());
}

TYPED_TEST(CIMValueTypesTest, LeavesAScalarAndEmptiesAnArrayWhenNull) {
    const CIMValue scalar(Sample<TypeParam>::kType, false);
    TypeParam out = Sample<TypeParam>::value();
    scalar.get(out);
    EXPECT_EQ(CIMValue(out).toString(), Sample<TypeParam>::text());
    EXPECT_EQ(scalar.toString(), "");
    const CIMValue array(Sample<TypeParam>::kType, true);
    Array<TypeParam> elements(2, Sample<TypeParam>::value());
    array.get(elements);
    EXPECT_EQ(elements.size(), 0U);
    EXPECT_EQ(array.toString(), "");
}

TYPED_TEST(CIMValueTypesTest, RefusesToBeTakenForAnotherType) {
    const CIMValue scalar(Sample<TypeParam>::value());
    const CIMValue array(Array<TypeParam>(1, Sample<TypeParam>::value()));
    TypeParam out = Sample<TypeParam>::value();
    Array<TypeParam> elements(3, out);
    EXPECT_THROW(scalar.get(elements), TypeMismatchException);
    EXPECT_THROW(array.get(out), TypeMismatchException);
    EXPECT_EQ(elements.size(), 3U);
    using Other = std::conditional_t<std::is_same_v<TypeParam, Uint32>, Sint32, Uint32>;
    Other other = 77;
    EXPECT_THROW(scalar.get(other), TypeMismatchException);
    EXPECT_THROW(CIMValue(Sample<TypeParam>::kType, false).get(other), TypeMismatchException);
    EXPECT_EQ(other, 77U);
    Array<Other> others(1, other);
    EXPECT_THROW(CIMValue(Sample<TypeParam>::kType, true).get(others), TypeMismatchException);
    EXPECT_EQ(others.size(), 1U);
}

TEST(CIMValueTest, IsANullBooleanByDefault) {
    const CIMValue value;
    EXPECT_TRUE(value.isNull());
    EXPECT_EQ(value.getType(), CIMTYPE_BOOLEAN);
    EXPECT_FALSE(value.isArray());
}

TEST(CIMValueTest, KeepsTheSizeOfANullArray) {
    EXPECT_EQ(CIMValue(CIMTYPE_UINT8, true, 5).getArraySize(), 5U);
    EXPECT_EQ(CIMValue(CIMTYPE_UINT8, true).getArraySize(), 0U);
    EXPECT_EQ(CIMValue(CIMTYPE_UINT8, false, 5).getArraySize(), 0U);
}

TEST(CIMValueTest, IsMadeOfNothingThatMerelyConverts) {
    static_assert(!std::is_constructible_v<CIMValue, const char*>);
    static_assert(!std::is_constructible_v<CIMValue, const char(&)[5]>);
    static_assert(!std::is_constructible_v<CIMValue, char>);
    static_assert(!std::is_constructible_v<CIMValue, CIMType>);
    static_assert(!std::is_constructible_v<CIMValue, std::nullptr_t>);
    EXPECT_EQ(CIMValue(true).getType(), CIMTYPE_BOOLEAN);
    EXPECT_EQ(CIMValue(3).getType(), CIMTYPE_SINT32);
}

TEST(CIMValueTest, WritesRealsWithSeventeenDigits) {
    EXPECT_EQ(CIMValue(Real64(0)).toString(), "0.0000000000000000e+00");
    EXPECT_EQ(CIMValue(-2.0).toString(), "-2.0000000000000000e+00");
    EXPECT_EQ(CIMValue(1e300).toString(), "1.0000000000000001e+300");
    EXPECT_EQ(CIMValue(Real32(0.5)).toString(), "5.0000000000000000e-01");
    EXPECT_EQ(CIMValue(Array<Real64>(1, 100.0)).toString(), "1.0000000000000000e+02 ");
}

TEST(CIMValueTest, WritesChar16) {
    EXPECT_EQ(CIMValue(Char16('x')).toString(), "x");
    EXPECT_EQ(CIMValue(Char16(1)).toString(), "\x01");
    EXPECT_EQ(CIMValue(Char16(127)).toString(), "\x7F");
    EXPECT_EQ(CIMValue(Char16(128)).toString(), "\\x0080");
    EXPECT_EQ(CIMValue(Char16(0)).toString(), "\\x0000");
    EXPECT_EQ(CIMValue(Char16(0xABCD)).toString(), "\\xABCD");
}

TEST(CIMValueTest, WritesArraysWithABlankBehindEachElement) {
    Array<Uint16> numbers;
    numbers.append(1);
    numbers.append(2);
    EXPECT_EQ(CIMValue(numbers).toString(), "1 2 ");
    Array<Boolean> booleans;
    booleans.append(true);
    booleans.append(false);
    EXPECT_EQ(CIMValue(booleans).toString(), "TRUE FALSE ");
    EXPECT_EQ(CIMValue(Array<String>(2, "")).toString(), "  ");
}

TEST(CIMValueTest, CopiesAreValuesOfTheirOwn) {
    CIMValue first(String("one"));
    CIMValue second = first;
    second.set(Uint8(2));
    EXPECT_EQ(first.toString(), "one");
    const CIMValue& alias = first;
    first = alias;
    EXPECT_EQ(first.toString(), "one");
    Array<String> elements(1, "a");
    const CIMValue array(elements);
    elements[0] = "b";
    EXPECT_EQ(array.toString(), "a ");
}

TEST(CIMValueTest, ClonesWhatItEmbeds) {
    CIMInstance instance("C");
    const CIMValue value(Array<CIMInstance>(1, instance));
    const CIMValue clone = value.clone();
    instance.addProperty(CIMProperty("p", CIMValue(Uint8(1))));
    EXPECT_EQ(clone.toString(), "<INSTANCE CLASSNAME=\"C\"></INSTANCE> ");
    EXPECT_NE(value.toString(), clone.toString());
}

TEST(CIMValueTest, ClonesHandlesOnNothing) {
    const CIMValue clone = CIMValue(CIMInstance()).clone();
    CIMInstance out("C");
    clone.get(out);
    EXPECT_TRUE(out.isUninitialized());
}

TEST(CIMValueTest, WritesHandlesOnNothingAsNothing) {
    EXPECT_EQ(CIMValue(CIMInstance()).toString(), "");
    EXPECT_EQ(CIMValue(CIMObject()).toString(), "");
    Array<CIMInstance> instances(1, CIMInstance("C"));
    instances.append(CIMInstance());
    EXPECT_EQ(CIMValue(instances).toString(), "<INSTANCE CLASSNAME=\"C\"></INSTANCE>  ");
}

TEST(CIMTypeTest, HasTheNumbersAndNamesOfTheStandard) {
    EXPECT_EQ(CIMTYPE_BOOLEAN, 0);
    EXPECT_EQ(CIMTYPE_SINT64, 8);
    EXPECT_EQ(CIMTYPE_REAL32, 9);
    EXPECT_EQ(CIMTYPE_STRING, 12);
    EXPECT_EQ(CIMTYPE_OBJECT, 15);
    EXPECT_EQ(CIMTYPE_INSTANCE, 16);
    EXPECT_STREQ(cimTypeToString(CIMTYPE_BOOLEAN), "boolean");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_SINT8), "sint8");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_UINT64), "uint64");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_REAL64), "real64");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_DATETIME), "datetime");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_REFERENCE), "reference");
    EXPECT_STREQ(cimTypeToString(CIMTYPE_INSTANCE), "instance");
    EXPECT_STREQ(cimTypeToString(static_cast<CIMType>(17)), "unknown");
}

}  // namespace
}  // namespace Pegasus
