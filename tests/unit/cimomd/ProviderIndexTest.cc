#include "providers/ProviderIndex.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

class NamedProvider : public Provider {
  public:
    explicit NamedProvider(const char* name) : name(name) {}
    const char* className() const override { return name; }
    std::unique_ptr<InstanceStream> enumerate() const override { return nullptr; }

  private:
    const char* name;
};

TEST(ProviderIndex, findsByClassInItsNamespaceOnly) {
    ProviderList providers;
    providers.push_back(std::make_unique<NamedProvider>("Velmira_Disk"));
    providers.push_back(std::make_unique<NamedProvider>("CIM_Fan"));
    const ProviderIndex index(providers, Pegasus::CIMNamespaceName("root/cimv2"));
    EXPECT_EQ(index.find(Pegasus::CIMNamespaceName("root/cimv2"), "CIM_Fan"), providers[1].get());
    EXPECT_EQ(index.find(Pegasus::CIMNamespaceName("Root/CIMv2"), "velmira_DISK"),
              providers[0].get());
    EXPECT_EQ(index.find(Pegasus::CIMNamespaceName("root/cimv2"), "CIM_Disk"), nullptr);
    EXPECT_EQ(index.find(Pegasus::CIMNamespaceName("root/other"), "CIM_Fan"), nullptr);
}

}  // namespace
}  // namespace cimomd
