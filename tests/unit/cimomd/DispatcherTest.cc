#include "protocol/Dispatcher.h"

#include <gtest/gtest.h>

#include "OperationFixture.h"

namespace cimomd {
namespace {

class DispatcherTest : public OperationFixture {};

TEST_F(DispatcherTest, namesWhatIsWrongWithARequest) {
    const std::string unknownOperation = "7: the operation DeleteClass is not supported";
    EXPECT_EQ(answerTo(requestBody("DeleteClass", "root/cimv2", "Base")), unknownOperation);
    EXPECT_EQ(answerTo(requestBody("DeleteClass", "root/none", "Base")), unknownOperation);
    std::string method = requestBody("Reset", "root/cimv2", "");
    method.replace(method.find("<IMETHODCALL"), 12, "<METHODCALL");
    method.replace(method.find("</IMETHODCALL"), 13, "</METHODCALL");
    method.replace(method.find("<LOCALNAMESPACEPATH>"), 20, "<LOCALCLASSPATH><LOCALNAMESPACEPATH>");
    method.replace(method.find("</LOCALNAMESPACEPATH>"), 21,
                   "</LOCALNAMESPACEPATH><CLASSNAME NAME=\"Base\"/></LOCALCLASSPATH>");
    EXPECT_EQ(answerTo(method), "7: methods are not executed here: Reset");
    EXPECT_EQ(answerTo(requestBody("OpenEnumerateInstances", "root/cimv2", "Base")),
              "7: the operation OpenEnumerateInstances is not supported");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/none", "Base")),
              "3: there is no namespace root/none");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "None")),
              "6: there is no class None in root/cimv2");
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "None")),
              "5: there is no class None in root/cimv2");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "")),
              "4: GetClass needs the parameter ClassName");
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "")),
              "4: EnumerateInstances needs the parameter ClassName");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "Base", flag("DeepInheritance", true)))
                  .substr(0, 2),
              "4:");
}

TEST_F(DispatcherTest, ignoresTheCaseOfNames) {
    EXPECT_TRUE(
        has(answerTo(requestBody("getclass", "ROOT/CIMV2", "BASE")), "<CLASS NAME=\"Base\""));
}

TEST_F(DispatcherTest, answersGetClassByItsFlags) {
    const std::string byDefault = answerTo(requestBody("GetClass", "root/cimv2", "Leaf"));
    EXPECT_TRUE(has(byDefault, "<CLASS NAME=\"Leaf\" SUPERCLASS=\"Base\""));
    EXPECT_TRUE(has(byDefault, "NAME=\"More\""));
    EXPECT_FALSE(has(byDefault, "NAME=\"Id\""));
    EXPECT_FALSE(has(byDefault, "CLASSORIGIN"));

    const std::string whole =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeClassOrigin", true)));
    EXPECT_TRUE(has(whole, "NAME=\"Id\""));
    EXPECT_TRUE(has(whole, "CLASSORIGIN=\"Base\""));
    EXPECT_TRUE(has(whole, "CLASSORIGIN=\"Leaf\""));
    EXPECT_TRUE(has(whole, "PROPAGATED=\"true\""));
    EXPECT_TRUE(has(whole, "QUALIFIER NAME=\"Key\""));

    const std::string bare =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeQualifiers", false)));
    EXPECT_FALSE(has(bare, "QUALIFIER"));

    const std::string some =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + propertyList({"note", "None"})));
    EXPECT_TRUE(has(some, "NAME=\"Note\""));
    EXPECT_FALSE(has(some, "NAME=\"Id\""));
    EXPECT_FALSE(has(some, "NAME=\"More\""));
}

TEST_F(DispatcherTest, givesTheInstancesOfAClassAndItsSubclasses) {
    provide("Other", 1);
    provide("Leaf", 2);
    const std::string all =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base", flag("LocalOnly", false)));
    EXPECT_EQ(count(all, "<VALUE.NAMEDINSTANCE>"), 3);
    EXPECT_EQ(count(all,
                    "<INSTANCENAME CLASSNAME=\"Leaf\"><KEYBINDING NAME=\"Id\"><KEYVALUE "
                    "VALUETYPE=\"numeric\""),
              2);
    EXPECT_LT(all.find("CLASSNAME=\"Leaf\""), all.find("CLASSNAME=\"Other\""));
    EXPECT_EQ(count(all, "NAME=\"More\""), 2);
    const std::string leaves =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "leaf", flag("LocalOnly", false)));
    EXPECT_EQ(count(leaves, "<VALUE.NAMEDINSTANCE>"), 2);
}

TEST_F(DispatcherTest, leavesOutWhatTheFlagsLeaveOut) {
    provide("Leaf", 1);
    const std::string shallow =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base",
                             flag("LocalOnly", false) + flag("DeepInheritance", false)));
    EXPECT_TRUE(has(shallow, "PROPERTY NAME=\"Id\""));
    EXPECT_FALSE(has(shallow, "NAME=\"More\""));
    const std::string shallowSome =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base",
                             flag("LocalOnly", false) + flag("DeepInheritance", false) +
                                 propertyList({"More", "Note"})));
    EXPECT_TRUE(has(shallowSome, "PROPERTY NAME=\"Note\""));
    EXPECT_FALSE(has(shallowSome, "NAME=\"More\""));
    EXPECT_FALSE(has(shallowSome, "PROPERTY NAME=\"Id\""));
    const std::string local =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf",
                             flag("LocalOnly", true) + flag("IncludeQualifiers", true)));
    EXPECT_TRUE(has(local, "PROPERTY NAME=\"More\""));
    EXPECT_TRUE(has(local, "PROPERTY NAME=\"Id\""));
    EXPECT_FALSE(has(local, "<QUALIFIER"));
    const std::string origin =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeClassOrigin", true)));
    EXPECT_TRUE(has(origin, "CLASSORIGIN=\"Base\""));
    const std::string nothing =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf", propertyList({})));
    EXPECT_TRUE(has(nothing, "<INSTANCENAME CLASSNAME=\"Leaf\">"));
    EXPECT_FALSE(has(nothing, "<PROPERTY"));
}

TEST_F(DispatcherTest, anotherClassDoesNotSufferFromAFailingProvider) {
    provide("Other", 3, 2);
    provide("Leaf", 1);
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Other")),
              "1: Other: the source broke");
    EXPECT_EQ(count(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf")),
                    "<VALUE.NAMEDINSTANCE>"),
              1);
}

TEST_F(DispatcherTest, aClassWithoutProviderHasNoInstances) {
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base")), "");
}

}  // namespace
}  // namespace cimomd
