#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(CIMPropertyListTest, IsNullByDefault) {
    const CIMPropertyList list;
    EXPECT_TRUE(list.isNull());
    EXPECT_EQ(list.size(), 0U);
    EXPECT_EQ(list.getPropertyNameArray().size(), 0U);
    EXPECT_THROW(list[0], IndexOutOfBoundsException);
}

TEST(CIMPropertyListTest, IsNotNullWithAnEmptyArray) {
    CIMPropertyList list;
    list.set(Array<CIMName>());
    EXPECT_FALSE(list.isNull());
    EXPECT_EQ(list.size(), 0U);
    EXPECT_FALSE(CIMPropertyList(Array<CIMName>()).isNull());
}

TEST(CIMPropertyListTest, GivesItsNames) {
    Array<CIMName> names;
    names.append("First");
    names.append("Second");
    CIMPropertyList list(names);
    EXPECT_EQ(list.size(), 2U);
    EXPECT_EQ(list[1].getString(), "Second");
    EXPECT_EQ(list.getPropertyNameArray()[0].getString(), "First");
    EXPECT_THROW(list[2], IndexOutOfBoundsException);
    list.clear();
    EXPECT_TRUE(list.isNull());
    EXPECT_EQ(list.size(), 0U);
}

}  // namespace
}  // namespace Pegasus
