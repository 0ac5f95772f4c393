#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <type_traits>

namespace Pegasus {
namespace {

TEST(CIMQualifierTest, GivesWhatItIsMadeOf) {
    const CIMQualifier qualifier("MaxLen", CIMValue(Uint32(64)));
    EXPECT_FALSE(qualifier.isUninitialized());
    EXPECT_EQ(qualifier.getName().getString(), "MaxLen");
    EXPECT_EQ(qualifier.getType(), CIMTYPE_UINT32);
    EXPECT_FALSE(qualifier.isArray());
    EXPECT_EQ(qualifier.getValue().toString(), "64");
    EXPECT_FALSE(qualifier.getPropagated());
    EXPECT_TRUE(qualifier.getFlavor().has(CIMFlavor::OVERRIDABLE));
    EXPECT_TRUE(qualifier.getFlavor().has(CIMFlavor::TOSUBCLASS));
    EXPECT_FALSE(qualifier.getFlavor().has(CIMFlavor::TOINSTANCE));
    EXPECT_FALSE(qualifier.getFlavor().has(CIMFlavor::TRANSLATABLE));
    EXPECT_TRUE(CIMQualifier("Values", CIMValue(Array<String>(2, "x"))).isArray());
}

TEST(CIMQualifierTest, CopiesShareOneQualifier) {
    CIMQualifier first("Q", CIMValue(true));
    const CIMConstQualifier second = first;
    const CIMQualifier clone = second.clone();
    CIMFlavor flavor;
    flavor.set(CIMFlavor::OVERRIDABLE, false);
    flavor.set(CIMFlavor::TRANSLATABLE, true);
    first.setFlavor(flavor);
    first.setPropagated(true);
    first.setValue(CIMValue(false));
    EXPECT_FALSE(second.getFlavor().has(CIMFlavor::OVERRIDABLE));
    EXPECT_TRUE(second.getFlavor().has(CIMFlavor::TRANSLATABLE));
    EXPECT_TRUE(second.getFlavor().has(CIMFlavor::TOSUBCLASS));
    EXPECT_TRUE(second.getPropagated());
    EXPECT_EQ(second.getValue().toString(), "FALSE");
    EXPECT_TRUE(clone.getFlavor().has(CIMFlavor::OVERRIDABLE));
    EXPECT_FALSE(clone.getPropagated());
    EXPECT_EQ(clone.getValue().toString(), "TRUE");
}

TEST(CIMQualifierTest, RaisesUntilInitialized) {
    CIMQualifier qualifier;
    EXPECT_TRUE(qualifier.isUninitialized());
    EXPECT_THROW(qualifier.getName(), UninitializedObjectException);
    EXPECT_THROW(qualifier.getType(), UninitializedObjectException);
    EXPECT_THROW(qualifier.isArray(), UninitializedObjectException);
    EXPECT_THROW(qualifier.getValue(), UninitializedObjectException);
    EXPECT_THROW(qualifier.getFlavor(), UninitializedObjectException);
    EXPECT_THROW(qualifier.getPropagated(), UninitializedObjectException);
    EXPECT_THROW(qualifier.clone(), UninitializedObjectException);
    EXPECT_THROW(qualifier.setPropagated(true), UninitializedObjectException);
    EXPECT_THROW(CIMConstQualifier().getName(), UninitializedObjectException);
    EXPECT_THROW(CIMQualifier(CIMName(), CIMValue()), UninitializedObjectException);
    qualifier = CIMQualifier("Q", CIMValue());
    EXPECT_FALSE(qualifier.isUninitialized());
}

TEST(CIMQualifierTest, GivesNoWriteAccessToAConstHandle) {
    static_assert(!std::is_constructible_v<CIMQualifier, CIMConstQualifier>);
    static_assert(std::is_constructible_v<CIMConstQualifier, CIMQualifier>);
}

}  // namespace
}  // namespace Pegasus
