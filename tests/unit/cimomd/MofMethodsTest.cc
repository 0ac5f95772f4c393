// Methods in MOF, and what subclasses get of them.

#include <gtest/gtest.h>

#include "mof/MofCompiler.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

constexpr const char* kNamespace = "root/cimv2";

constexpr std::string_view kText =
    "Qualifier Description : string = null, Scope(any), Flavor(Translatable);"
    "Qualifier In : boolean = true, Scope(parameter), Flavor(DisableOverride);"
    "Qualifier Out : boolean = false, Scope(parameter), Flavor(DisableOverride);"
    "Qualifier Static : boolean = false, Scope(property, method), Flavor(DisableOverride);"
    "Qualifier Override : string = null, Scope(property, reference, method), Flavor(Restricted);"
    "Qualifier Experimental : boolean = false, Scope(any), Flavor(Restricted);\n"
    "class Top {\n"
    "  [Experimental, Description(\"stops\")] uint32 Stop();\n"
    "  [Static] string Find([IN, Description(\"what\")] string Name, [IN(false), OUT] Top REF "
    "Found[],\n"
    "    uint8 Code[4]);\n"
    "};\n"
    "class Middle : Top { [Override(\"Stop\"), Description(\"halts\")] uint32 stop(boolean Now); "
    "datetime When(); };\n"
    "class Bottom : Middle {};\n";

class MofMethodsTest : public testing::Test {
  protected:
    MofMethodsTest() { MofCompiler(repository, kNamespace).compileText(kText, "t.mof"); }

    /// "name(parameter, ...) of origin", with "inherited" where it is propagated; one a line.
    std::string methodsOf(const char* className) const {
        std::string text;
        for (const auto& method : repository.methodsOf(kNamespace, className)) {
            text += utf8Of(method->name.getString()) + "(";
            for (const ParameterDeclaration& parameter : method->parameters)
                text += utf8Of(parameter.name.getString()) + ",";
            text += ") of " + utf8Of(method->classOrigin.getString());
            text += method->isPropagated ? " inherited\n" : "\n";
        }
        return text;
    }
    static std::string qualifiersOf(const std::vector<Pegasus::CIMConstQualifier>& qualifiers) {
        std::string text;
        for (const auto& qualifier : qualifiers)
            text += utf8Of(qualifier.getName().getString()) + "=" +
                    utf8Of(qualifier.getValue().toString()) +
                    (qualifier.getPropagated() ? " inherited;" : ";");
        return text;
    }
    std::string errorOf(std::string_view text) {
        try {
            MofCompiler(repository, kNamespace).compileText(text, "u.mof");
        } catch (const MofErrors& errors) {
            return errors.what();
        }
        return "no error";
    }

    ClassRepository repository;
};

TEST_F(MofMethodsTest, keepsMethodsWithTheirParameters) {
    EXPECT_EQ(methodsOf("Top"), "Stop() of Top\nFind(Name,Found,Code,) of Top\n");
    const MethodDeclaration& find = *repository.methodsOf(kNamespace, "Top")[1];
    EXPECT_EQ(find.returnType, Pegasus::CIMTYPE_STRING);
    EXPECT_EQ(qualifiersOf(find.qualifiers), "Static=TRUE;");
    EXPECT_EQ(find.parameters[0].type, Pegasus::CIMTYPE_STRING);
    EXPECT_FALSE(find.parameters[0].isArray);
    EXPECT_EQ(qualifiersOf(find.parameters[0].qualifiers), "In=TRUE;Description=what;");
    EXPECT_EQ(find.parameters[1].type, Pegasus::CIMTYPE_REFERENCE);
    EXPECT_EQ(utf8Of(find.parameters[1].referenceClass.getString()), "Top");
    EXPECT_TRUE(find.parameters[1].isArray);
    EXPECT_EQ(qualifiersOf(find.parameters[1].qualifiers), "In=FALSE;Out=TRUE;");
    EXPECT_EQ(find.parameters[2].arraySize, 4U);
}

TEST_F(MofMethodsTest, handsMethodsDown) {
    EXPECT_EQ(methodsOf("Middle"),
              "stop(Now,) of Top\nFind(Name,Found,Code,) of Top inherited\nWhen() of Middle\n");
    EXPECT_EQ(methodsOf("Bottom"),
              "stop(Now,) of Top inherited\nFind(Name,Found,Code,) of Top inherited\n"
              "When() of Middle inherited\n");
    const MethodList& methods = repository.methodsOf(kNamespace, "Bottom");
    EXPECT_EQ(qualifiersOf(methods[0]->qualifiers), "Description=halts inherited;");
    EXPECT_EQ(qualifiersOf(methods[1]->qualifiers), "Static=TRUE inherited;");
    EXPECT_TRUE(repository.methodsOf(kNamespace, "None").empty());
}

TEST_F(MofMethodsTest, saysWhatIsWrongAndWhere) {
    EXPECT_EQ(errorOf("class X : Top { string Stop(); };"),
              "u.mof:1:24: found string Stop(), expected the inherited return type uint32");
    EXPECT_EQ(errorOf("class X : Top { [Static(false)] string Find(); };"),
              "u.mof:1:18: found qualifier Static with another value than the superclass gives it, "
              "expected its value to stay TRUE");
    EXPECT_EQ(errorOf("class X { uint8 M(); uint8 m(); };"),
              "u.mof:1:28: found 'm', expected each method once");
    EXPECT_EQ(errorOf("class X { uint8 M(uint8 a, uint8 A); };"),
              "u.mof:1:34: found 'A', expected each parameter once");
    EXPECT_EQ(errorOf("class X { uint8 M(uint8 a uint8 b); };"),
              "u.mof:1:27: found 'uint8', expected ',' or ')'");
    EXPECT_EQ(errorOf("class X { uint8 M([Static] uint8 a); };"),
              "u.mof:1:20: found 'Static', expected a qualifier for a parameter");
    EXPECT_EQ(errorOf("class X { [In] uint8 M(); };"),
              "u.mof:1:12: found 'In', expected a qualifier for a method");
}

}  // namespace
}  // namespace cimomd
