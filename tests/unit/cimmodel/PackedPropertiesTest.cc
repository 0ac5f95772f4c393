// Values that were packed come out as they went in.

#include "model/PackedProperties.h"

#include <Pegasus/Common/CIMObjectPath.h>
#include <gtest/gtest.h>

#include <limits>
#include <memory>
#include <string>
#include <vector>

namespace Pegasus {
namespace {

PropertyDeclaration declared(const char* name, CIMType type, Boolean isArray = false) {
    PropertyDeclaration declaration;
    declaration.name = name;
    declaration.type = type;
    declaration.isArray = isArray;
    return declaration;
}

using Properties = BodyRef<PackedProperties>;

// One property P with this value.
Properties packed(const CIMValue& value) {
    PropertyPacker packer;
    packer.start();
    EXPECT_TRUE(packer.add(value));
    return packer.finish(std::make_shared<InstanceShape>(
        std::vector{declared("P", value.getType(), value.isArray())}));
}

template <typename T>
T unpacked(const T& value) {
    T out{};
    packed(CIMValue(value)).get()->value(0).get(out);
    return out;
}

template <typename T>
Array<T> arrayOf(std::initializer_list<T> elements) {
    return Array<T>(elements.begin(), static_cast<Uint32>(elements.size()));
}

template <typename T>
void expectLimitsKept() {
    EXPECT_EQ(unpacked(std::numeric_limits<T>::max()), std::numeric_limits<T>::max());
    EXPECT_EQ(unpacked(std::numeric_limits<T>::lowest()), std::numeric_limits<T>::lowest());
    EXPECT_EQ(unpacked(T(0)), T(0));
}

TEST(PackedProperties, KeepNumbers) {
    expectLimitsKept<Uint8>();
    expectLimitsKept<Sint8>();
    expectLimitsKept<Uint16>();
    expectLimitsKept<Sint16>();
    expectLimitsKept<Uint32>();
    expectLimitsKept<Sint32>();
    expectLimitsKept<Uint64>();
    expectLimitsKept<Sint64>();
    expectLimitsKept<Real32>();
    expectLimitsKept<Real64>();
    EXPECT_TRUE(unpacked(Boolean(true)));
    EXPECT_FALSE(unpacked(Boolean(false)));
    EXPECT_EQ(unpacked(Char16(0x20AC)), Char16(0x20AC));
}

TEST(PackedProperties, KeepTexts) {
    EXPECT_EQ(unpacked(String("")), "");
    EXPECT_EQ(unpacked(String("a b")), "a b");
    EXPECT_EQ(unpacked(String("\xE2\x82\xAC\xF0\x9F\x98\x80")), "\xE2\x82\xAC\xF0\x9F\x98\x80");
    const std::string large(70000, 'x');
    EXPECT_EQ(unpacked(String(large.c_str())), String(large.c_str()));
}

TEST(PackedProperties, KeepTimes) {
    for (const char* time : {"20260102030405.000000+060", "20260102030405.0*****-720",
                             "00000001000000.000000:000", "00000000000000.000000:000"}) {
        EXPECT_EQ(unpacked(CIMDateTime(time)).toString(), time);
    }
    EXPECT_EQ(unpacked(CIMDateTime()).toString(), "00000000000000.000000:000");
}

TEST(PackedProperties, KeepArrays) {
    const Properties numbers = packed(CIMValue(arrayOf<Uint64>({1, 18446744073709551615ULL})));
    EXPECT_EQ(numbers.get()->value(0).toString(), "1 18446744073709551615 ");
    const Properties texts = packed(CIMValue(arrayOf<String>({"a", "", "c d"})));
    Array<String> read;
    texts.get()->value(0).get(read);
    ASSERT_EQ(read.size(), 3U);
    EXPECT_EQ(read[0], "a");
    EXPECT_EQ(read[1], "");
    EXPECT_EQ(read[2], "c d");
    const CIMValue empty = packed(CIMValue(Array<String>())).get()->value(0);
    EXPECT_FALSE(empty.isNull());
    EXPECT_TRUE(empty.isArray());
    EXPECT_EQ(empty.getArraySize(), 0U);
}

TEST(PackedProperties, KeepNullsApartFromEmptyTexts) {
    EXPECT_TRUE(packed(CIMValue(CIMTYPE_STRING, false)).get()->value(0).isNull());
    EXPECT_FALSE(packed(CIMValue(String())).get()->value(0).isNull());
    const CIMValue array = packed(CIMValue(CIMTYPE_UINT8, true)).get()->value(0);
    EXPECT_TRUE(array.isNull());
    EXPECT_TRUE(array.isArray());
    EXPECT_EQ(array.getType(), CIMTYPE_UINT8);
}

TEST(PackedProperties, AreFoundIgnoringCase) {
    PropertyPacker packer;
    packer.start();
    packer.beginScalar();
    packer.putText("first");
    packer.beginNull();
    packer.beginArray(2);
    packer.put(Uint8(7));
    packer.put(Uint8(9));
    EXPECT_EQ(packer.size(), 3U);
    PropertyDeclaration last = declared("Third", CIMTYPE_UINT8, true);
    last.arraySize = 2;
    last.propagated = true;
    last.classOrigin = "T_Base";
    const Properties properties = packer.finish(std::make_shared<InstanceShape>(
        std::vector{declared("First", CIMTYPE_STRING), declared("Second", CIMTYPE_BOOLEAN), last}));
    EXPECT_EQ(properties.get()->size(), 3U);
    EXPECT_EQ(properties.get()->find("FIRST"), 0U);
    EXPECT_EQ(properties.get()->find("third"), 2U);
    EXPECT_EQ(properties.get()->find("Thir"), PEG_NOT_FOUND);
    EXPECT_EQ(properties.get()->find(CIMName()), PEG_NOT_FOUND);
    EXPECT_EQ(properties.get()->value(0).toString(), "first");
    EXPECT_TRUE(properties.get()->value(1).isNull());
    const CIMProperty third = properties.get()->at(2);
    EXPECT_EQ(third.getName().getString(), "Third");
    EXPECT_EQ(third.getValue().toString(), "7 9 ");
    EXPECT_EQ(third.getArraySize(), 2U);
    EXPECT_TRUE(third.getPropagated());
    EXPECT_EQ(third.getClassOrigin().getString(), "T_Base");
}

TEST(PackedProperties, CannotHoldReferencesAndEmbeddedObjects) {
    const CIMInstance instance("T_Thing");
    PropertyPacker packer;
    packer.start();
    EXPECT_FALSE(
        packer.add(CIMValue(CIMObjectPath(String(), CIMNamespaceName(), CIMName("T_Thing")))));
    EXPECT_FALSE(packer.add(CIMValue(instance)));
    EXPECT_FALSE(packer.add(CIMValue(Array<CIMInstance>(1, instance))));
    EXPECT_EQ(packer.size(), 0U);
}

TEST(PackedProperties, HaveNothingOfAnEarlierInstance) {
    const auto shape = std::make_shared<InstanceShape>(std::vector{declared("P", CIMTYPE_STRING)});
    PropertyPacker packer;
    packer.start();
    packer.beginScalar();
    packer.putText("left in the middle");
    packer.start();
    packer.beginScalar();
    packer.putText("a");
    const Properties first = packer.finish(shape);
    packer.beginScalar();
    packer.putText("b");
    const Properties second = packer.finish(shape);
    EXPECT_EQ(first.get()->value(0).toString(), "a");
    EXPECT_EQ(second.get()->value(0).toString(), "b");
}

TEST(PackedProperties, MayBeNone) {
    PropertyPacker packer;
    packer.start();
    const Properties none =
        packer.finish(std::make_shared<InstanceShape>(std::vector<PropertyDeclaration>()));
    EXPECT_EQ(none.get()->size(), 0U);
    EXPECT_EQ(none.get()->find("P"), PEG_NOT_FOUND);
}

}  // namespace
}  // namespace Pegasus
