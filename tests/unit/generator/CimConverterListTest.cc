// The list that owns the converters of a run.

#include "SennetConverter/framework/CimConverterList.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ConverterFixture.h"
#include "SennetConverter/framework/CimConverter.h"

namespace {

using namespace Pegasus;

/// Writes its number into a log when it is deleted.
class LoggedConverter : public CimConverter {
  public:
    LoggedConverter(const String& fileName, const Velm::Properties& properties,
                    std::vector<int>& deletedOnes, int ownNumber)
        : CimConverter(fileName, properties, 30), deleted(deletedOnes), number(ownNumber) {}
    ~LoggedConverter() override { deleted.push_back(number); }
    LoggedConverter(const LoggedConverter&) = delete;
    LoggedConverter& operator=(const LoggedConverter&) = delete;
    void printOutput(CimScriptParser&, Array<CIMClass>&, CimInstanceLists&) override {}

  private:
    std::vector<int>& deleted;
    int number;
};

class CimConverterListTest : public generatortest::ConverterFixture {
  protected:
    CimConverter* converter(int number) {
        return new LoggedConverter(outputName(), properties, deleted, number);
    }
    std::vector<int> deleted;
};

TEST_F(CimConverterListTest, IsEmptyAtFirst) {
    const CimConverterList list;
    EXPECT_EQ(list.getNumberOfConverters(), 0);
    EXPECT_EQ(list.getConverter(0), nullptr);
}

TEST_F(CimConverterListTest, GrowsBeyondTenInOrder) {
    CimConverterList list;
    std::vector<CimConverter*> added;
    for (int i = 0; i < 21; ++i) {
        added.push_back(converter(i));
        list.addConverter(added.back());
    }
    EXPECT_EQ(list.getNumberOfConverters(), 21);
    for (int i = 0; i < 21; ++i) {
        EXPECT_EQ(list.getConverter(i), added[static_cast<size_t>(i)]) << i;
    }
    EXPECT_EQ(deleted, std::vector<int>{});
}

TEST_F(CimConverterListTest, GivesNullOutsideItsRange) {
    CimConverterList list;
    list.addConverter(converter(0));
    EXPECT_EQ(list.getConverter(-1), nullptr);
    EXPECT_EQ(list.getConverter(1), nullptr);
}

TEST_F(CimConverterListTest, DeletesInOrderAtItsEnd) {
    {
        CimConverterList list;
        list.addConverter(converter(1));
        list.addConverter(nullptr);
        list.addConverter(converter(2));
        EXPECT_EQ(list.getNumberOfConverters(), 3);
        EXPECT_EQ(list.getConverter(1), nullptr);
    }
    EXPECT_EQ(deleted, (std::vector<int>{1, 2}));
}

TEST_F(CimConverterListTest, DeletesOnRequest) {
    CimConverterList list;
    list.addConverter(converter(1));
    list.addConverter(nullptr);
    list.addConverter(converter(2));
    list.clearAndDelete();
    EXPECT_EQ(deleted, (std::vector<int>{1, 2}));
    EXPECT_EQ(list.getNumberOfConverters(), 0);
    list.addConverter(converter(3));
    EXPECT_EQ(list.getNumberOfConverters(), 1);
}

TEST_F(CimConverterListTest, ForgetsWithoutDeleting) {
    CimConverter* kept = converter(1);
    {
        CimConverterList list;
        list.addConverter(kept);
        list.clear();
        EXPECT_EQ(list.getNumberOfConverters(), 0);
        EXPECT_EQ(list.getConverter(0), nullptr);
    }
    EXPECT_EQ(deleted, std::vector<int>{});
    delete kept;
}

}  // namespace
