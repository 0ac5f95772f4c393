#include "protocol/operations/GetInstance.h"

#include <gtest/gtest.h>

#include "OperationFixture.h"

namespace cimomd {
namespace {

std::string named(const std::string& className, const std::string& keys) {
    return "<IPARAMVALUE NAME=\"InstanceName\"><INSTANCENAME CLASSNAME=\"" + className + "\">" +
           keys + "</INSTANCENAME></IPARAMVALUE>";
}

std::string key(const std::string& name, const std::string& type, const std::string& value) {
    return "<KEYBINDING NAME=\"" + name + "\"><KEYVALUE VALUETYPE=\"" + type + "\">" + value +
           "</KEYVALUE></KEYBINDING>";
}

class GetInstanceTest : public OperationFixture {
  protected:
    GetInstanceTest() {
        provide("Leaf", 3);
        provide("Other", 3, 2);
    }

    std::string get(const std::string& parameters) {
        return answerTo("GetInstance", "", parameters);
    }
    std::string getLeaf(const std::string& keys) { return get(named("Leaf", keys)); }
};

TEST_F(GetInstanceTest, givesTheInstanceWithTheKey) {
    EXPECT_EQ(getLeaf(key("Id", "numeric", "2")),
              "<INSTANCE CLASSNAME=\"Leaf\"><PROPERTY NAME=\"Id\" TYPE=\"uint32\" "
              "PROPAGATED=\"true\"><VALUE>2</VALUE></PROPERTY><PROPERTY NAME=\"Note\" "
              "TYPE=\"string\" PROPAGATED=\"true\"></PROPERTY><PROPERTY NAME=\"More\" "
              "TYPE=\"string\"><VALUE>m</VALUE></PROPERTY></INSTANCE>\n");
}

TEST_F(GetInstanceTest, comparesKeysByMeaning) {
    const std::string second = getLeaf(key("Id", "numeric", "2"));
    EXPECT_EQ(getLeaf(key("ID", "numeric", "0x2")), second);
    EXPECT_EQ(getLeaf(key("id", "numeric", "+2")), second);
    EXPECT_EQ(get(named("LEAF", "<KEYVALUE VALUETYPE=\"numeric\">2</KEYVALUE>")), second);
}

TEST_F(GetInstanceTest, tellsAnInstanceThatIsNotThere) {
    const std::string none = "6: there is no instance with these keys";
    EXPECT_EQ(getLeaf(key("Id", "numeric", "4")), none);
    EXPECT_EQ(getLeaf(key("Id", "numeric", "1.5")), none);
    EXPECT_EQ(get(named("Base", key("Id", "numeric", "2"))), none);
}

TEST_F(GetInstanceTest, refusesKeysThatTheClassCannotHave) {
    EXPECT_EQ(getLeaf(""), "4: parameter InstanceName lacks the key Id");
    EXPECT_EQ(getLeaf(key("Note", "string", "x")),
              "4: parameter InstanceName has the key Note, which the class does not have");
    EXPECT_EQ(getLeaf(key("Id", "numeric", "2") + key("Name", "string", "x")),
              "4: parameter InstanceName has the key Name, which the class does not have");
    EXPECT_EQ(getLeaf(key("Id", "string", "2")),
              "4: parameter InstanceName has the key Id as a string; expected a number");
    EXPECT_EQ(getLeaf(key("Id", "boolean", "true")),
              "4: parameter InstanceName has the key Id as a boolean; expected a number");
}

TEST_F(GetInstanceTest, refusesOtherParameters) {
    EXPECT_EQ(get(""), "4: GetInstance needs the parameter InstanceName");
    EXPECT_EQ(get("<IPARAMVALUE NAME=\"InstanceName\"/>"),
              "4: GetInstance needs the parameter InstanceName");
    EXPECT_EQ(get(named("None", key("Id", "numeric", "1"))),
              "5: there is no class None in root/cimv2");
    const std::string second = named("Leaf", key("Id", "numeric", "2"));
    EXPECT_EQ(get(second + flag("DeepInheritance", true)).substr(0, 3), "4: ");
    EXPECT_EQ(get(second + second).substr(0, 3), "4: ");
}

TEST_F(GetInstanceTest, leavesOutWhatTheFlagsLeaveOut) {
    const std::string second = named("Leaf", key("Id", "numeric", "2"));
    const std::string some = get(second + propertyList({"MORE", "more", "None"}));
    EXPECT_EQ(some,
              "<INSTANCE CLASSNAME=\"Leaf\"><PROPERTY NAME=\"More\" TYPE=\"string\">"
              "<VALUE>m</VALUE></PROPERTY></INSTANCE>\n");
    EXPECT_EQ(get(second + propertyList({})), "<INSTANCE CLASSNAME=\"Leaf\"></INSTANCE>\n");
    const std::string origin = get(second + flag("IncludeClassOrigin", true));
    EXPECT_EQ(count(origin, "CLASSORIGIN=\"Base\""), 2);
    EXPECT_EQ(count(origin, "CLASSORIGIN=\"Leaf\""), 1);
    EXPECT_EQ(get(second + flag("LocalOnly", true) + flag("IncludeQualifiers", true)), get(second));
}

TEST_F(GetInstanceTest, readsNoFurtherThanTheInstance) {
    EXPECT_TRUE(has(get(named("Other", key("Id", "numeric", "1"))), "<VALUE>1</VALUE>"));
    EXPECT_EQ(get(named("Other", key("Id", "numeric", "3"))), "1: Other: the source broke");
}

}  // namespace
}  // namespace cimomd
