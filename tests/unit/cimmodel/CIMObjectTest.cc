#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(CIMObjectTest, HoldsAClass) {
    CIMClass cimClass("C");
    const CIMObject object(cimClass);
    cimClass.addProperty(CIMProperty("P", CIMValue(Uint8(1))));
    EXPECT_TRUE(object.isClass());
    EXPECT_FALSE(object.isInstance());
    EXPECT_EQ(object.getClassName().getString(), "C");
    EXPECT_EQ(object.getPropertyCount(), 1U);
    EXPECT_EQ(object.findProperty("p"), 0U);
    EXPECT_EQ(object.getProperty(0).getValue().toString(), "1");
    EXPECT_EQ(CIMClass(object).getPropertyCount(), 1U);
    EXPECT_THROW(CIMInstance{object}, TypeMismatchException);
}

TEST(CIMObjectTest, HoldsAnInstance) {
    CIMInstance instance("C");
    const CIMObject object(instance);
    const CIMObject clone = object.clone();
    instance.addProperty(CIMProperty("P", CIMValue(Uint8(1))));
    EXPECT_TRUE(object.isInstance());
    EXPECT_FALSE(object.isClass());
    EXPECT_EQ(CIMInstance(object).getPropertyCount(), 1U);
    EXPECT_EQ(clone.getPropertyCount(), 0U);
    EXPECT_TRUE(clone.isInstance());
    EXPECT_THROW(object.getProperty(1), IndexOutOfBoundsException);
    EXPECT_THROW(CIMClass{object}, TypeMismatchException);
}

TEST(CIMObjectTest, RaisesUntilInitialized) {
    const CIMObject object;
    EXPECT_TRUE(object.isUninitialized());
    EXPECT_THROW(object.isClass(), UninitializedObjectException);
    EXPECT_THROW(object.isInstance(), UninitializedObjectException);
    EXPECT_THROW(object.getClassName(), UninitializedObjectException);
    EXPECT_THROW(object.findProperty("P"), UninitializedObjectException);
    EXPECT_THROW(object.getProperty(0), UninitializedObjectException);
    EXPECT_THROW(object.getPropertyCount(), UninitializedObjectException);
    EXPECT_THROW(object.clone(), UninitializedObjectException);
    EXPECT_THROW(CIMObject{CIMClass()}, UninitializedObjectException);
    EXPECT_THROW(CIMObject{CIMInstance()}, UninitializedObjectException);
    EXPECT_THROW(CIMClass{object}, UninitializedObjectException);
}

}  // namespace
}  // namespace Pegasus
