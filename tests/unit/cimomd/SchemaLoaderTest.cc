#include "service/SchemaLoader.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

class SchemaLoaderTest : public testing::Test {
  protected:
    SchemaLoaderTest() { tree.file("schema.mof", "class Shipped {};"); }

    bool has(const std::shared_ptr<const ClassRepository>& classes, const char* name) const {
        return classes->findClass(nameSpace, name) != nullptr;
    }
    static std::string mistakeIn(const SchemaLoader& loader) {
        try {
            loader.loadAll();
        } catch (const std::exception& error) {
            return error.what();
        }
        return "none";
    }

    RecordedTree tree;
    Pegasus::CIMNamespaceName nameSpace{"root/cimv2"};
    SchemaLoader loader{{tree.root / "schema.mof", tree.root / "own", nameSpace}};
};

TEST_F(SchemaLoaderTest, needsNoOwnFiles) {
    EXPECT_TRUE(has(loader.loadWhatIsRight(), "Shipped"));
    EXPECT_TRUE(has(loader.loadAll(), "Shipped"));
}

TEST_F(SchemaLoaderTest, compilesOwnFilesInTheOrderOfTheirNames) {
    tree.file("own/B.mof", "class Second : First {};")
        .file("own/A.mof", "class First {};")
        .file("own/a.mof", "class Third : Second {};")
        .file("own/.hidden.mof", "class Hidden {")
        .file("own/readme", "no class");
    const auto classes = loader.loadAll();
    EXPECT_TRUE(has(classes, "Third"));
    EXPECT_FALSE(has(classes, "Hidden"));
}

TEST_F(SchemaLoaderTest, leavesOutAWrongFileAsAWhole) {
    tree.file("own/1.mof", "class Good {};\nclass Bad : Nothing {};")
        .file("own/2.mof", "class Other {};");
    const auto classes = loader.loadWhatIsRight();
    EXPECT_TRUE(has(classes, "Shipped"));
    EXPECT_FALSE(has(classes, "Good"));
    EXPECT_TRUE(has(classes, "Other"));
    EXPECT_EQ(mistakeIn(loader).find((tree.root / "own/1.mof").string() + ":2:13: "), 0U);
}

TEST_F(SchemaLoaderTest, needsTheSchema) {
    tree.file("schema.mof", "class Shipped {");
    EXPECT_ANY_THROW(loader.loadWhatIsRight());
    EXPECT_ANY_THROW(loader.loadAll());
}

}  // namespace
}  // namespace cimomd
