// The instances of a script's classes, one array per class that has some.

#include "SennetConverter/framework/CimInstanceLists.h"

#include <gtest/gtest.h>

#include <string>

#include "ConverterFixture.h"

namespace {

using namespace Pegasus;
using generatortest::utf8;

Array<CIMInstance> instances(const char* className, Uint32 count) {
    Array<CIMInstance> result;
    for (Uint32 i = 0; i < count; ++i) {
        result.append(CIMInstance(CIMName(className)));
    }
    return result;
}

void add(CimInstanceLists& lists, const char* className, Uint32 count) {
    Array<CIMInstance> array = instances(className, count);
    lists.addInstanceList(array);
}

TEST(CimInstanceLists, IsEmptyAtFirst) {
    const CimInstanceLists lists;
    EXPECT_EQ(lists.getNumberOfInstanceLists(), 0);
    EXPECT_EQ(lists.getInstanceList(0).size(), 0U);
}

TEST(CimInstanceLists, CountsOnlyArraysThatHoldInstances) {
    CimInstanceLists lists;
    add(lists, "A", 0);
    EXPECT_EQ(lists.getNumberOfInstanceLists(), 0);
    add(lists, "B", 2);
    add(lists, "C", 0);
    add(lists, "D", 1);
    ASSERT_EQ(lists.getNumberOfInstanceLists(), 2);
    EXPECT_EQ(lists.getInstanceList(0).size(), 2U);
    EXPECT_EQ(utf8(lists.getInstanceList(1)[0].getClassName().getString()), "D");
}

TEST(CimInstanceLists, GivesAnEmptyArrayOutsideItsRange) {
    CimInstanceLists lists;
    add(lists, "A", 1);
    add(lists, "B", 1);
    add(lists, "C", 1);
    EXPECT_EQ(lists.getInstanceList(5).size(), 0U);
    EXPECT_EQ(lists.getInstanceList(3).size(), 0U);
    EXPECT_EQ(lists.getInstanceList(-1).size(), 0U);
}

TEST(CimInstanceLists, GrowsBeyondTenInOrder) {
    CimInstanceLists lists;
    for (Uint32 i = 1; i <= 21; ++i) {
        add(lists, "A", i);
    }
    ASSERT_EQ(lists.getNumberOfInstanceLists(), 21);
    for (int i = 0; i < 21; ++i) {
        EXPECT_EQ(lists.getInstanceList(i).size(), static_cast<Uint32>(i + 1));
    }
    EXPECT_EQ(lists.getInstanceList(21).size(), 0U);
}

TEST(CimInstanceLists, KeepsItsInstancesWhenTheSourceIsCleared) {
    CimInstanceLists lists;
    Array<CIMInstance> source = instances("A", 2);
    lists.addInstanceList(source);
    source.clear();
    EXPECT_EQ(lists.getInstanceList(0).size(), 2U);
}

}  // namespace
