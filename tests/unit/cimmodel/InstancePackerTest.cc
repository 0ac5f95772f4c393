#include "model/InstancePacker.h"

#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMValue.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

/// A packed instance is a new one, the other is given back.
Boolean isPacked(const CIMConstInstance& instance) {
    return &InstancePacker().packed(instance).getPath() != &instance.getPath();
}

TEST(InstancePackerTest, KeepsEverything) {
    CIMInstance instance(CIMName("T_Disk"));
    instance.addProperty(CIMProperty("Id", CIMValue(String("a\xF0\x9F\x98\x80", 5)), 0, CIMName(),
                                     CIMName("T_Thing"), true));
    instance.addProperty(CIMProperty("Sizes", CIMValue(CIMTYPE_UINT32, true, 4), 4));
    instance.setPath(CIMObjectPath("root/x:T_Disk.Id=\"a\""));
    const CIMConstInstance copy = InstancePacker().packed(instance);
    EXPECT_TRUE(isPacked(instance));
    EXPECT_EQ(copy.getClassName(), CIMName("T_Disk"));
    EXPECT_EQ(copy.getPath().toString(), String("root/x:T_Disk.Id=\"a\""));
    ASSERT_EQ(copy.getPropertyCount(), 2U);
    const CIMConstProperty id = copy.getProperty(0);
    EXPECT_EQ(id.getName(), CIMName("Id"));
    EXPECT_EQ(id.getValue().toString(), String("a\xF0\x9F\x98\x80"));
    EXPECT_EQ(id.getClassOrigin(), CIMName("T_Thing"));
    EXPECT_TRUE(id.getPropagated());
    const CIMConstProperty sizes = copy.getProperty(1);
    EXPECT_TRUE(sizes.getValue().isNull());
    EXPECT_TRUE(sizes.isArray());
    EXPECT_EQ(sizes.getArraySize(), 4U);
}

TEST(InstancePackerTest, KeepsTextsWithNuls) {
    CIMInstance instance(CIMName("C"));
    instance.addProperty(CIMProperty("P", CIMValue(String("a\0b", 3))));
    EXPECT_EQ(InstancePacker().packed(instance).getProperty(0).getValue().toString(),
              String("a\0b", 3));
}

TEST(InstancePackerTest, LeavesWhatCannotBePacked) {
    CIMInstance referring(CIMName("C"));
    referring.addProperty(CIMProperty("P", CIMValue(CIMTYPE_REFERENCE, false)));
    EXPECT_FALSE(isPacked(referring));

    CIMInstance embedding(CIMName("C"));
    embedding.addProperty(CIMProperty("P", CIMValue(referring)));
    EXPECT_FALSE(isPacked(embedding));

    CIMInstance qualified(CIMName("C"));
    qualified.addQualifier(CIMQualifier("Q", CIMValue(true)));
    EXPECT_FALSE(isPacked(qualified));

    CIMProperty property("P", CIMValue(true));
    property.addQualifier(CIMQualifier("Q", CIMValue(true)));
    CIMInstance qualifiedWithin(CIMName("C"));
    qualifiedWithin.addProperty(property);
    EXPECT_FALSE(isPacked(qualifiedWithin));
}

}  // namespace
}  // namespace Pegasus
