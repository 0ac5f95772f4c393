#include "providers/computer/ComputerSystemProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;

TEST(ComputerSystemProvider, takesTheTextsThatTheKernelHandsOn) {
    RecordedTree tree;
    tree.file("proc/sys/kernel/hostname", "node7\n")
        .file("sys/class/dmi/id/sys_vendor", "QEMU\n")
        .file("sys/class/dmi/id/product_name", "Standard PC \xFF\x01\n")
        .file("sys/class/dmi/id/product_uuid", "11111111-1111-1111-1111-111111111111\n")
        .file("sys/class/dmi/id/product_sku", "SKU 5\n")
        .file("sys/class/dmi/id/product_family", "Family 9\n")
        .file("etc/machine-id", "5e2b7c90d41f4a8f9c63b0e8a7d61f24\n");
    const ComputerSystemProvider provider(tree.paths());
    expectServesItsClass(provider);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 1U);
    const CIMInstance& system = instances[0];
    EXPECT_EQ(textOf(system, "Name"), "node7");
    EXPECT_EQ(textOf(system, "CreationClassName"), "Velmira_ComputerSystem");
    EXPECT_EQ(textOf(system, "NameFormat"), "Other");
    EXPECT_EQ(textOf(system, "Dedicated"), "0 ");
    EXPECT_EQ(textOf(system, "Manufacturer"), "QEMU");
    EXPECT_EQ(textOf(system, "Model"), "Standard PC \xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(textOf(system, "UUID"), "null");
    EXPECT_EQ(textOf(system, "SerialNumber"), "null");
    EXPECT_EQ(textOf(system, "SKU"), "SKU 5");
    EXPECT_EQ(textOf(system, "Family"), "Family 9");
    EXPECT_EQ(textOf(system, "OtherIdentifyingInfo"), "5e2b7c90d41f4a8f9c63b0e8a7d61f24 ");
    EXPECT_EQ(textOf(system, "IdentifyingDescriptions"), "Machine id ");
}

TEST(ComputerSystemProvider, hasNoOtherIdentificationWhenNothingIdentifiesTheMachine) {
    const ProvidedInstance provided = ComputerSystemProvider::publish("node7", {});
    EXPECT_EQ(textOf(provided.instance, "OtherIdentifyingInfo"), "null");
    EXPECT_EQ(textOf(provided.instance, "IdentifyingDescriptions"), "null");
}

TEST(ComputerSystemProvider, saysWhatTheResetButtonDoes) {
    const auto capability = [](std::uint8_t resetButton) {
        SystemIdentity identity;
        identity.resetButton = resetButton;
        return textOf(ComputerSystemProvider::publish("node7", identity).instance,
                      "ResetCapability");
    };
    EXPECT_EQ(capability(0), "3");
    EXPECT_EQ(capability(1), "4");
    EXPECT_EQ(capability(2), "5");
    EXPECT_EQ(capability(3), "2");
}

TEST(ComputerSystemProvider, takesNoWakeUpTypesThatTheListLacks) {
    SystemIdentity identity;
    identity.wakeUpType = std::uint8_t{8};
    EXPECT_EQ(textOf(ComputerSystemProvider::publish("n", identity).instance, "WakeUpType"), "8");
    identity.wakeUpType = std::uint8_t{9};
    EXPECT_EQ(textOf(ComputerSystemProvider::publish("n", identity).instance, "WakeUpType"),
              "null");
}

}  // namespace
}  // namespace cimomd
