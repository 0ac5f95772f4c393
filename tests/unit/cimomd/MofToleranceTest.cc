// What is not quite MOF and is taken all the same: what is meant is beyond doubt.

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "mof/MofCompiler.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

constexpr const char* kNamespace = "root/cimv2";

class MofToleranceTest : public testing::Test {
  protected:
    MofToleranceTest() {
        MofCompiler(repository, kNamespace)
            .compileFile(std::filesystem::path(SCHEMA_DIR) / "qualifiers.mof");
    }

    /// The mistakes, or "none".
    std::string mistakesIn(std::string_view text) {
        return mistakesOf([&](MofCompiler& compiler) { compiler.compileText(text, "t.mof"); });
    }
    std::string mistakesInFile(const std::filesystem::path& file) {
        return mistakesOf([&](MofCompiler& compiler) { compiler.compileFile(file); });
    }
    /// The values of the qualifiers of a class's first property, "name=value;" for each.
    std::string qualifiersIn(const char* className) const {
        const auto property = repository.findClass(kNamespace, className)->getProperty(0);
        std::string text;
        for (Pegasus::Uint32 i = 0; i < property.getQualifierCount(); ++i) {
            const auto qualifier = property.getQualifier(i);
            text += utf8Of(qualifier.getName().getString()) + "=" +
                    utf8Of(qualifier.getValue().toString()) + ";";
        }
        return text;
    }

    ClassRepository repository;

  private:
    template <typename Compile>
    std::string mistakesOf(Compile compile) {
        MofCompiler compiler(repository, kNamespace);
        try {
            compile(compiler);
        } catch (const MofErrors& errors) {
            return errors.what();
        }
        return "none";
    }
};

TEST_F(MofToleranceTest, takesAQualifierAgainThatSaysTheSame) {
    EXPECT_EQ(mistakesIn("class T { [Key, MaxLen(8), KEY(true), MaxLen(0x8)] string p; };"),
              "none");
    EXPECT_EQ(qualifiersIn("T"), "Key=TRUE;MaxLen=8;");
    EXPECT_EQ(mistakesIn("class U { [MaxLen(8), MaxLen(9)] string p; };"),
              "t.mof:1:23: found 'MaxLen', expected each qualifier once, or with the same value");
}

TEST_F(MofToleranceTest, takesSemicolonsThatEndNothing) {
    EXPECT_EQ(mistakesIn(";class T { ; string p;; uint8 M(); ; };;\n;"
                         "instance of T { p = \"a\";; };; #pragma locale (\"en\");\n"
                         "Qualifier Extra : string, Scope(any);;"),
              "none");
    EXPECT_EQ(repository.findClass(kNamespace, "T")->getPropertyCount(), 1U);
}

TEST_F(MofToleranceTest, takesACommaBehindTheLastElement) {
    EXPECT_EQ(mistakesIn("class T { [Values { \"a\", \"b\", }] uint8 p[] = { 1, 2, }; };"), "none");
    EXPECT_EQ(qualifiersIn("T"), "Values=a b ;");
    EXPECT_EQ(mistakesIn("class U { uint8 p[] = { , }; };"),
              "t.mof:1:25: found ',', expected a value");
    EXPECT_EQ(mistakesIn("class U { uint8 p[] = { 1,, 2 }; };"),
              "t.mof:1:27: found ',', expected a value");
}

TEST_F(MofToleranceTest, takesASingleValueForAnArray) {
    EXPECT_EQ(mistakesIn("Qualifier Ranks : uint8[] = 3, Scope(any);\n"
                         "class T { [Ranks(4), ValueMap(\"1\"), Values { \"a\" }] uint8 p; };"),
              "none");
    EXPECT_EQ(qualifiersIn("T"), "Ranks=4 ;ValueMap=1 ;Values=a ;");
}

TEST_F(MofToleranceTest, takesOddBlanks) {
    EXPECT_EQ(mistakesIn("class\vT\xA0{\xC2\xA0uint8\xA0p\xA0=\xA0"
                         "5\xA0;\f};\xA0\x1A"),
              "none");
    EXPECT_EQ(mistakesIn("class V { uint8 caf\xC3\xA0\xA0= 5; };"), "none");
    EXPECT_NE(repository.findClass(kNamespace, "V")->findProperty(cimString("caf\xC3\xA0")),
              Pegasus::PEG_NOT_FOUND);
}

TEST_F(MofToleranceTest, endsAtTheEndMarkOfOldEditors) {
    EXPECT_EQ(mistakesIn(std::string_view("class T {};\r\n\x1A\x1A\0\0\n", 17)), "none");
    EXPECT_EQ(mistakesIn("\x1A"), "none");
    EXPECT_EQ(mistakesIn("class U {};\x1A class V {};"),
              "t.mof:1:12: found the byte 0x1A, expected a declaration");
}

TEST_F(MofToleranceTest, takesPragmasOfOtherCompilers) {
    EXPECT_EQ(mistakesIn("#pragma autorecover\n#pragma classflags(\"forceupdate\")\nclass T {};"),
              "none");
}

TEST_F(MofToleranceTest, findsTheNamespaceInAPath) {
    int count = 0;
    for (const char* path :
         {"root/other", "/root/other", "\\\\root\\\\other", "\\\\\\\\.\\\\root\\\\other",
          "//./root/other", "//host/root/other", "http://host:5988/root/other"}) {
        const std::string name = "T" + std::to_string(++count);
        EXPECT_EQ(
            mistakesIn("#pragma namespace (\"" + std::string(path) + "\")\nclass " + name + " {};"),
            "none")
            << path;
        EXPECT_NE(repository.findClass("root/other", name.c_str()), nullptr) << path;
    }
}

TEST_F(MofToleranceTest, tellsAWrongNamespaceOnly) {
    EXPECT_EQ(mistakesIn("class T {};\n#pragma namespace (\"http://host\")\n"
                         "class T {}; class U : Missing {}; instance of None {};\n"
                         "Qualifier Key : string, Scope(any);\n"
                         "#pragma namespace (\"root/third\")\nclass T : Lost {};"),
              "t.mof:2:20: found \"http://host\", expected a namespace such as root/cimv2\n"
              "t.mof:6:11: found superclass Lost, expected a class that is declared");
}

TEST_F(MofToleranceTest, takesFilesInUtf16) {
    RecordedTree tree;
    std::string wide = "\xFE\xFF";
    for (const char c : std::string_view("class T { uint8 p; };\r\n"))
        wide += std::string(1, '\0') + c;
    tree.file("wide.mof", wide);
    EXPECT_EQ(mistakesInFile(tree.root / "wide.mof"), "none");
    EXPECT_NE(repository.findClass(kNamespace, "T"), nullptr);
}

TEST_F(MofToleranceTest, findsIncludedFilesWhateverTheirCase) {
    RecordedTree tree;
    tree.file("main.mof", "#pragma include (\"CORE\\\\a.MOF\")\nclass Main : A {};\n")
        .file("Core/A.mof", "#pragma include (\"../core/b.mof\")\nclass A : B {};\n")
        .file("Core/B.mof", "class B {};\n");
    EXPECT_EQ(mistakesInFile(tree.root / "main.mof"), "none");
}

TEST_F(MofToleranceTest, prefersTheIncludedFileOfExactlyThatName) {
    RecordedTree tree;
    tree.file("main.mof", "#pragma include (\"b.mof\")\n")
        .file("B.mof", "class Wrong {};\n")
        .file("b.mof", "class Right {};\n");
    EXPECT_EQ(mistakesInFile(tree.root / "main.mof"), "none");
    EXPECT_NE(repository.findClass(kNamespace, "Right"), nullptr);
    EXPECT_EQ(repository.findClass(kNamespace, "Wrong"), nullptr);
}

}  // namespace
}  // namespace cimomd
