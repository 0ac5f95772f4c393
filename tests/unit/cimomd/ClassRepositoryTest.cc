#include "repository/ClassRepository.h"

#include <gtest/gtest.h>

#include "mof/MofCompiler.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstClass;
using Pegasus::CIMConstProperty;
using Pegasus::CIMConstQualifier;

constexpr const char* kNamespace = "root/cimv2";

class ClassRepositoryTest : public testing::Test {
  protected:
    ClassRepositoryTest() {
        MofCompiler(repository, Pegasus::CIMNamespaceName(kNamespace)).compileText(kText, "t.mof");
    }

    const CIMConstClass& find(const char* name) const {
        return *repository.findClass(kNamespace, name);
    }
    static CIMConstProperty propertyOf(const CIMConstClass& found, const char* name) {
        return found.getProperty(found.findProperty(name));
    }
    /// "value", "value (propagated)" or "none".
    template <typename Element>
    static std::string qualifier(const Element& element, const char* name) {
        const Pegasus::Uint32 index = element.findQualifier(name);
        if (index == Pegasus::PEG_NOT_FOUND)
            return "none";
        const CIMConstQualifier found = element.getQualifier(index);
        return utf8Of(found.getValue().toString()) + (found.getPropagated() ? " (propagated)" : "");
    }

    static constexpr std::string_view kText =
        "Qualifier Inherited : string, Scope(any);\n"
        "Qualifier Own : string, Scope(any), Flavor(Restricted);\n"
        "Qualifier Fixed : string, Scope(any), Flavor(DisableOverride);\n"
        "[Inherited(\"top\"), Own(\"top\"), Fixed(\"same\")]\n"
        "class Top {\n"
        "  [Inherited(\"p\"), Own(\"p\"), Fixed(\"same\")] string Name = \"n\";\n"
        "  uint16 Count = 7;\n"
        "};\n"
        "[Inherited(\"middle\")]\n"
        "class Middle : Top { [Inherited(\"q\")] string name; uint8 Extra; };\n"
        "class Bottom : middle { [Fixed(\"same\")] uint16 Count = 8; };\n"
        "class Side : Top {};\n"
        "class Alone {};\n";

    ClassRepository repository;
};

TEST_F(ClassRepositoryTest, keepsATopClassAsItWasDeclared) {
    const CIMConstClass& top = find("TOP");
    EXPECT_TRUE(top.getSuperClassName().isNull());
    EXPECT_EQ(qualifier(top, "Own"), "top");
    EXPECT_EQ(utf8Of(propertyOf(top, "Name").getClassOrigin().getString()), "Top");
    EXPECT_FALSE(propertyOf(top, "Name").getPropagated());
}

TEST_F(ClassRepositoryTest, handsQualifiersDownByTheirFlavors) {
    const CIMConstClass& middle = find("Middle");
    EXPECT_EQ(qualifier(middle, "Inherited"), "middle");
    EXPECT_EQ(qualifier(middle, "Own"), "none");
    EXPECT_EQ(qualifier(middle, "Fixed"), "same (propagated)");
    EXPECT_EQ(qualifier(find("Side"), "Inherited"), "top (propagated)");
    EXPECT_EQ(qualifier(find("Bottom"), "Inherited"), "middle (propagated)");
}

TEST_F(ClassRepositoryTest, marksInheritedPropertiesWithTheirOrigin) {
    const CIMConstClass& bottom = find("Bottom");
    ASSERT_EQ(bottom.getPropertyCount(), 3U);
    const CIMConstProperty name = propertyOf(bottom, "Name");
    EXPECT_TRUE(name.getPropagated());
    EXPECT_EQ(utf8Of(name.getClassOrigin().getString()), "Top");
    EXPECT_EQ(qualifier(name, "Inherited"), "q (propagated)");
    EXPECT_EQ(qualifier(name, "Own"), "none");
    const CIMConstProperty extra = propertyOf(bottom, "Extra");
    EXPECT_TRUE(extra.getPropagated());
    EXPECT_EQ(utf8Of(extra.getClassOrigin().getString()), "Middle");
}

TEST_F(ClassRepositoryTest, letsASubclassOverrideAProperty) {
    const CIMConstProperty count = propertyOf(find("Bottom"), "Count");
    EXPECT_FALSE(count.getPropagated());
    EXPECT_EQ(utf8Of(count.getValue().toString()), "8");
    EXPECT_EQ(utf8Of(count.getClassOrigin().getString()), "Top");
    const CIMConstProperty name = propertyOf(find("Middle"), "Name");
    EXPECT_FALSE(name.getPropagated());
    EXPECT_EQ(utf8Of(name.getName().getString()), "name");
    EXPECT_EQ(utf8Of(name.getValue().toString()), "n");
    EXPECT_EQ(qualifier(name, "Inherited"), "q");
    EXPECT_EQ(qualifier(name, "Own"), "none");
    EXPECT_EQ(qualifier(name, "Fixed"), "same (propagated)");
}

TEST_F(ClassRepositoryTest, leavesTheSuperclassAsItWas) {
    EXPECT_EQ(qualifier(find("Top"), "Inherited"), "top");
    EXPECT_FALSE(propertyOf(find("Middle"), "Extra").getPropagated());
    EXPECT_EQ(utf8Of(propertyOf(find("Top"), "Count").getValue().toString()), "7");
}

TEST_F(ClassRepositoryTest, walksDescendantsBeforeTheNextSibling) {
    std::string names;
    for (const Pegasus::CIMName& name : repository.withDescendants(kNamespace, "top"))
        names += utf8Of(name.getString()) + " ";
    EXPECT_EQ(names, "Top Middle Bottom Side ");
    EXPECT_TRUE(repository.withDescendants(kNamespace, "None").empty());
    EXPECT_TRUE(repository.withDescendants("root/none", "Top").empty());
}

TEST_F(ClassRepositoryTest, ignoresTheCaseAndTheFirstSlashOfNamespaces) {
    EXPECT_TRUE(repository.hasNamespace("/ROOT/CimV2"));
    EXPECT_FALSE(repository.hasNamespace("root/cimv"));
}

TEST_F(ClassRepositoryTest, boundsTheDepthOfInheritance) {
    std::string text = "class D0 {};";
    for (int i = 1; i <= 64; ++i)
        text += "class D" + std::to_string(i) + " : D" + std::to_string(i - 1) + " {};";
    MofCompiler compiler(repository, Pegasus::CIMNamespaceName(kNamespace));
    compiler.compileText(text, "deep.mof");
    EXPECT_NE(repository.findClass(kNamespace, "D64"), nullptr);
    EXPECT_THROW(compiler.compileText("class D65 : D64 {};", "deeper.mof"), MofErrors);
}

TEST_F(ClassRepositoryTest, boundsTheFeaturesOfAClass) {
    std::string text = "class Wide { uint8 p0;";
    for (int i = 1; i < 4096; ++i)
        text += "uint8 p" + std::to_string(i) + ";";
    MofCompiler compiler(repository, Pegasus::CIMNamespaceName(kNamespace));
    compiler.compileText(text + "};", "wide.mof");
    EXPECT_EQ(find("Wide").getPropertyCount(), 4096U);
    EXPECT_THROW(compiler.compileText("class Wider : Wide { uint8 q; };", "wider.mof"), MofErrors);
}

TEST_F(ClassRepositoryTest, listsTopClassesAndSubclasses) {
    std::string names;
    for (const Pegasus::CIMName& name : repository.topClasses(kNamespace))
        names += utf8Of(name.getString()) + " ";
    for (const Pegasus::CIMName& name : repository.subclassesOf(kNamespace, "Top"))
        names += "Top/" + utf8Of(name.getString()) + " ";
    EXPECT_EQ(names, "Top Alone Top/Middle Top/Side ");
    EXPECT_TRUE(repository.isSameOrSubclass(kNamespace, "bottom", "TOP"));
    EXPECT_TRUE(repository.isSameOrSubclass(kNamespace, "Top", "Top"));
    EXPECT_FALSE(repository.isSameOrSubclass(kNamespace, "Top", "Bottom"));
    EXPECT_FALSE(repository.isSameOrSubclass(kNamespace, "None", "None"));
}

TEST_F(ClassRepositoryTest, copiesAreIndependent) {
    ClassRepository copy = repository;
    EXPECT_TRUE(copy.addClass(kNamespace, Pegasus::CIMClass("New", "Top")).empty());
    EXPECT_NE(copy.findClass(kNamespace, "New"), nullptr);
    EXPECT_EQ(repository.findClass(kNamespace, "New"), nullptr);
}

}  // namespace
}  // namespace cimomd
