#include "mof/MofCheck.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"
#include "mof/MofCompiler.h"

namespace cimomd {
namespace {

class MofCheckTest : public testing::Test {
  protected:
    MofCheckTest() {
        MofCompiler(shipped, nameSpace)
            .compileFile(std::filesystem::path(SCHEMA_DIR) / "cimomd.mof");
    }

    /// The mistakes in the files, which are compiled in this order, without their directory.
    std::string mistakesIn(const std::vector<std::string>& names) const {
        std::vector<std::filesystem::path> files;
        for (const std::string& name : names)
            files.push_back(tree.root / name);
        try {
            checkMofFiles(files, shipped, nameSpace);
        } catch (const MofErrors& errors) {
            std::string text = errors.what();
            const std::string directory = tree.root.string() + "/";
            for (std::size_t at = text.find(directory); at != std::string::npos;
                 at = text.find(directory))
                text.erase(at, directory.size());
            return text;
        }
        return "none";
    }

    RecordedTree tree;
    Pegasus::CIMNamespaceName nameSpace{"root/cimv2"};
    ClassRepository shipped;
};

TEST_F(MofCheckTest, knowsTheShippedClassesAndQualifiers) {
    tree.file("own.mof", "class Own_Device : CIM_LogicalDevice { [Write] string Owner; };");
    EXPECT_EQ(mistakesIn({"own.mof"}), "none");
    tree.file("again.mof", "class CIM_LogicalDevice {};");
    EXPECT_EQ(mistakesIn({"again.mof"}),
              "again.mof:1:7: found class CIM_LogicalDevice again, expected a class that is not "
              "declared yet");
}

TEST_F(MofCheckTest, takesFilesWithQualifiersOfTheirOwnAsASchema) {
    tree.file("q.mof",
              "Qualifier Key : boolean = false, Scope(any);\n"
              "Qualifier Other : string[], Scope(any);\n")
        .file("c.mof",
              "class CIM_ManagedElement { [Key] uint64 Number; };\n"
              "[Other { \"x\" }] class CIM_LogicalDevice : CIM_ManagedElement {};\n");
    EXPECT_EQ(mistakesIn({"q.mof", "c.mof"}), "none");
    tree.file("d.mof", "class CIM_New : CIM_ManagedElement { uint8 Number; };");
    EXPECT_EQ(mistakesIn({"q.mof", "c.mof", "d.mof"}),
              "d.mof:1:44: found uint8 Number, expected the inherited type uint64");
}

TEST_F(MofCheckTest, lendsTheShippedQualifiersToASchema) {
    tree.file("q.mof", "Qualifier Key : boolean = false, Scope(any);\n")
        .file("c.mof", "class CIM_ManagedElement { [Key, MaxLen(8)] string Name; };\n")
        .file("n.mof", "class CIM_LogicalDevice { [Nope] string Name; };\n");
    EXPECT_EQ(mistakesIn({"q.mof", "c.mof"}), "none");
    EXPECT_EQ(mistakesIn({"q.mof", "c.mof", "n.mof"}),
              "n.mof:1:28: found 'Nope', expected a declared qualifier");
}

TEST_F(MofCheckTest, tellsAllMistakesOfAFile) {
    tree.file("ten.mof",
              "class T_Base {\n"
              "    [Key] string Id;\n"
              "    uint8 Level = 300;\n"
              "    [Nope] string A;\n"
              "    strin B;\n"
              "    [MaxLen(\"x\")] string C\n"
              "    string D = \"open;\n"
              "    [Description(\"a\" \"b\"] string E;\n"
              "};\n"
              "class T_Sub : T_Missing { [Key, Key(false)] uint16 X; };\n"
              "class T_Two : T_Base { uint16 Level; };\n"
              "class T_Links { [Key] T_Nowhere REF Left; };\n"
              "class T_Good { [Key] string Id; };\n"
              "instance of T_Good { Ids = \"x\"; Id = \"a\"; };\n");
    EXPECT_EQ(mistakesIn({"ten.mof"}),
              "ten.mof:3:19: found '300', expected a uint8 (0 to 255)\n"
              "ten.mof:4:6: found 'Nope', expected a declared qualifier\n"
              "ten.mof:5:5: found 'strin', expected a type\n"
              "ten.mof:6:13: found \"x\", expected a uint32 (0 to 4294967295)\n"
              "ten.mof:7:5: found 'string', expected ';'\n"
              "ten.mof:7:22: found the end of the line, expected a closing \"\n"
              "ten.mof:8:25: found ']', expected ')'\n"
              "ten.mof:10:15: found superclass T_Missing, expected a class that is declared\n"
              "ten.mof:10:33: found 'Key', expected each qualifier once, or with the same value\n"
              "ten.mof:11:31: found uint16 Level, expected the inherited type uint8\n"
              "ten.mof:12:23: found class T_Nowhere, expected a class that is declared\n"
              "ten.mof:14:22: found 'Ids', expected a property of the class");
}

TEST_F(MofCheckTest, namesAFileThatIsNotThere) {
    EXPECT_EQ(mistakesIn({"none.mof"}), "none.mof:1:1: found no such file, expected a MOF file");
}

TEST_F(MofCheckTest, stopsAfterAHundredMistakes) {
    std::string text;
    for (int i = 0; i < 150; ++i)
        text += "@\n";
    tree.file("many.mof", text);
    const std::string mistakes = mistakesIn({"many.mof"});
    EXPECT_NE(mistakes.find("many.mof:100:1: "), std::string::npos);
    EXPECT_EQ(mistakes.find("many.mof:101:1: "), std::string::npos);
    EXPECT_NE(mistakes.find("\nmore than 100 mistakes, the rest is not told"), std::string::npos);
}

}  // namespace
}  // namespace cimomd
