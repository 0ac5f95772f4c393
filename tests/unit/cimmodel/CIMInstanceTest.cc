#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <type_traits>

namespace Pegasus {
namespace {

TEST(CIMInstanceTest, GivesWhatItIsMadeOf) {
    CIMInstance instance("CIM_Fan");
    EXPECT_EQ(instance.getClassName().getString(), "CIM_Fan");
    EXPECT_EQ(instance.getPath().toString(), "");
    EXPECT_EQ(instance.getPropertyCount(), 0U);
    EXPECT_FALSE(instance.isUninitialized());
    instance.setPath(CIMObjectPath("root:CIM_Fan.DeviceID=\"1\""));
    EXPECT_EQ(instance.getPath().toString(), "root:CIM_Fan.DeviceID=\"1\"");
}

TEST(CIMInstanceTest, FindsPropertiesAndQualifiersIgnoringCase) {
    CIMInstance instance("C");
    instance.addProperty(CIMProperty("First", CIMValue(Uint8(1))))
        .addProperty(CIMProperty("Second", CIMValue(Uint8(2))))
        .addQualifier(CIMQualifier("Q", CIMValue(true)));
    EXPECT_EQ(instance.findProperty("SECOND"), 1U);
    EXPECT_EQ(instance.findProperty("Third"), PEG_NOT_FOUND);
    EXPECT_EQ(instance.getProperty(0).getValue().toString(), "1");
    EXPECT_EQ(instance.findQualifier("q"), 0U);
    EXPECT_EQ(instance.getQualifier(0).getName().getString(), "Q");
    EXPECT_EQ(instance.getQualifierCount(), 1U);
    EXPECT_THROW(instance.getProperty(2), IndexOutOfBoundsException);
    EXPECT_THROW(instance.getQualifier(1), IndexOutOfBoundsException);
    EXPECT_THROW(instance.addProperty(CIMProperty("FIRST", CIMValue(true))),
                 AlreadyExistsException);
    EXPECT_THROW(instance.addQualifier(CIMQualifier("q", CIMValue(true))), AlreadyExistsException);
    const CIMConstInstance constInstance = instance;
    EXPECT_EQ(constInstance.getProperty(1).getValue().toString(), "2");
    EXPECT_EQ(constInstance.getQualifier(0).getName().getString(), "Q");
    EXPECT_THROW(constInstance.getProperty(2), IndexOutOfBoundsException);
}

TEST(CIMInstanceTest, CopiesShareOneInstance) {
    CIMInstance first("C");
    first.addProperty(CIMProperty("P", CIMValue(String("old"))));
    first.setPath(CIMObjectPath("root:C.k=1"));
    const CIMConstInstance second = first;
    const CIMInstance clone = first.clone();
    first.getProperty(0).setValue(CIMValue(String("new")));
    CIMObjectPath path = first.getPath();
    path.setClassName("D");
    EXPECT_EQ(second.getProperty(0).getValue().toString(), "new");
    EXPECT_EQ(second.getPath().toString(), "root:D.k=1");
    EXPECT_EQ(clone.getProperty(0).getValue().toString(), "old");
    EXPECT_EQ(clone.getPath().toString(), "root:C.k=1");
}

TEST(CIMInstanceTest, LivesInArraysThatShareIt) {
    Array<CIMInstance> instances;
    instances.append(CIMInstance("C"));
    Array<CIMInstance> copy = instances;
    copy.append(CIMInstance("D"));
    CIMInstance first = copy[0];
    first.addProperty(CIMProperty("P", CIMValue(true)));
    EXPECT_EQ(instances.size(), 1U);
    EXPECT_EQ(instances[0].getPropertyCount(), 1U);
}

TEST(CIMInstanceTest, RaisesUntilInitialized) {
    CIMInstance instance;
    EXPECT_TRUE(instance.isUninitialized());
    EXPECT_THROW(instance.getClassName(), UninitializedObjectException);
    EXPECT_THROW(instance.getPath(), UninitializedObjectException);
    EXPECT_THROW(instance.findProperty("P"), UninitializedObjectException);
    EXPECT_THROW(instance.getProperty(0), UninitializedObjectException);
    EXPECT_THROW(instance.getPropertyCount(), UninitializedObjectException);
    EXPECT_THROW(instance.findQualifier("Q"), UninitializedObjectException);
    EXPECT_THROW(instance.getQualifier(0), UninitializedObjectException);
    EXPECT_THROW(instance.getQualifierCount(), UninitializedObjectException);
    EXPECT_THROW(instance.clone(), UninitializedObjectException);
    EXPECT_THROW(instance.setPath(CIMObjectPath()), UninitializedObjectException);
    EXPECT_THROW(instance.addProperty(CIMProperty("P", CIMValue())), UninitializedObjectException);
    EXPECT_THROW(CIMConstInstance().getClassName(), UninitializedObjectException);
    EXPECT_THROW(CIMInstance{CIMName()}, UninitializedObjectException);
}

TEST(CIMInstanceTest, GivesNoWriteAccessToAConstHandle) {
    static_assert(!std::is_constructible_v<CIMInstance, CIMConstInstance>);
    static_assert(std::is_constructible_v<CIMConstInstance, CIMInstance>);
}

}  // namespace
}  // namespace Pegasus
