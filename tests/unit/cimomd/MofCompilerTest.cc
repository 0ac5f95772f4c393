#include "mof/MofCompiler.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstClass;
using Pegasus::CIMNamespaceName;

const CIMNamespaceName& cimv2() {
    static const CIMNamespaceName name("root/cimv2");
    return name;
}

constexpr std::string_view kQualifiers =
    "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);\n"
    "Qualifier Description : string = null, Scope(any), Flavor(Translatable);\n"
    "Qualifier MaxLen : uint32 = null, Scope(property);\n"
    "Qualifier Values : string[], Scope(property);\n"
    "Qualifier Association : boolean = false, Scope(association), Flavor(DisableOverride);\n"
    "Qualifier Abstract : boolean = false, Scope(class), Flavor(Restricted);\n";
constexpr unsigned kQualifierLines = 6;

class MofCompilerTest : public testing::Test {
  protected:
    void compile(std::string_view text) {
        MofCompiler(repository, cimv2())
            .compileText(std::string(kQualifiers) + std::string(text), "t.mof");
    }
    /// The messages for `text`, whose first line is line 1, without the name of the file.
    std::vector<std::string> errorsOf(std::string_view text) {
        std::vector<std::string> messages;
        try {
            compile(text);
        } catch (const MofErrors& errors) {
            for (const MofError& error : errors.errors()) {
                const std::string message = error.what();
                messages.push_back(std::to_string(error.position().line - kQualifierLines) +
                                   message.substr(message.find(':', 6)));
            }
        }
        return messages;
    }
    /// The one message.
    std::string errorOf(std::string_view text) {
        const std::vector<std::string> messages = errorsOf(text);
        if (messages.size() == 1)
            return messages.front();
        std::string all = std::to_string(messages.size()) + " messages";
        for (const std::string& message : messages)
            all += "\n" + message;
        return all;
    }
    const CIMConstClass& compiledClass(const char* name) {
        const CIMConstClass* found = repository.findClass(cimv2(), name);
        if (found == nullptr)
            throw std::runtime_error(std::string("no class ") + name);
        return *found;
    }
    std::string defaultOf(const char* className, const char* property) {
        const CIMConstClass& found = compiledClass(className);
        const Pegasus::CIMConstProperty declared = found.getProperty(found.findProperty(property));
        return declared.getValue().isNull() ? "null" : utf8Of(declared.getValue().toString());
    }

    ClassRepository repository;
};

TEST_F(MofCompilerTest, takesPropertiesOfEveryTypeWithDefaults) {
    compile(
        "class T {\n"
        "  boolean b = TRUE; uint8 u8 = 255; sint8 s8 = -128; uint16 u16 = 0x10;\n"
        "  sint16 s16 = -1; uint32 u32 = 101b; sint32 s32 = 017; uint64 u64 ="
        " 18446744073709551615;\n"
        "  sint64 s64 = -9223372036854775808; real32 r32 = 1.5; real64 r64 = 2;\n"
        "  char16 c = '\\x41'; string s = \"a\" /* and */ \"b\";\n"
        "  datetime d = \"20240229120000.000000+060\"; string none = null; string without;\n"
        "  uint16 list[] = { 1, 2 }; string fixed[3] = {}; T ref other;\n"
        "};\n");
    EXPECT_EQ(defaultOf("t", "b"), "TRUE");
    EXPECT_EQ(defaultOf("T", "u8"), "255");
    EXPECT_EQ(defaultOf("T", "s8"), "-128");
    EXPECT_EQ(defaultOf("T", "u16"), "16");
    EXPECT_EQ(defaultOf("T", "s16"), "-1");
    EXPECT_EQ(defaultOf("T", "u32"), "5");
    EXPECT_EQ(defaultOf("T", "s32"), "15");
    EXPECT_EQ(defaultOf("T", "u64"), "18446744073709551615");
    EXPECT_EQ(defaultOf("T", "s64"), "-9223372036854775808");
    EXPECT_EQ(defaultOf("T", "r32"), "1.5000000000000000e+00");
    EXPECT_EQ(defaultOf("T", "r64"), "2.0000000000000000e+00");
    EXPECT_EQ(defaultOf("T", "c"), "A");
    EXPECT_EQ(defaultOf("T", "s"), "ab");
    EXPECT_EQ(defaultOf("T", "d"), "20240229120000.000000+060");
    EXPECT_EQ(defaultOf("T", "none"), "null");
    EXPECT_EQ(defaultOf("T", "without"), "null");
    EXPECT_EQ(defaultOf("T", "list"), "1 2 ");
    EXPECT_EQ(defaultOf("T", "fixed"), "");
    const CIMConstClass& t = compiledClass("T");
    EXPECT_EQ(t.getProperty(t.findProperty("fixed")).getArraySize(), 3U);
    const Pegasus::CIMConstProperty other = t.getProperty(t.findProperty("other"));
    EXPECT_EQ(other.getType(), Pegasus::CIMTYPE_REFERENCE);
    EXPECT_EQ(utf8Of(other.getReferenceClassName().getString()), "T");
    EXPECT_EQ(t.getPropertyCount(), 19U);
}

TEST_F(MofCompilerTest, givesQualifiersTheirValuesAndFlavors) {
    compile(
        "[Abstract, Description(\"One \" \"two\") : Restricted]\n"
        "class T { [key, MaxLen(0x40) : DisableOverride ToSubclass, Values{\"a\",\"b\"}] string p;"
        " };\n");
    const CIMConstClass& t = compiledClass("T");
    ASSERT_EQ(t.getQualifierCount(), 2U);
    EXPECT_EQ(utf8Of(t.getQualifier(0).getValue().toString()), "TRUE");
    EXPECT_FALSE(t.getQualifier(0).getFlavor().has(Pegasus::CIMFlavor::TOSUBCLASS));
    EXPECT_EQ(utf8Of(t.getQualifier(1).getValue().toString()), "One two");
    EXPECT_TRUE(t.getQualifier(1).getFlavor().has(Pegasus::CIMFlavor::TRANSLATABLE));
    EXPECT_FALSE(t.getQualifier(1).getFlavor().has(Pegasus::CIMFlavor::TOSUBCLASS));
    const Pegasus::CIMConstProperty p = t.getProperty(0);
    ASSERT_EQ(p.getQualifierCount(), 3U);
    EXPECT_EQ(utf8Of(p.getQualifier(0).getName().getString()), "Key");
    EXPECT_FALSE(p.getQualifier(0).getFlavor().has(Pegasus::CIMFlavor::OVERRIDABLE));
    EXPECT_EQ(utf8Of(p.getQualifier(1).getValue().toString()), "64");
    EXPECT_FALSE(p.getQualifier(1).getFlavor().has(Pegasus::CIMFlavor::OVERRIDABLE));
    EXPECT_TRUE(p.getQualifier(1).getFlavor().has(Pegasus::CIMFlavor::TOSUBCLASS));
    EXPECT_EQ(utf8Of(p.getQualifier(2).getValue().toString()), "a b ");
}

TEST_F(MofCompilerTest, saysWhatIsWrongAndWhere) {
    struct Case {
        const char* text;
        const char* message;
    };
    const std::vector<Case> cases{
        {"klass X {};",
         "1:1: found 'klass', expected 'class', 'instance', 'qualifier' or '#pragma'"},
        {"class {};", "1:7: found '{', expected a class name"},
        {"class X {}", "1:11: found the end of the file, expected ';'"},
        {"class X {\n string a\n};", "3:1: found '}', expected ';'"},
        {"class X { strin a; };", "1:11: found 'strin', expected a type"},
        {"class X { string 7; };", "1:18: found '7', expected a property name"},
        {"class X { uint32 a[0]; };",
         "1:20: found '0', expected an array size from 1 to 4294967295"},
        {"class X { uint32 a[; };", "1:20: found ';', expected ']'"},
        {"class X { uint8 a = 256; };", "1:21: found '256', expected a uint8 (0 to 255)"},
        {"class X { uint8 a = -1; };", "1:21: found '-1', expected a uint8 (0 to 255)"},
        {"class X { sint8 a = 128; };", "1:21: found '128', expected a sint8 (-128 to 127)"},
        {"class X { uint16 a = 1.5; };", "1:22: found '1.5', expected a uint16 (0 to 65535)"},
        {"class X { uint16 a = \"1\"; };", "1:22: found \"1\", expected a uint16 (0 to 65535)"},
        {"class X { boolean a = 1; };", "1:23: found '1', expected a boolean"},
        {"class X { string a = 1; };", "1:22: found '1', expected a string"},
        {"class X { char16 a = 'ab'; };", "1:22: found 'ab', expected a char16"},
        {"class X { datetime a = \"now\"; };", "1:24: found \"now\", expected a datetime"},
        {"class X { real32 a = 1.0e39; };", "1:22: found '1.0e39', expected a real32"},
        {"class X { uint8 a = {1}; };", "1:21: found '{', expected one uint8"},
        {"class X { uint8 a[] = 1; };", "1:23: found '1', expected an array of uint8"},
        {"class X { uint8 a[] = {1, null}; };", "1:27: found 'null', expected a uint8 (0 to 255)"},
        {"class X { uint8 a[] = {1 2}; };", "1:26: found '2', expected ',' or '}'"},
        {"class X { [Nope] string a; };", "1:12: found 'Nope', expected a declared qualifier"},
        {"class X { [Key, KEY(false)] string a; };",
         "1:17: found 'KEY', expected each qualifier once, or with the same value"},
        {"[Key] class X {};", "1:2: found 'Key', expected a qualifier for a class"},
        {"class X { [Key Key] string a; };", "1:16: found 'Key', expected ',' or ']'"},
        {"class X { [Key : Often] string a; };",
         "1:18: found 'Often', expected a flavor such as ToSubclass"},
        {"class X { string a; string A; };", "1:28: found 'A', expected each property once"},
        {"class X : Y {};", "1:11: found superclass Y, expected a class that is declared"},
        {"class X {};\nclass x {};",
         "2:7: found class x again, expected a class that is not declared yet"},
        {"class X { uint8 a; };\nclass Y : X { uint16 a; };",
         "2:22: found uint16 a, expected the inherited type uint8"},
        {"class X { uint8 a; };\nclass Y : X { uint8 a[]; };",
         "2:21: found uint8[] a, expected the inherited type uint8"},
        {"class X { [Key] uint8 a; };\nclass Y : X { [Key(false)] uint8 a; };",
         "2:16: found qualifier Key with another value than the superclass gives it, expected its "
         "value to stay TRUE"},
        {"Qualifier Key : boolean, Scope(any);",
         "1:11: found another declaration of qualifier Key, expected one that says the same as the "
         "first"},
        {"Qualifier Q : boolean, Scope(classes);",
         "1:30: found 'classes', expected a scope such as class or property"},
        {"Qualifier Q : boolean;", "1:22: found ';', expected ','"},
        {"#pragma namespace (\"a-b\")",
         "1:20: found \"a-b\", expected a namespace such as root/cimv2"},
        {"#pragma include (\"absent.mof\")",
         "1:18: found no such file (absent.mof), expected the name of a MOF file"},
        {"#pragma include (absent)", "1:18: found 'absent', expected a text in quotes"},
    };
    for (const Case& expected : cases)
        EXPECT_EQ(errorOf(expected.text), expected.message) << expected.text;
}

TEST_F(MofCompilerTest, tellsAForgottenQuoteOnce) {
    const std::string message = ": found the end of the line, expected a closing \"";
    EXPECT_EQ(errorOf("class X { string a = \"b;\n string c = \"d\"; };"), "1:25" + message);
    EXPECT_EQ(errorOf("class X { string a = \"b\n string c = \"d\"; };"), "1:24" + message);
    EXPECT_EQ(errorOf("class X { [Description(\"b, Key] string c;\n string d; };"),
              "1:42" + message);
    EXPECT_EQ(errorOf("class X { [Description(\"b\n \"c\"), Key] string d; };"), "1:26" + message);
    EXPECT_EQ(errorOf("class X { [Description(\"b; c\n d; e } f\"), Key] string d; };"),
              "1:29" + message);
    EXPECT_EQ(errorOf("class X { string a = \"b;\n strin c; };"),
              "2 messages\n1:25" + message + "\n2:2: found 'strin', expected a type");
}

TEST_F(MofCompilerTest, refusesAClassThatIsItsOwnSuperclass) {
    EXPECT_EQ(errorOf("class X : x {};\nclass Y : X {}; instance of X {};"),
              "1:11: found class X as its own superclass, expected another class");
}

TEST_F(MofCompilerTest, loadsNothingOfAFileWithAMistake) {
    EXPECT_EQ(errorOf("class Good {}; class Bad { strin a; };"),
              "1:28: found 'strin', expected a type");
    EXPECT_EQ(repository.findClass(cimv2(), "Good"), nullptr);
    EXPECT_EQ(repository.findQualifier(cimv2(), "Key"), nullptr);
    compile("class Good {};");
    EXPECT_NE(repository.findClass(cimv2(), "Good"), nullptr);
}

TEST_F(MofCompilerTest, putsClassesIntoTheNamespaceOfThePragma) {
    compile(
        "#pragma locale (\"en_US\")\n"
        "class A {};\n#pragma namespace (\"root/other\")\nclass A {}; class B {};\n");
    const CIMNamespaceName other("ROOT/Other");
    EXPECT_NE(repository.findClass(other, "B"), nullptr);
    EXPECT_NE(repository.findClass(other, "A"), nullptr);
    EXPECT_EQ(repository.findClass(cimv2(), "B"), nullptr);
    EXPECT_TRUE(repository.hasNamespace("/root/other"));
    EXPECT_FALSE(repository.hasNamespace("root"));
}

TEST_F(MofCompilerTest, followsIncludesRelativeToTheFile) {
    RecordedTree tree;
    tree.file("main.mof", "#pragma include (\"sub/a.mof\")\nclass Main : A {};\n")
        .file("sub/a.mof", "#pragma include (\"b.mof\")\nclass A : B {};\n")
        .file("sub/b.mof", "class B { uint8 n = 4; };\n");
    MofCompiler(repository, cimv2()).compileFile(tree.root / "main.mof");
    EXPECT_EQ(defaultOf("Main", "n"), "4");
}

TEST_F(MofCompilerTest, namesTheIncludedFileInErrors) {
    RecordedTree tree;
    tree.file("main.mof", "#pragma include (\"a.mof\")\n").file("a.mof", "\nclass A : None {};\n");
    try {
        MofCompiler(repository, cimv2()).compileFile(tree.root / "main.mof");
        FAIL() << "no error";
    } catch (const MofErrors& error) {
        EXPECT_EQ(std::string(error.what()),
                  (tree.root / "a.mof").string() +
                      ":2:11: found superclass None, expected a class that is declared");
    }
}

// Bytes that are no UTF-8 in the class name of a reference once left the compiler as an exception
// that nobody caught.
TEST_F(MofCompilerTest, takesBytesThatAreNotUtf8InTheClassOfAReference) {
    compile("class B\xEF\xBF\xBD {}; class T { B\xFF ref other; };");
    const Pegasus::CIMConstProperty other = compiledClass("T").getProperty(0);
    EXPECT_EQ(utf8Of(other.getReferenceClassName().getString()), "B\xEF\xBF\xBD");
}

TEST_F(MofCompilerTest, endsAnIncludeOfItself) {
    RecordedTree tree;
    tree.file("main.mof", "#pragma include (\"main.mof\")\n");
    EXPECT_THROW(MofCompiler(repository, cimv2()).compileFile(tree.root / "main.mof"), MofErrors);
}

TEST_F(MofCompilerTest, refusesAFileThatIsNotThereOrADirectory) {
    RecordedTree tree;
    tree.directory("d.mof");
    EXPECT_THROW(MofCompiler(repository, cimv2()).compileFile(tree.root / "d.mof"), MofErrors);
    EXPECT_THROW(MofCompiler(repository, cimv2()).compileFile(tree.root / "none.mof"), MofErrors);
}

}  // namespace
}  // namespace cimomd
