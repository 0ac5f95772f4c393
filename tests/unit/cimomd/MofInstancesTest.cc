// Instances in MOF: values, keys, references by alias and by path, and what is wrong with them.

#include "mof/MofInstances.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "RecordedTree.h"
#include "mof/MofCompiler.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstInstance;
using Pegasus::CIMConstProperty;

constexpr std::string_view kClasses =
    "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);"
    "Qualifier Abstract : boolean = false, Scope(class), Flavor(Restricted);"
    "[Abstract] class Thing { [Key] string Id; };"
    "class Disk : Thing { uint32 Size = 7; string Tags[] = { \"a\", \"b\" }; datetime Bought; };"
    "class Rack : Thing {};"
    "class Holds { [Key] Rack REF Holder; [Key] Thing REF Held; uint8 Slot; };"
    "class Note { [Key] uint8 Number; Thing REF About; };\n";

class MofInstancesTest : public testing::Test {
  protected:
    void compile(std::string_view text) {
        MofCompiler(repository, nameSpace)
            .compileText(std::string(kClasses) + std::string(text), "t.mof");
    }
    /// All messages, one a line, lines counted from the first after the classes.
    std::string errorsOf(std::string_view text) {
        try {
            compile(text);
        } catch (const MofErrors& errors) {
            std::string all;
            for (const MofError& error : errors.errors()) {
                const std::string message = error.what();
                all += (all.empty() ? "" : "\n");
                all += std::to_string(error.position().line - 1);
                all += message.substr(message.find(':', 6));
            }
            return all;
        }
        return "no error";
    }
    const std::vector<CIMConstInstance>& instancesOf(const char* name) const {
        return repository.instancesOf(nameSpace, name);
    }
    static std::string valueOf(const CIMConstInstance& instance, const char* property) {
        const CIMConstProperty found = instance.getProperty(instance.findProperty(property));
        return found.getValue().isNull() ? "null" : utf8Of(found.getValue().toString());
    }
    static std::string pathOf(const CIMConstInstance& instance) {
        return utf8Of(instance.getPath().toString());
    }

    Pegasus::CIMNamespaceName nameSpace{"root/cimv2"};
    ClassRepository repository;
};

TEST_F(MofInstancesTest, keepsInstancesInTheirOrderWithDefaultsAndPaths) {
    compile(
        "instance of Disk { Id = \"b\"; Size = 0x10; };\n"
        "INSTANCE OF disk { id = \"a\"; Tags = { \"x\" }; Size = null; };\n");
    ASSERT_EQ(instancesOf("Disk").size(), 2U);
    const CIMConstInstance& first = instancesOf("Disk")[0];
    EXPECT_EQ(pathOf(first), "root/cimv2:Disk.Id=\"b\"");
    EXPECT_EQ(valueOf(first, "Size"), "16");
    EXPECT_EQ(valueOf(first, "Tags"), "a b ");
    EXPECT_EQ(valueOf(first, "Bought"), "null");
    ASSERT_EQ(first.getPropertyCount(), 4U);
    const CIMConstInstance& second = instancesOf("Disk")[1];
    EXPECT_EQ(valueOf(second, "Id"), "a");
    EXPECT_EQ(valueOf(second, "Size"), "null");
    EXPECT_EQ(valueOf(second, "Tags"), "x ");
    EXPECT_TRUE(instancesOf("Thing").empty());
    EXPECT_TRUE(instancesOf("None").empty());
}

TEST_F(MofInstancesTest, resolvesAliasesBeforeAndAfterTheirDeclaration) {
    compile(
        "instance of Holds { Holder = $r; Held = $D; Slot = 3; };\n"
        "instance of Rack as $R { Id = \"r1\"; };\n"
        "instance of Disk as $d { Id = \"d1\"; };\n");
    ASSERT_EQ(instancesOf("Holds").size(), 1U);
    const CIMConstInstance& holds = instancesOf("Holds")[0];
    EXPECT_EQ(valueOf(holds, "Holder"), "root/cimv2:Rack.Id=\"r1\"");
    EXPECT_EQ(valueOf(holds, "Held"), "root/cimv2:Disk.Id=\"d1\"");
    EXPECT_NE(repository.findInstance(nameSpace, holds.getPath()), nullptr);
}

TEST_F(MofInstancesTest, completesPathsWithTheNamespaceOfTheInstance) {
    compile(
        "instance of Note { Number = 1; About = \"Disk.Id=\\\"d1\\\"\"; };\n"
        "instance of Note { Number = 2; About = \"root/x:Elsewhere.Id=\\\"e\\\"\"; };\n");
    ASSERT_EQ(instancesOf("Note").size(), 2U);
    EXPECT_EQ(valueOf(instancesOf("Note")[0], "About"), "root/cimv2:Disk.Id=\"d1\"");
    EXPECT_EQ(valueOf(instancesOf("Note")[1], "About"), "root/x:Elsewhere.Id=\"e\"");
}

TEST_F(MofInstancesTest, findsInstancesByTheirKeysHoweverTheyAreWritten) {
    compile(
        "instance of Holds { Holder = \"Rack.Id=\\\"r\\\"\"; Held = \"Disk.Id=\\\"d\\\"\"; };\n");
    const Pegasus::CIMObjectPath path = instancesOf("Holds")[0].getPath();
    const Pegasus::Array<Pegasus::CIMKeyBinding> keys = path.getKeyBindings();
    Pegasus::Array<Pegasus::CIMKeyBinding> other;
    for (Pegasus::Uint32 i = keys.size(); i-- > 0;) {
        Pegasus::CIMKeyBinding key = keys[i];
        if (i == 0)
            key.setValue("Rack.Id=\"r\"");
        other.append(key);
    }
    EXPECT_NE(repository.findInstance(
                  nameSpace, Pegasus::CIMObjectPath(Pegasus::String(), nameSpace, "HOLDS", other)),
              nullptr);
    other[0].setValue("root/cimv2:Disk.Id=\"other\"");
    EXPECT_EQ(repository.findInstance(
                  nameSpace, Pegasus::CIMObjectPath(Pegasus::String(), nameSpace, "Holds", other)),
              nullptr);
}

TEST_F(MofInstancesTest, takesAliasesAcrossIncludes) {
    RecordedTree tree;
    tree.file("a.mof", std::string(kClasses) +
                           "#pragma include (\"sub\\\\b.mof\")\n"
                           "instance of Note { Number = 1; About = $Far; };\n")
        .file("sub/b.mof", "instance of Disk as $Far { Id = \"far\"; };\n");
    MofCompiler(repository, nameSpace).compileFile(tree.root / "a.mof");
    EXPECT_EQ(valueOf(instancesOf("Note")[0], "About"), "root/cimv2:Disk.Id=\"far\"");
}

TEST_F(MofInstancesTest, saysWhatIsWrongAndWhere) {
    struct Case {
        const char* text;
        const char* messages;
    };
    const std::vector<Case> cases{
        {"instance of Thing { Id = \"x\"; };",
         "1:13: found the abstract class Thing, expected a class that can have instances"},
        {"instance of None { Id = \"x\"; };",
         "1:13: found class None, expected a class that is declared"},
        {"instance of Disk { Size = 1; };",
         "1:13: found an instance of Disk without its key Id, expected a value for each key"},
        {"instance of Disk { Id = null; };",
         "1:13: found an instance of Disk without its key Id, expected a value for each key"},
        {"instance of Disk { Id = \"x\"; Colour = 1; };",
         "1:30: found 'Colour', expected a property of the class"},
        {"instance of Disk { Id = \"x\"; ID = \"y\"; };",
         "1:30: found 'ID', expected each property once"},
        {"instance of Disk { Id = 5; };", "1:25: found '5', expected a string"},
        {"instance of Disk { Id = \"x\"; Bought = \"then\"; };",
         "1:39: found \"then\", expected a datetime"},
        {"instance of Disk { Id = \"x\"; };\ninstance of Disk { Id = \"x\"; };",
         "2:13: found instance root/cimv2:Disk.Id=\"x\" again, expected keys that no other "
         "instance "
         "has"},
        {"instance of Note { Number = 1; About = $none; };",
         "1:40: found alias $none, expected an alias that is declared"},
        {"instance of Disk as $a { Id = \"x\"; };\ninstance of Disk as $A { Id = \"y\"; };",
         "2:21: found alias $A again, expected an alias that no other instance has"},
        {"instance of Disk as $d { Id = \"d\"; };\n"
         "instance of Holds { Holder = $d; Held = $d; };",
         "2:30: found alias $d, an instance of Disk, expected an instance of Rack"},
        {"instance of Holds { Holder = \"Disk.Id=1\"; Held = \"Rack.Id=1\"; };",
         "1:30: found a path of class Disk, expected one of class Rack"},
        {"instance Disk {};", "1:10: found 'Disk', expected 'of'"},
        {"instance of Disk as d {};", "1:21: found 'd', expected an alias such as $name"},
        {"class Loop { [Key] Loop REF Next; };\n"
         "instance of Loop as $a { Next = $b; };\ninstance of Loop as $b { Next = $a; };",
         "3:33: found alias $a, expected an instance with keys of its own, at most 64 instances "
         "away"},
        {"class Real { [Key] real32 R; };\ninstance of Real { R = 1.5; };",
         "2:13: found an instance with the real32 R as a key, expected keys that are neither "
         "arrays nor reals"},
    };
    for (const Case& expected : cases)
        EXPECT_EQ(errorsOf(expected.text), expected.messages) << expected.text;
    EXPECT_TRUE(instancesOf("Disk").empty());
}

// Each holds the keys of the one before it, with all quotes and backslashes escaped once more.
TEST_F(MofInstancesTest, boundsKeysThatHoldKeys) {
    std::string text = "class Link { [Key] Link REF Next; };\n";
    for (int i = 0; i < 60; ++i)
        text += "instance of Link as $l" + std::to_string(i) + " { Next = " +
                (i == 0 ? std::string("\"Link.Next=1\"") : "$l" + std::to_string(i - 1)) + "; };\n";
    EXPECT_NE(errorsOf(text).find("found an instance with too long keys, expected at most 65536 "
                                  "characters"),
              std::string::npos);
}

TEST_F(MofInstancesTest, copiesOfARepositoryKeepTheirOwnInstances) {
    compile("instance of Disk { Id = \"a\"; };\n");
    ClassRepository copy = repository;
    MofCompiler(copy, nameSpace).compileText("instance of Disk { Id = \"b\"; };", "u.mof");
    EXPECT_EQ(instancesOf("Disk").size(), 1U);
    EXPECT_EQ(copy.instancesOf(nameSpace, "Disk").size(), 2U);
}

}  // namespace
}  // namespace cimomd
