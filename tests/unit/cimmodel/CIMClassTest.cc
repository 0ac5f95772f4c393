#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <string>
#include <type_traits>

namespace Pegasus {
namespace {

CIMProperty numbered(const std::string& prefix, Uint32 number) {
    return CIMProperty((prefix + std::to_string(number)).c_str(), CIMValue(number));
}

TEST(CIMClassTest, GivesWhatItIsMadeOf) {
    const CIMClass cimClass("CIM_Fan", "CIM_CoolingDevice");
    EXPECT_EQ(cimClass.getClassName().getString(), "CIM_Fan");
    EXPECT_EQ(cimClass.getSuperClassName().getString(), "CIM_CoolingDevice");
    EXPECT_EQ(cimClass.getPropertyCount(), 0U);
    EXPECT_EQ(cimClass.getQualifierCount(), 0U);
    EXPECT_FALSE(cimClass.isUninitialized());
    EXPECT_TRUE(CIMClass("CIM_Fan").getSuperClassName().isNull());
}

TEST(CIMClassTest, FindsPropertiesAndQualifiersIgnoringCase) {
    CIMClass cimClass("C");
    cimClass.addQualifier(CIMQualifier("Version", CIMValue(String("2.1"))))
        .addProperty(numbered("Prop", 0))
        .addProperty(numbered("Prop", 1));
    EXPECT_EQ(cimClass.findQualifier("VERSION"), 0U);
    EXPECT_EQ(cimClass.findQualifier("Prop0"), PEG_NOT_FOUND);
    EXPECT_EQ(cimClass.findProperty("PROP1"), 1U);
    EXPECT_EQ(cimClass.findProperty("Prop2"), PEG_NOT_FOUND);
    EXPECT_EQ(cimClass.getProperty(1).getName().getString(), "Prop1");
    EXPECT_EQ(cimClass.getQualifier(0).getValue().toString(), "2.1");
    EXPECT_THROW(cimClass.getProperty(2), IndexOutOfBoundsException);
    EXPECT_THROW(cimClass.getQualifier(1), IndexOutOfBoundsException);
    const CIMConstClass constClass = cimClass;
    EXPECT_EQ(constClass.getProperty(0).getName().getString(), "Prop0");
    EXPECT_THROW(constClass.getProperty(PEG_NOT_FOUND), IndexOutOfBoundsException);
    EXPECT_THROW(constClass.getQualifier(1), IndexOutOfBoundsException);
}

TEST(CIMClassTest, RefusesSecondOnesOfOneName) {
    CIMClass cimClass("C");
    cimClass.addProperty(CIMProperty("Name", CIMValue(true)));
    cimClass.addQualifier(CIMQualifier("Name", CIMValue(true)));
    EXPECT_THROW(cimClass.addProperty(CIMProperty("NAME", CIMValue(true))), AlreadyExistsException);
    EXPECT_THROW(cimClass.addQualifier(CIMQualifier("name", CIMValue(true))),
                 AlreadyExistsException);
    EXPECT_THROW(cimClass.addProperty(CIMProperty()), UninitializedObjectException);
    EXPECT_THROW(cimClass.addQualifier(CIMQualifier()), UninitializedObjectException);
    EXPECT_EQ(cimClass.getPropertyCount(), 1U);
    EXPECT_EQ(cimClass.getQualifierCount(), 1U);
}

TEST(CIMClassTest, FindsAmongManyProperties) {
    constexpr Uint32 kCount = 20000;
    CIMClass cimClass("C");
    for (Uint32 i = 0; i < kCount; ++i)
        cimClass.addProperty(numbered("Property", i));
    for (const Uint32 i : {0U, 510U, 511U, 512U, 513U, kCount - 1}) {
        EXPECT_EQ(cimClass.findProperty(("pROPERTY" + std::to_string(i)).c_str()), i);
        EXPECT_THROW(cimClass.addProperty(numbered("PROPERTY", i)), AlreadyExistsException);
    }
    EXPECT_EQ(cimClass.findProperty("Property20000"), PEG_NOT_FOUND);
    const CIMClass clone = cimClass.clone();
    EXPECT_EQ(clone.getPropertyCount(), kCount);
    EXPECT_EQ(clone.findProperty("Property19999"), 19999U);
}

TEST(CIMClassTest, CopiesShareOneClass) {
    CIMClass first("C", "S");
    first.addProperty(CIMProperty("P", CIMValue(Uint32(1))));
    const CIMConstClass second = first;
    CIMClass clone = second.clone();
    first.setSuperClassName("T");
    first.getProperty(0).setValue(CIMValue(Uint32(2)));
    first.addProperty(CIMProperty("Q", CIMValue(true)));
    EXPECT_EQ(second.getSuperClassName().getString(), "T");
    EXPECT_EQ(second.getProperty(0).getValue().toString(), "2");
    EXPECT_EQ(second.getPropertyCount(), 2U);
    EXPECT_EQ(clone.getSuperClassName().getString(), "S");
    EXPECT_EQ(clone.getProperty(0).getValue().toString(), "1");
    EXPECT_EQ(clone.getPropertyCount(), 1U);
}

TEST(CIMClassTest, TellsAssociationsAndAbstractClasses) {
    CIMClass cimClass("C");
    EXPECT_FALSE(cimClass.isAssociation());
    EXPECT_FALSE(cimClass.isAbstract());
    cimClass.addQualifier(CIMQualifier("ASSOCIATION", CIMValue(true)));
    cimClass.addQualifier(CIMQualifier("Abstract", CIMValue(false)));
    EXPECT_TRUE(cimClass.isAssociation());
    EXPECT_FALSE(cimClass.isAbstract());
    cimClass.getQualifier(1).setValue(CIMValue(true));
    EXPECT_TRUE(cimClass.isAbstract());
    cimClass.getQualifier(1).setValue(CIMValue(String("TRUE")));
    EXPECT_FALSE(cimClass.isAbstract());
    cimClass.getQualifier(1).setValue(CIMValue(CIMTYPE_BOOLEAN, false));
    EXPECT_FALSE(cimClass.isAbstract());
}

TEST(CIMClassTest, RaisesUntilInitialized) {
    CIMClass cimClass;
    EXPECT_TRUE(cimClass.isUninitialized());
    EXPECT_THROW(cimClass.getClassName(), UninitializedObjectException);
    EXPECT_THROW(cimClass.getSuperClassName(), UninitializedObjectException);
    EXPECT_THROW(cimClass.isAssociation(), UninitializedObjectException);
    EXPECT_THROW(cimClass.isAbstract(), UninitializedObjectException);
    EXPECT_THROW(cimClass.findQualifier("Q"), UninitializedObjectException);
    EXPECT_THROW(cimClass.getQualifier(0), UninitializedObjectException);
    EXPECT_THROW(cimClass.getQualifierCount(), UninitializedObjectException);
    EXPECT_THROW(cimClass.findProperty("P"), UninitializedObjectException);
    EXPECT_THROW(cimClass.getProperty(0), UninitializedObjectException);
    EXPECT_THROW(cimClass.getPropertyCount(), UninitializedObjectException);
    EXPECT_THROW(cimClass.clone(), UninitializedObjectException);
    EXPECT_THROW(cimClass.addProperty(CIMProperty("P", CIMValue())), UninitializedObjectException);
    EXPECT_THROW(CIMConstClass().getClassName(), UninitializedObjectException);
    EXPECT_THROW(CIMClass{CIMName()}, UninitializedObjectException);
}

TEST(CIMClassTest, GivesNoWriteAccessToAConstHandle) {
    static_assert(!std::is_constructible_v<CIMClass, CIMConstClass>);
    static_assert(std::is_constructible_v<CIMConstClass, CIMClass>);
    using FromConst = decltype(std::declval<const CIMClass&>().getProperty(0));
    static_assert(std::is_same_v<FromConst, CIMConstProperty>);
}

}  // namespace
}  // namespace Pegasus
