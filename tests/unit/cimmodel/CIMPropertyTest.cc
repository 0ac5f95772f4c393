#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <type_traits>
#include <utility>

namespace Pegasus {
namespace {

TEST(CIMPropertyTest, GivesWhatItIsMadeOf) {
    const CIMProperty property("Name", CIMValue(String("x")));
    EXPECT_EQ(property.getName().getString(), "Name");
    EXPECT_EQ(property.getValue().toString(), "x");
    EXPECT_EQ(property.getType(), CIMTYPE_STRING);
    EXPECT_FALSE(property.isArray());
    EXPECT_EQ(property.getArraySize(), 0U);
    EXPECT_TRUE(property.getReferenceClassName().isNull());
    EXPECT_TRUE(property.getClassOrigin().isNull());
    EXPECT_FALSE(property.getPropagated());
    EXPECT_EQ(property.getQualifierCount(), 0U);
    EXPECT_FALSE(property.isUninitialized());
    const CIMProperty full("Ref", CIMValue(CIMTYPE_REFERENCE, true), 4, "Target", "Origin", true);
    EXPECT_TRUE(full.isArray());
    EXPECT_EQ(full.getArraySize(), 4U);
    EXPECT_EQ(full.getReferenceClassName().getString(), "Target");
    EXPECT_EQ(full.getClassOrigin().getString(), "Origin");
    EXPECT_TRUE(full.getPropagated());
}

// What is asked of a copy that nobody holds is a copy, too: a reference would outlive it.
TEST(CIMPropertyTest, GivesNamesThatMayBeReferredTo) {
    using OfProperty = decltype(std::declval<CIMConstProperty>().getName().getString());
    using OfName = decltype(std::declval<const CIMName&>().getString());
    static_assert(std::is_same_v<OfProperty, String>);
    static_assert(std::is_same_v<OfName, const String&>);
    const CIMProperty property("Name", CIMValue(String("x")), 0, CIMName(), "Origin");
    const String& name = property.getName().getString();
    const String& origin = property.getClassOrigin().getString();
    EXPECT_EQ(name, "Name");
    EXPECT_EQ(origin, "Origin");
}

TEST(CIMPropertyTest, KeepsItsType) {
    CIMProperty property("P", CIMValue(Uint32(1)));
    property.setValue(CIMValue(Uint32(2)));
    EXPECT_EQ(property.getValue().toString(), "2");
    property.setValue(CIMValue(CIMTYPE_UINT32, false));
    EXPECT_TRUE(property.getValue().isNull());
    EXPECT_THROW(property.setValue(CIMValue(Uint16(3))), TypeMismatchException);
    EXPECT_THROW(property.setValue(CIMValue(Array<Uint32>(1))), TypeMismatchException);
    EXPECT_TRUE(property.getValue().isNull());
}

TEST(CIMPropertyTest, FindsQualifiersIgnoringCase) {
    CIMProperty property("P", CIMValue(Uint32(1)));
    property.addQualifier(CIMQualifier("Key", CIMValue(true)))
        .addQualifier(CIMQualifier("MaxLen", CIMValue(Uint32(9))));
    EXPECT_EQ(property.getQualifierCount(), 2U);
    EXPECT_EQ(property.findQualifier("maxlen"), 1U);
    EXPECT_EQ(property.findQualifier("KEY"), 0U);
    EXPECT_EQ(property.findQualifier("Max"), PEG_NOT_FOUND);
    EXPECT_EQ(property.findQualifier(CIMName()), PEG_NOT_FOUND);
    EXPECT_EQ(property.getQualifier(1).getValue().toString(), "9");
    EXPECT_THROW(property.getQualifier(2), IndexOutOfBoundsException);
    const CIMConstProperty constProperty = property;
    EXPECT_EQ(constProperty.getQualifier(0).getName().getString(), "Key");
    EXPECT_THROW(constProperty.getQualifier(PEG_NOT_FOUND), IndexOutOfBoundsException);
}

TEST(CIMPropertyTest, RefusesASecondQualifierOfOneName) {
    CIMProperty property("P", CIMValue(Uint32(1)));
    property.addQualifier(CIMQualifier("Key", CIMValue(true)));
    EXPECT_THROW(property.addQualifier(CIMQualifier("KEY", CIMValue(false))),
                 AlreadyExistsException);
    EXPECT_THROW(property.addQualifier(CIMQualifier()), UninitializedObjectException);
    EXPECT_EQ(property.getQualifierCount(), 1U);
}

TEST(CIMPropertyTest, CopiesShareOneProperty) {
    CIMProperty first("P", CIMValue(Uint32(1)));
    first.addQualifier(CIMQualifier("Q", CIMValue(Uint32(1))));
    const CIMProperty second = first;
    CIMProperty clone = first.clone();
    first.setValue(CIMValue(Uint32(2)));
    first.setClassOrigin("Origin");
    first.setPropagated(true);
    first.getQualifier(0).setValue(CIMValue(Uint32(2)));
    first.addQualifier(CIMQualifier("R", CIMValue(true)));
    EXPECT_EQ(second.getValue().toString(), "2");
    EXPECT_EQ(second.getClassOrigin().getString(), "Origin");
    EXPECT_TRUE(second.getPropagated());
    EXPECT_EQ(second.getQualifierCount(), 2U);
    EXPECT_EQ(clone.getValue().toString(), "1");
    EXPECT_TRUE(clone.getClassOrigin().isNull());
    EXPECT_FALSE(clone.getPropagated());
    EXPECT_EQ(clone.getQualifierCount(), 1U);
    EXPECT_EQ(clone.getQualifier(0).getValue().toString(), "1");
}

TEST(CIMPropertyTest, OutlivesTheHandleItWasCopiedFrom) {
    CIMProperty kept;
    {
        const CIMProperty property("P", CIMValue(String("x")));
        kept = property;
    }
    EXPECT_EQ(kept.getValue().toString(), "x");
    const CIMProperty& alias = kept;
    kept = alias;
    EXPECT_EQ(kept.getName().getString(), "P");
    kept = CIMProperty();
    EXPECT_TRUE(kept.isUninitialized());
}

TEST(CIMPropertyTest, RaisesUntilInitialized) {
    CIMProperty property;
    EXPECT_TRUE(property.isUninitialized());
    EXPECT_THROW(property.getName(), UninitializedObjectException);
    EXPECT_THROW(property.getValue(), UninitializedObjectException);
    EXPECT_THROW(property.getType(), UninitializedObjectException);
    EXPECT_THROW(property.isArray(), UninitializedObjectException);
    EXPECT_THROW(property.getArraySize(), UninitializedObjectException);
    EXPECT_THROW(property.getReferenceClassName(), UninitializedObjectException);
    EXPECT_THROW(property.getClassOrigin(), UninitializedObjectException);
    EXPECT_THROW(property.getPropagated(), UninitializedObjectException);
    EXPECT_THROW(property.findQualifier("Q"), UninitializedObjectException);
    EXPECT_THROW(property.getQualifier(0), UninitializedObjectException);
    EXPECT_THROW(property.getQualifierCount(), UninitializedObjectException);
    EXPECT_THROW(property.clone(), UninitializedObjectException);
    EXPECT_THROW(property.setValue(CIMValue()), UninitializedObjectException);
    EXPECT_THROW(property.addQualifier(CIMQualifier("Q", CIMValue())),
                 UninitializedObjectException);
    EXPECT_THROW(CIMConstProperty().getName(), UninitializedObjectException);
    EXPECT_THROW(CIMProperty(CIMName(), CIMValue()), UninitializedObjectException);
}

TEST(CIMPropertyTest, GivesNoWriteAccessToAConstHandle) {
    static_assert(!std::is_constructible_v<CIMProperty, CIMConstProperty>);
    static_assert(!std::is_assignable_v<CIMProperty&, CIMConstProperty>);
    static_assert(std::is_assignable_v<CIMConstProperty&, CIMProperty>);
}

}  // namespace
}  // namespace Pegasus
