// What a subclass may change of what it inherits.

#include <gtest/gtest.h>

#include "mof/MofCompiler.h"

namespace cimomd {
namespace {

constexpr const char* kNamespace = "root/cimv2";

class MofOverridesTest : public testing::Test {
  protected:
    /// The mistakes in a text that may use the shipped qualifiers, or "none".
    static std::string mistakesIn(std::string_view text) {
        ClassRepository repository;
        try {
            MofCompiler compiler(repository, kNamespace);
            compiler.compileFile(std::filesystem::path(SCHEMA_DIR) / "qualifiers.mof");
            compiler.compileText(text, "t.mof");
        } catch (const MofErrors& errors) {
            return errors.what();
        }
        return "none";
    }
};

constexpr std::string_view kLinks =
    "class A { [Key] string k; }; class B : A {}; class Other { [Key] string k; };\n"
    "[Association] class Link { [Key] B REF Left; [Key] A REF Right; };\n";

TEST_F(MofOverridesTest, letsAReferenceLeadToARelatedClassOnly) {
    const std::string links(kLinks);
    EXPECT_EQ(mistakesIn(links + "class S : Link { [Override(\"Right\")] B REF Right; };"), "none");
    EXPECT_EQ(mistakesIn(links + "class S : Link { [Override(\"Left\")] A REF Left; };"), "none");
    EXPECT_EQ(mistakesIn(links + "class S : Link { [Override(\"Right\")] Other REF Right; };"),
              "t.mof:3:38: found class Other, expected the inherited class A or one below it");
}

TEST_F(MofOverridesTest, looksAtTheClassesOfReferencesWhenAllAreDeclared) {
    const std::string links(kLinks);
    EXPECT_EQ(mistakesIn(links + "class S : Link { B2 REF Right; }; class B2 : B {};"), "none");
    EXPECT_EQ(mistakesIn(links + "class S : Link { C2 REF Right; }; class C2 : Other {};"),
              "t.mof:3:18: found class C2, expected the inherited class A or one below it");
    EXPECT_EQ(mistakesIn(links + "class S : Link { Missing REF Right; };"),
              "t.mof:3:18: found class Missing, expected a class that is declared");
}

// A subclass once set a bound qualifier free by another flavor, and the next one changed it.
TEST_F(MofOverridesTest, keepsABoundQualifierBoundAllTheWayDown) {
    for (const char* flavor : {"EnableOverride", "Restricted"}) {
        const std::string free(flavor);
        EXPECT_EQ(mistakesIn("class A { [Key] string k; };\n"
                             "class B : A { [Key : " +
                             free + "] string k; };\nclass C : B { [Key(false)] string k; };"),
                  "t.mof:3:16: found qualifier Key with another value than the superclass gives "
                  "it, expected its value to stay TRUE");
        EXPECT_EQ(mistakesIn("class A { [Static] uint8 M(); };\n"
                             "class B : A { [Static : " +
                             free + "] uint8 M(); };\nclass C : B { [Static(false)] uint8 M(); };"),
                  "t.mof:3:16: found qualifier Static with another value than the superclass gives "
                  "it, expected its value to stay TRUE");
        EXPECT_EQ(mistakesIn("[Exception] class A {};\n[Exception : " + free +
                             "] class B : A {};\n[Exception(false)] class C : B {};"),
                  "t.mof:3:2: found qualifier Exception with another value than the superclass "
                  "gives it, expected its value to stay TRUE");
    }
}

TEST_F(MofOverridesTest, keepsTheFixedSizeOfAnArray) {
    const std::string fixed = "class A { uint8 Fixed[4]; uint8 Any[]; };\n";
    EXPECT_EQ(mistakesIn(fixed + "class B : A { uint8 Fixed[4]; uint8 Any[2]; };"), "none");
    EXPECT_EQ(mistakesIn(fixed + "class B : A { uint8 Fixed[5]; };"),
              "t.mof:2:21: found uint8[5] Fixed, expected the inherited type uint8[4]");
    EXPECT_EQ(mistakesIn(fixed + "class B : A { uint8 Fixed[]; };"),
              "t.mof:2:21: found uint8[] Fixed, expected the inherited type uint8[4]");
}

constexpr std::string_view kMethod =
    "class A { uint32 M([In, OctetString] uint8 Code[], [In] A REF Whom, [Out] string Text); };\n";

TEST_F(MofOverridesTest, keepsTheTypesOfParameters) {
    const std::string method(kMethod);
    EXPECT_EQ(mistakesIn(method + "class B : A { [Override(\"M\")] uint32 M(string Code[]); };"),
              "t.mof:2:47: found string[] Code, expected the inherited type uint8[]");
    EXPECT_EQ(mistakesIn(method + "class B : A { [Override(\"M\")] uint32 M(uint8 Code); };"),
              "t.mof:2:46: found uint8 Code, expected the inherited type uint8[]");
    EXPECT_EQ(mistakesIn(method + "class B : A { [Override(\"M\")] uint32 M(\n"
                                  "  [OctetString(false)] uint8 Code[]); };"),
              "t.mof:3:4: found qualifier OctetString with another value than the superclass gives "
              "it, expected its value to stay TRUE");
}

TEST_F(MofOverridesTest, letsMethodsGrow) {
    const std::string method(kMethod);
    EXPECT_EQ(mistakesIn(method + "class B : A { [Override(\"M\")] uint32 M(\n"
                                  "  uint8 Code[], A REF Whom, [In(false), Out] string Text,\n"
                                  "  [In(false), Out] datetime More); };"),
              "none");
    EXPECT_EQ(mistakesIn(method + "class B : A { uint32 M(string Code); };"), "none");
}

TEST_F(MofOverridesTest, leavesATerminalClassWithoutSubclasses) {
    EXPECT_EQ(mistakesIn("[Terminal] class A {}; class B : A {};"),
              "t.mof:1:34: found superclass A, which is terminal, expected a class that may have "
              "subclasses");
    EXPECT_EQ(mistakesIn("[Terminal(false)] class A {}; class B : A {};"), "none");
}

TEST_F(MofOverridesTest, wantsReferencesInAnAssociation) {
    EXPECT_EQ(mistakesIn("[Association] class A {};"),
              "t.mof:1:21: found association A without references, expected references to the "
              "classes that it connects");
    EXPECT_EQ(mistakesIn("[Association, Abstract] class A {};"), "none");
    EXPECT_EQ(mistakesIn(std::string(kLinks) + "[Association] class S : Link {};"), "none");
}

TEST_F(MofOverridesTest, takesWhatIsSaidToBeNoAssociationForNone) {
    EXPECT_EQ(mistakesIn("class A {};\n[Aggregation, Association] class C { A REF R; };"), "none");
    EXPECT_EQ(mistakesIn("[Association(false), Aggregation] class C {};"),
              "t.mof:1:2: found 'Association', expected a qualifier for a class\n"
              "t.mof:1:22: found 'Aggregation', expected a qualifier for a class");
}

}  // namespace
}  // namespace cimomd
