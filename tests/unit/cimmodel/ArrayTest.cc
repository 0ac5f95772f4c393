#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>
#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace Pegasus {
namespace {

template <class T>
std::vector<T> elementsOf(const Array<T>& array) {
    return {array.begin(), array.end()};
}

TEST(ArrayTest, IsMadeOfACountAValueOrElements) {
    EXPECT_EQ(Array<Uint32>().size(), 0U);
    EXPECT_EQ(elementsOf(Array<Uint32>(3)), (std::vector<Uint32>{0, 0, 0}));
    EXPECT_EQ(elementsOf(Array<String>(2, "x")), (std::vector<String>{"x", "x"}));
    const Uint64 items[] = {4, 5};
    EXPECT_EQ(elementsOf(Array<Uint64>(items, 2)), (std::vector<Uint64>{4, 5}));
    EXPECT_EQ(Array<Uint64>(items, 0).size(), 0U);
}

TEST(ArrayTest, StoresBooleansOneByOne) {
    Array<Boolean> array;
    array.append(true);
    array.append(false);
    const bool* const data = array.getData();
    EXPECT_TRUE(data[0]);
    EXPECT_FALSE(data[1]);
}

TEST(ArrayTest, RefusesPositionsThatDoNotExist) {
    Array<Uint32> array(2, 7);
    const Array<Uint32>& constArray = array;
    EXPECT_EQ(constArray[1], 7U);
    EXPECT_THROW(array[2], IndexOutOfBoundsException);
    EXPECT_THROW(constArray[2], IndexOutOfBoundsException);
    EXPECT_THROW(Array<Uint32>()[0], IndexOutOfBoundsException);
    EXPECT_THROW(array.insert(3, 1), IndexOutOfBoundsException);
    EXPECT_THROW(array.remove(2), IndexOutOfBoundsException);
    EXPECT_THROW(array.remove(1, 2), IndexOutOfBoundsException);
    EXPECT_THROW(array.remove(1, 0xFFFFFFFF), IndexOutOfBoundsException);
    EXPECT_THROW(array.remove(3, 0), IndexOutOfBoundsException);
    EXPECT_EQ(elementsOf(array), (std::vector<Uint32>{7, 7}));
}

TEST(ArrayTest, ChangesOneCopyOnly) {
    Array<String> first(2, "a");
    Array<String> second = first;
    EXPECT_EQ(first.getData(), second.getData());
    second[0] = "b";
    Array<String> third = first;
    third.append("c");
    Array<String> fourth = first;
    fourth.remove(0);
    Array<String> fifth = first;
    fifth.clear();
    EXPECT_EQ(elementsOf(first), (std::vector<String>{"a", "a"}));
    EXPECT_EQ(elementsOf(second), (std::vector<String>{"b", "a"}));
    EXPECT_EQ(elementsOf(third), (std::vector<String>{"a", "a", "c"}));
    EXPECT_EQ(elementsOf(fourth), (std::vector<String>{"a"}));
    EXPECT_EQ(fifth.size(), 0U);
}

TEST(ArrayTest, InsertsPrependsAndRemoves) {
    Array<String> array;
    array.append("b");
    array.prepend("a");
    array.insert(2, "d");
    array.insert(2, "c");
    EXPECT_EQ(elementsOf(array), (std::vector<String>{"a", "b", "c", "d"}));
    const String front[] = {"x", "y"};
    array.prepend(front, 2);
    array.insert(3, front, 1);
    array.append(front, 2);
    EXPECT_EQ(elementsOf(array),
              (std::vector<String>{"x", "y", "a", "x", "b", "c", "d", "x", "y"}));
    array.remove(1, 7);
    EXPECT_EQ(elementsOf(array), (std::vector<String>{"x", "y"}));
    array.remove(1, 0);
    array.remove(2, 0);
    array.remove(1);
    EXPECT_EQ(elementsOf(array), (std::vector<String>{"x"}));
}

TEST(ArrayTest, TakesItsOwnElements) {
    Array<String> array;
    array.append("a");
    for (int i = 0; i < 20; ++i)
        array.append(array[0]);
    EXPECT_EQ(array.size(), 21U);
    EXPECT_EQ(array[20], "a");
    array.clear();
    array.append("x");
    array.append("y");
    array.appendArray(array);
    array.insert(1, array.getData() + 2, 2);
    EXPECT_EQ(elementsOf(array), (std::vector<String>{"x", "x", "y", "y", "x", "y"}));
    const Array<String>& alias = array;
    array = alias;
    EXPECT_EQ(array.size(), 6U);
}

TEST(ArrayTest, KeepsItsRoom) {
    Array<Uint8> array;
    array.reserveCapacity(1000);
    const Uint8* const before = array.getData();
    for (Uint32 i = 0; i < 1000; ++i)
        array.append(static_cast<Uint8>(i));
    EXPECT_EQ(array.getData(), before);
    EXPECT_EQ(array[999], 231);
}

TEST(ArrayTest, MovesFrom) {
    Array<String> first(1, "a");
    const Array<String> second = std::move(first);
    EXPECT_EQ(second.size(), 1U);
    first = Array<String>(2, "b");
    EXPECT_EQ(first[1], "b");
}

TEST(ArrayTest, DestroysEveryElementOnce) {
    const auto tracked = std::make_shared<int>(0);
    {
        Array<std::shared_ptr<int>> array;
        for (int i = 0; i < 10; ++i)
            array.append(tracked);
        EXPECT_EQ(tracked.use_count(), 11);
        Array<std::shared_ptr<int>> copy = array;
        EXPECT_EQ(tracked.use_count(), 11);
        copy[0] = nullptr;
        EXPECT_EQ(tracked.use_count(), 20);
        array.remove(2, 3);
        EXPECT_EQ(tracked.use_count(), 17);
    }
    EXPECT_EQ(tracked.use_count(), 1);
}

TEST(ArrayTest, HoldsArrays) {
    Array<Array<Uint16>> lists;
    lists.append(Array<Uint16>(2, 9));
    Array<Uint16> inner = lists[0];
    inner[0] = 1;
    EXPECT_EQ(lists[0][0], 9);
}

}  // namespace
}  // namespace Pegasus
