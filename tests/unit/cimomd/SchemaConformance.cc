#include "SchemaConformance.h"

#include <gtest/gtest.h>

#include <set>

#include "InstanceText.h"
#include "mof/MofCompiler.h"

namespace cimomd {
namespace {

const Pegasus::CIMNamespaceName kNamespace("root/cimv2");

const ClassRepository& shippedSchema() {
    static const ClassRepository repository = [] {
        ClassRepository compiled;
        MofCompiler(compiled, kNamespace)
            .compileFile(std::filesystem::path(SCHEMA_DIR) / "cimomd.mof");
        return compiled;
    }();
    return repository;
}

bool isKey(const Pegasus::CIMConstProperty& property) {
    const Pegasus::Uint32 index = property.findQualifier("Key");
    Pegasus::Boolean key = false;
    if (index != Pegasus::PEG_NOT_FOUND)
        property.getQualifier(index).getValue().get(key);
    return key;
}

void expectDeclared(const Pegasus::CIMConstClass& declared, const ProvidedInstance& provided) {
    const Pegasus::CIMConstInstance instance(provided.instance);
    for (Pegasus::Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        const std::string name = utf8Of(instance.getProperty(i).getName().getString());
        EXPECT_NE(declared.findProperty(instance.getProperty(i).getName()), Pegasus::PEG_NOT_FOUND)
            << name << " is not declared";
    }
    for (Pegasus::Uint32 i = 0; i < declared.getPropertyCount(); ++i) {
        const Pegasus::CIMConstProperty property = declared.getProperty(i);
        const std::string name = utf8Of(property.getName().getString());
        const Pegasus::Uint32 index = instance.findProperty(property.getName());
        ASSERT_NE(index, Pegasus::PEG_NOT_FOUND) << name << " is not served";
        const Pegasus::CIMConstProperty found = instance.getProperty(index);
        EXPECT_EQ(found.getType(), property.getType()) << name;
        EXPECT_EQ(found.isArray(), property.isArray()) << name;
        EXPECT_FALSE(isKey(property) && found.getValue().isNull()) << "the key " << name;
    }
}

}  // namespace

void expectServesItsClass(const Provider& provider) {
    SCOPED_TRACE(provider.className());
    const auto* declared = shippedSchema().findClass(kNamespace, provider.className());
    ASSERT_NE(declared, nullptr);
    std::set<std::string> identities;
    const auto stream = provider.enumerate();
    ProvidedInstance provided;
    while (stream->next(provided)) {
        EXPECT_EQ(utf8Of(provided.instance.getClassName().getString()), provider.className());
        expectDeclared(*declared, provided);
        EXPECT_TRUE(identities.insert(provided.identity).second) << provided.identity << " again";
    }
    EXPECT_FALSE(identities.empty());
}

}  // namespace cimomd
