#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

void expectKey(const CIMValue& value, CIMKeyBinding::Type type, const char* text) {
    const CIMKeyBinding key("k", value);
    EXPECT_EQ(key.getType(), type);
    EXPECT_EQ(key.getValue(), text);
    EXPECT_EQ(key.getName().getString(), "k");
}

CIMKeyBinding keyOf(const char* value, CIMKeyBinding::Type type) {
    return CIMKeyBinding("k", value, type);
}

TEST(CIMKeyBindingTest, TakesTheTypeOfItsValue) {
    expectKey(CIMValue(true), CIMKeyBinding::BOOLEAN, "TRUE");
    expectKey(CIMValue(Uint8(7)), CIMKeyBinding::NUMERIC, "7");
    expectKey(CIMValue(Sint64(-7)), CIMKeyBinding::NUMERIC, "-7");
    expectKey(CIMValue(String("text")), CIMKeyBinding::STRING, "text");
    expectKey(CIMValue(Char16('c')), CIMKeyBinding::STRING, "c");
    expectKey(CIMValue(CIMDateTime()), CIMKeyBinding::STRING, "00000000000000.000000:000");
    expectKey(CIMValue(CIMObjectPath("root:C.k=1")), CIMKeyBinding::REFERENCE, "root:C.k=1");
}

TEST(CIMKeyBindingTest, RefusesValuesThatCannotBeKeys) {
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(1.5)), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(Real32(1))), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(CIMTYPE_STRING, false)), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(Array<Uint8>(1))), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(CIMInstance("C"))), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(CIMInstance())), TypeMismatchException);
    EXPECT_THROW(CIMKeyBinding("k", CIMValue(CIMObject(CIMClass("C")))), TypeMismatchException);
}

TEST(CIMKeyBindingTest, IsChanged) {
    CIMKeyBinding key;
    EXPECT_TRUE(key.getName().isNull());
    EXPECT_EQ(key.getType(), CIMKeyBinding::STRING);
    key.setName("name");
    key.setValue("5");
    key.setType(CIMKeyBinding::NUMERIC);
    EXPECT_EQ(key.getName().getString(), "name");
    EXPECT_EQ(key.getValue(), "5");
    EXPECT_EQ(key.getType(), CIMKeyBinding::NUMERIC);
}

TEST(CIMKeyBindingTest, ComparesByType) {
    EXPECT_TRUE(CIMKeyBinding("K", "v", CIMKeyBinding::STRING) ==
                keyOf("v", CIMKeyBinding::STRING));
    EXPECT_FALSE(keyOf("v", CIMKeyBinding::STRING) == keyOf("V", CIMKeyBinding::STRING));
    EXPECT_FALSE(keyOf("1", CIMKeyBinding::STRING) == keyOf("1", CIMKeyBinding::NUMERIC));
    EXPECT_FALSE(CIMKeyBinding("j", "1", CIMKeyBinding::STRING) ==
                 keyOf("1", CIMKeyBinding::STRING));
    EXPECT_TRUE(keyOf("true", CIMKeyBinding::BOOLEAN) == keyOf("TRUE", CIMKeyBinding::BOOLEAN));
    EXPECT_FALSE(keyOf("true", CIMKeyBinding::BOOLEAN) == keyOf("FALSE", CIMKeyBinding::BOOLEAN));
}

TEST(CIMKeyBindingTest, ComparesNumbersByTheirValue) {
    const auto equal = [](const char* a, const char* b) {
        return keyOf(a, CIMKeyBinding::NUMERIC) == keyOf(b, CIMKeyBinding::NUMERIC);
    };
    EXPECT_TRUE(equal("16", "0x10"));
    EXPECT_TRUE(equal("007", "+7"));
    EXPECT_TRUE(equal("-0", "0"));
    EXPECT_TRUE(equal("18446744073709551615", "0XFFFFFFFFFFFFFFFF"));
    EXPECT_FALSE(equal("-7", "7"));
    EXPECT_FALSE(equal("1", "1.5"));
    EXPECT_FALSE(equal("99999999999999999999", "99999999999999999998"));
    EXPECT_FALSE(equal("", "0"));
}

TEST(CIMKeyBindingTest, ComparesReferencesAsPaths) {
    const auto equal = [](const char* a, const char* b) {
        return keyOf(a, CIMKeyBinding::REFERENCE) == keyOf(b, CIMKeyBinding::REFERENCE);
    };
    EXPECT_TRUE(equal("root:C.a=1,b=2", "ROOT:c.B=2,A=1"));
    EXPECT_FALSE(equal("root:C.a=1", "root:C.a=2"));
    EXPECT_FALSE(equal("no path", "another"));
    EXPECT_TRUE(equal("no path", "no path"));
}

}  // namespace
}  // namespace Pegasus
