// Forms that published schemas use, small and odd ones above all.

#include <gtest/gtest.h>

#include "mof/MofCompiler.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

constexpr const char* kNamespace = "root/cimv2";

class MofSchemaFormsTest : public testing::Test {
  protected:
    MofSchemaFormsTest() {
        MofCompiler(repository, kNamespace)
            .compileFile(std::filesystem::path(SCHEMA_DIR) / "qualifiers.mof");
    }

    /// The mistakes, or "none".
    std::string mistakesIn(std::string_view text) {
        try {
            MofCompiler(repository, kNamespace).compileText(text, "t.mof");
        } catch (const MofErrors& errors) {
            return errors.what();
        }
        return "none";
    }
    std::string defaultOf(const char* className, const char* property) const {
        const auto& found = *repository.findClass(kNamespace, className);
        const auto value = found.getProperty(found.findProperty(property)).getValue();
        return value.isNull() ? "null" : utf8Of(value.toString());
    }

    ClassRepository repository;
};

TEST_F(MofSchemaFormsTest, takesAClassWithTheQualifiersOfASchema) {
    EXPECT_EQ(mistakesIn("#pragma locale (\"en_US\")\n"
                         "#pragma instancelocale (\"en_US\")\n#pragma source (\"x\")\n"
                         "#pragma nonlocal (\"y\", 2)\n"
                         "[Abstract, Version ( \"2.8.0\" ), Experimental: DisableOverride,\n"
                         " UMLPackagePath ( \"CIM::Core::Top\" ), Deprecated { \"No value\" },\n"
                         " ClassConstraint { \"inv: true\" }, Terminal ( false ),\n"
                         " Description ( \"one \" // a comment\n \"two\" /* and ** another */ ) :\n"
                         "   ToSubclass Translatable]\n"
                         "class S_Top {\n"
                         " [KEY, MaxLen ( 256 ), Write, Counter, Gauge(false), Octetstring,\n"
                         "  ArrayType(\"Indexed\"), BitMap {\"0\", \"1..3\", \"..\"},\n"
                         "  BitValues {\"a\", \"b\", \"c\"}, MappingStrings (\"MIB.IETF|X.y\"),\n"
                         "  MinValue(-5), Max \t (  3) : tosubclass, Propagated(\"S_Top.Key\"),\n"
                         "  PropertyConstraint { \"inv: \\\"x\\\"\" }, Static] uint8 Key[];\n"
                         "};"),
              "t.mof:15:17: found 'Max', expected a qualifier for a property");
    EXPECT_EQ(mistakesIn("[Association, Aggregation, Composition, Version(\"2.7.0\")]\n"
                         "class S_Link {\n"
                         "  [Aggregate, Key, Min ( 1 ), Max ( 1 ), Weak]\n  S_Late REF Whole;\n"
                         "  [Key, Override ( \"Part\" )] S_Late ref Part = null; };\n"
                         "class S_Late {};\n"
                         "[Indication, Exception] class S_Event { [EmbeddedInstance (\"S_Late\")]\n"
                         "  string Source; [EmbeddedObject] string Any; };\n"),
              "none");
}

TEST_F(MofSchemaFormsTest, takesWordsOfTheLanguageAsNames) {
    EXPECT_EQ(mistakesIn("class S_Names { string Key; string Class; uint8 Instance[]; string Of;\n"
                         "  string Schema; string Reference; string Ref; string Qualifier;\n"
                         "  string Scope; boolean Any = TRUE; uint32 Method(uint8 Parameter,\n"
                         "  string As, S_Names REF Ref); string Null; };"),
              "none");
}

TEST_F(MofSchemaFormsTest, takesDefaultsOfEveryForm) {
    EXPECT_EQ(
        mistakesIn("class S_Defaults { char16 C = 'x'; real64 R = -1.5E+3; real32 S = .5;\n"
                   " datetime D = \"00000001000000.000000:000\"; sint64 N = -0x7F;\n"
                   " uint16 List[ ] = { 1, 0x2, 3 }; uint32 None[] = NULL; boolean B = False;\n"
                   " sint8 O = -017; uint8 Bits = +11B; string T = \"a\\x2122\" \"b\"; };"),
        "none");
    EXPECT_EQ(defaultOf("S_Defaults", "D"), "00000001000000.000000:000");
    EXPECT_EQ(defaultOf("S_Defaults", "N"), "-127");
    EXPECT_EQ(defaultOf("S_Defaults", "O"), "-15");
    EXPECT_EQ(defaultOf("S_Defaults", "Bits"), "3");
    EXPECT_EQ(defaultOf("S_Defaults", "None"), "null");
    EXPECT_EQ(defaultOf("S_Defaults", "T"),
              "a\xE2\x84\xA2"
              "b");
}

TEST_F(MofSchemaFormsTest, takesSubclassesBeforeTheirSuperclass) {
    EXPECT_EQ(mistakesIn("class S_C : S_B {}; class S_B : S_A {}; class S_A { uint8 N = 4; };"),
              "none");
    EXPECT_EQ(defaultOf("S_C", "N"), "4");
    EXPECT_EQ(mistakesIn("class S_X : S_Y {}; class S_Y : S_X {};"),
              "t.mof:1:33: found superclass S_X, expected a class that is declared");
}

TEST_F(MofSchemaFormsTest, takesTheSameQualifierTwice) {
    EXPECT_EQ(mistakesIn("Qualifier key : Boolean = FALSE, Scope(reference, property),\n"
                         "  Flavor(DisableOverride, ToSubclass);"),
              "none");
    EXPECT_EQ(mistakesIn("Qualifier Key : boolean = true, Scope(property, reference), "
                         "Flavor(DisableOverride);"),
              "t.mof:1:11: found another declaration of qualifier Key, expected one that says the "
              "same as the first");
}

TEST_F(MofSchemaFormsTest, letsAReferencePointToASubclassInAnOverride) {
    EXPECT_EQ(mistakesIn("class S_P {}; class S_Q : S_P {};\n"
                         "[Association] class S_PP { [Key] S_P REF A; };\n"
                         "[Association] class S_QQ : S_PP { [Override(\"A\"), Key] S_Q REF A; };"),
              "none");
}

TEST_F(MofSchemaFormsTest, knowsASubclassOfAnAssociationForOne) {
    EXPECT_EQ(mistakesIn("class A { [Key] string k; };\n"
                         "[Association] class X { [Key] A REF a; [Key] A REF b; };\n"
                         "[Aggregation] class Y : X { [Aggregate, Override(\"a\")] A REF a; };\n"),
              "none");
    EXPECT_EQ(mistakesIn("class P { [Key] string k; };\n[Aggregation] class Q : P { };\n"),
              "t.mof:2:2: found 'Aggregation', expected a qualifier for a class");
}

TEST_F(MofSchemaFormsTest, countsLinesThatEndInACarriageReturn) {
    EXPECT_EQ(mistakesIn("class A { };\r// a comment\rclass B : Missing { };\r\nwrong\r"),
              "t.mof:3:11: found superclass Missing, expected a class that is declared\n"
              "t.mof:4:1: found 'wrong', expected 'class', 'instance', 'qualifier' or '#pragma'");
}

TEST_F(MofSchemaFormsTest, takesQualifiersOfTheDefaultNamespaceEverywhere) {
    EXPECT_EQ(mistakesIn("#pragma namespace (\"\\\\root\\\\other\")\n"
                         "class S_Elsewhere { [Key] string Id; };\n"
                         "instance of S_Elsewhere { Id = \"1\"; };"),
              "none");
    EXPECT_EQ(repository.instancesOf("root/other", "S_Elsewhere").size(), 1U);
}

}  // namespace
}  // namespace cimomd
