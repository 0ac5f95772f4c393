#include "protocol/InstanceKeys.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include "ServedModel.h"

namespace cimomd {
namespace {

using Pegasus::CIMKeyBinding;
using Pegasus::CIMObjectPath;

class InstanceKeysTest : public testing::Test {
  protected:
    bool matches(const CIMObjectPath& name, const CIMObjectPath& path) const {
        return InstanceKeys(*cimClass, name, nameSpace).match(path);
    }
    static CIMObjectPath link(const char* target, bool on, const char* when) {
        CIMObjectPath path;
        path.setClassName("Link");
        Pegasus::Array<CIMKeyBinding> keys;
        keys.append(CIMKeyBinding("Target", target, CIMKeyBinding::REFERENCE));
        keys.append(CIMKeyBinding("On", on ? "TRUE" : "FALSE", CIMKeyBinding::BOOLEAN));
        keys.append(CIMKeyBinding("When", when, CIMKeyBinding::STRING));
        path.setKeyBindings(keys);
        return path;
    }

    Pegasus::CIMNamespaceName nameSpace{"root/cimv2"};
    std::shared_ptr<const ClassRepository> classes = compiledClasses(
        "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);\n"
        "class A { [Key] string Name; };\n"
        "class Link { [Key] A REF Target; [Key] boolean On; [Key] datetime When; };\n");
    const Pegasus::CIMConstClass* cimClass = classes->findClass(nameSpace, "Link");
};

constexpr const char* kWhen = "20260101000000.000000+000";

TEST_F(InstanceKeysTest, comparesReferencesAsPathsOnThisMachine) {
    const CIMObjectPath path = link("root/cimv2:A.Name=\"x\"", true, kWhen);
    EXPECT_TRUE(matches(link("A.Name=\"x\"", true, kWhen), path));
    EXPECT_TRUE(matches(link("a.name=\"x\"", true, kWhen), path));
    EXPECT_TRUE(matches(link("//host/ROOT/CIMV2:A.Name=\"x\"", true, kWhen), path));
    EXPECT_TRUE(matches(path, link("A.Name=\"x\"", true, kWhen)));
    EXPECT_FALSE(matches(link("root/other:A.Name=\"x\"", true, kWhen), path));
    EXPECT_FALSE(matches(link("A.Name=\"X\"", true, kWhen), path));
    EXPECT_FALSE(matches(link("no path", true, kWhen), path));
}

TEST_F(InstanceKeysTest, comparesEveryKey) {
    const CIMObjectPath path = link("A.Name=\"x\"", true, kWhen);
    EXPECT_FALSE(matches(link("A.Name=\"x\"", false, kWhen), path));
    EXPECT_FALSE(matches(link("A.Name=\"x\"", true, "20270101000000.000000+000"), path));
}

TEST_F(InstanceKeysTest, takesKeysInAnyOrder) {
    CIMObjectPath turned = link("A.Name=\"x\"", true, kWhen);
    const Pegasus::Array<CIMKeyBinding> keys = turned.getKeyBindings();
    Pegasus::Array<CIMKeyBinding> reversed;
    for (Pegasus::Uint32 i = keys.size(); i > 0; --i)
        reversed.append(keys[i - 1]);
    turned.setKeyBindings(reversed);
    EXPECT_TRUE(matches(turned, link("A.Name=\"x\"", true, kWhen)));
}

TEST_F(InstanceKeysTest, wantsANameWhereThereAreSeveralKeys) {
    CIMObjectPath path;
    path.setClassName("Link");
    Pegasus::Array<CIMKeyBinding> keys;
    keys.append(CIMKeyBinding(Pegasus::CIMName(), "x", CIMKeyBinding::STRING));
    path.setKeyBindings(keys);
    try {
        matches(path, path);
        FAIL();
    } catch (const Pegasus::CIMException& error) {
        EXPECT_EQ(error.getCode(), Pegasus::CIM_ERR_INVALID_PARAMETER);
    }
}

}  // namespace
}  // namespace cimomd
