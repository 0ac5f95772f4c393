#include "protocol/operations/EnumerateClasses.h"

#include <gtest/gtest.h>

#include "OperationFixture.h"

namespace cimomd {
namespace {

class EnumerateClassesTest : public OperationFixture {
  protected:
    EnumerateClassesTest() {
        mof += "class Deep : Leaf { string More; uint8 Depth; };\nclass Alone { string Name; };\n";
    }

    std::string names(const std::string& className, const std::string& parameters = "") {
        return answerTo("EnumerateClassNames", className, parameters);
    }
};

const char* const kLeaf = "<CLASSNAME NAME=\"Leaf\"/>\n";
const char* const kOther = "<CLASSNAME NAME=\"Other\"/>\n";
const char* const kDeep = "<CLASSNAME NAME=\"Deep\"/>\n";

TEST_F(EnumerateClassesTest, namesTheTopClassesWithoutAClassName) {
    const std::string base = "<CLASSNAME NAME=\"Base\"/>\n";
    const std::string alone = "<CLASSNAME NAME=\"Alone\"/>\n";
    EXPECT_EQ(names(""), base + alone);
    EXPECT_EQ(names("", "<IPARAMVALUE NAME=\"ClassName\"/>"), base + alone);
    EXPECT_EQ(names("", flag("DeepInheritance", true)), base + kLeaf + kDeep + kOther + alone);
}

TEST_F(EnumerateClassesTest, namesDirectSubclassesOrAllOfThem) {
    EXPECT_EQ(names("base"), std::string(kLeaf) + kOther);
    EXPECT_EQ(names("Base", flag("DeepInheritance", false)), std::string(kLeaf) + kOther);
    EXPECT_EQ(names("Base", flag("DeepInheritance", true)), std::string(kLeaf) + kDeep + kOther);
    EXPECT_EQ(names("Alone"), "");
}

TEST_F(EnumerateClassesTest, givesTheSameClassesWhole) {
    const std::string top = answerTo("EnumerateClasses", "");
    EXPECT_EQ(count(top, "<CLASS "), 2);
    EXPECT_LT(top.find("<CLASS NAME=\"Base\""), top.find("<CLASS NAME=\"Alone\""));
    EXPECT_TRUE(has(top, "<QUALIFIER NAME=\"Description\""));
    const std::string deep = answerTo("EnumerateClasses", "Base", flag("DeepInheritance", true));
    EXPECT_EQ(count(deep, "<CLASS "), 3);
    EXPECT_TRUE(has(deep, "<CLASS NAME=\"Deep\" SUPERCLASS=\"Leaf\">"));
}

TEST_F(EnumerateClassesTest, obeysItsFlags) {
    const std::string local = answerTo("EnumerateClasses", "Leaf");
    EXPECT_TRUE(has(local, "NAME=\"More\""));
    EXPECT_TRUE(has(local, "NAME=\"Depth\""));
    EXPECT_FALSE(has(local, "NAME=\"Id\""));
    EXPECT_FALSE(has(local, "CLASSORIGIN"));
    const std::string all = answerTo("EnumerateClasses", "Leaf",
                                     flag("LocalOnly", false) + flag("IncludeClassOrigin", true) +
                                         flag("IncludeQualifiers", false));
    EXPECT_TRUE(has(all, "NAME=\"Id\" TYPE=\"uint32\" CLASSORIGIN=\"Base\" PROPAGATED=\"true\""));
    EXPECT_TRUE(has(all, "NAME=\"More\" TYPE=\"string\" CLASSORIGIN=\"Leaf\">"));
    EXPECT_FALSE(has(all, "<QUALIFIER"));
}

TEST_F(EnumerateClassesTest, tellsWhatIsWrong) {
    for (const char* method : {"EnumerateClasses", "EnumerateClassNames"}) {
        EXPECT_EQ(answerTo(method, "None"), "5: there is no class None in root/cimv2");
        EXPECT_EQ(answerTo(method, "Base", propertyList({"Id"})).substr(0, 3), "4: ");
        EXPECT_EQ(answerTo(requestBody(method, "root/none", "Base")),
                  "3: there is no namespace root/none");
    }
}

}  // namespace
}  // namespace cimomd
