#include "protocol/InstanceCursor.h"

#include <gtest/gtest.h>

#include "OperationFixture.h"

namespace cimomd {
namespace {

class InstanceCursorTest : public OperationFixture {
  protected:
    InstanceCursorTest() {
        mof +=
            "instance of Leaf { Id = 70; More = \"own\"; };\n"
            "instance of Base { Id = 80; Note = \"n\"; };\n";
        provide("Leaf", 1);
    }
};

TEST_F(InstanceCursorTest, givesDeclaredInstancesBeforeThoseOfTheProvider) {
    const std::string all =
        answerTo("EnumerateInstances", "Base", flag("IncludeClassOrigin", true));
    EXPECT_EQ(count(all, "<VALUE.NAMEDINSTANCE>"), 3);
    const std::size_t base = all.find("<VALUE>80</VALUE>");
    const std::size_t declared = all.find("<VALUE>70</VALUE>");
    const std::size_t provided = all.find("<VALUE>1</VALUE>");
    EXPECT_LT(base, declared);
    EXPECT_LT(declared, provided);
    EXPECT_NE(provided, std::string::npos);
    EXPECT_EQ(count(all, "<PROPERTY NAME=\"Id\" TYPE=\"uint32\" CLASSORIGIN=\"Base\""), 3);
}

TEST_F(InstanceCursorTest, letsDeclaredInstancesBeFoundByTheirKeys) {
    const std::string name =
        "<IPARAMVALUE NAME=\"InstanceName\"><INSTANCENAME CLASSNAME=\"Leaf\"><KEYBINDING "
        "NAME=\"Id\"><KEYVALUE VALUETYPE=\"numeric\">70</KEYVALUE></KEYBINDING></INSTANCENAME>"
        "</IPARAMVALUE>";
    const std::string found = answerTo("GetInstance", "", name);
    EXPECT_TRUE(has(found, "<PROPERTY NAME=\"More\" TYPE=\"string\"><VALUE>own</VALUE>"));
    // What one answer marks in its copy is not seen in the next.
    EXPECT_EQ(answerTo("GetInstance", "", name), found);
}

TEST_F(InstanceCursorTest, showsDeclaredMethodsInClassAnswers) {
    mof += "class Machine { [Key] uint32 Id; uint32 Reset(uint8 Delay); };\n";
    EXPECT_TRUE(has(answerTo("GetClass", "Machine"),
                    "<METHOD NAME=\"Reset\" TYPE=\"uint32\"><PARAMETER NAME=\"Delay\" "
                    "TYPE=\"uint8\"></PARAMETER></METHOD></CLASS>"));
}

}  // namespace
}  // namespace cimomd
