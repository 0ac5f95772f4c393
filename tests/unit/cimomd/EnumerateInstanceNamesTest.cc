#include "protocol/operations/EnumerateInstanceNames.h"

#include <gtest/gtest.h>

#include "OperationFixture.h"

namespace cimomd {
namespace {

class EnumerateInstanceNamesTest : public OperationFixture {};

std::string nameOf(const std::string& className, int id) {
    return "<INSTANCENAME CLASSNAME=\"" + className +
           "\"><KEYBINDING NAME=\"Id\"><KEYVALUE VALUETYPE=\"numeric\">" + std::to_string(id) +
           "</KEYVALUE></KEYBINDING></INSTANCENAME>\n";
}

TEST_F(EnumerateInstanceNamesTest, namesTheInstancesOfAClassAndItsSubclasses) {
    provide("Other", 1);
    provide("Leaf", 2);
    EXPECT_EQ(answerTo("EnumerateInstanceNames", "BASE"),
              nameOf("Leaf", 1) + nameOf("Leaf", 2) + nameOf("Other", 1));
    EXPECT_EQ(answerTo("EnumerateInstanceNames", "Other"), nameOf("Other", 1));
}

TEST_F(EnumerateInstanceNamesTest, tellsWhatIsWrong) {
    EXPECT_EQ(answerTo("EnumerateInstanceNames", "None"),
              "5: there is no class None in root/cimv2");
    EXPECT_EQ(answerTo("EnumerateInstanceNames", ""),
              "4: EnumerateInstanceNames needs the parameter ClassName");
    EXPECT_EQ(answerTo("EnumerateInstanceNames", "Base", flag("LocalOnly", true)).substr(0, 3),
              "4: ");
}

TEST_F(EnumerateInstanceNamesTest, failsWithTheNameOfTheClassThatFails) {
    provide("Leaf", 1);
    provide("Other", 3, 2);
    EXPECT_EQ(answerTo("EnumerateInstanceNames", "Base"), "1: Other: the source broke");
}

}  // namespace
}  // namespace cimomd
