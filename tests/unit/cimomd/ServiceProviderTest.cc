#include "providers/software/ServiceProvider.h"

#include <gtest/gtest.h>

#include "FakeServiceManager.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

ProvidedInstance published(const Fact<std::string>& activeState,
                           const Fact<std::string>& fileState) {
    return ServiceProvider::publish("node7", {"ssh.service", std::string("Secure Shell"),
                                              activeState, std::string("running"), fileState});
}

TEST(ServiceProvider, publishesAService) {
    const auto ssh = published(std::string("active"), std::string("enabled")).instance;
    EXPECT_EQ(textOf(ssh, "Name"), "ssh.service");
    EXPECT_EQ(textOf(ssh, "Caption"), "Secure Shell");
    EXPECT_EQ(textOf(ssh, "SystemName"), "node7");
    EXPECT_EQ(textOf(ssh, "SystemCreationClassName"), "Velmira_ComputerSystem");
    EXPECT_EQ(textOf(ssh, "CreationClassName"), "Velmira_Service");
    EXPECT_EQ(textOf(ssh, "UnitFileState"), "enabled");
    EXPECT_EQ(textOf(ssh, "ActiveState"), "active");
    EXPECT_EQ(textOf(ssh, "SubState"), "running");
    EXPECT_EQ(textOf(ssh, "StartMode"), "Automatic");
}

TEST(ServiceProvider, translatesWhatAServiceDoes) {
    struct Case {
        Fact<std::string> state;
        const char* started;
        const char* operational;
        const char* enabled;
    };
    for (const Case& expected :
         std::vector<Case>{{std::string("active"), "TRUE", "2 ", "2"},
                           {std::string("reloading"), "TRUE", "2 ", "2"},
                           {std::string("activating"), "FALSE", "8 ", "10"},
                           {std::string("deactivating"), "TRUE", "9 ", "4"},
                           {std::string("inactive"), "FALSE", "10 ", "3"},
                           {std::string("failed"), "FALSE", "6 ", "3"},
                           {Absence::Absent, "FALSE", "10 ", "3"},
                           {std::string("new word"), "null", "null", "null"}}) {
        const auto instance = published(expected.state, Absence::Absent).instance;
        EXPECT_EQ(textOf(instance, "Started"), expected.started);
        EXPECT_EQ(textOf(instance, "OperationalStatus"), expected.operational);
        EXPECT_EQ(textOf(instance, "EnabledState"), expected.enabled);
    }
}

TEST(ServiceProvider, translatesWhetherTheStartOfTheMachineStartsIt) {
    struct Case {
        const char* state;
        const char* enabledDefault;
        const char* startMode;
    };
    for (const Case& expected : std::vector<Case>{{"enabled", "2", "Automatic"},
                                                  {"enabled-runtime", "2", "Automatic"},
                                                  {"disabled", "3", "Manual"},
                                                  {"linked", "3", "Manual"},
                                                  {"masked", "3", "null"},
                                                  {"static", "5", "null"},
                                                  {"indirect", "5", "null"},
                                                  {"generated", "5", "null"},
                                                  {"bad", "null", "null"}}) {
        const auto instance = published(Absence::Absent, std::string(expected.state)).instance;
        EXPECT_EQ(textOf(instance, "EnabledDefault"), expected.enabledDefault) << expected.state;
        EXPECT_EQ(textOf(instance, "StartMode"), expected.startMode) << expected.state;
    }
}

TEST(ServiceProvider, servesItsClassFromTheBus) {
    RecordedTree tree;
    FakeServiceManager manager(tree.paths().systemBus(), FakeServiceManager::Manner::Answers);
    manager.units = {{"ssh.service", "Secure Shell", "loaded", "active", "running"}};
    manager.files = {{"/lib/systemd/system/cups.service", "disabled"}};
    expectServesItsClass(ServiceProvider(tree.paths()));
}

TEST(ServiceProvider, saysWhyThereAreNoServices) {
    const RecordedTree tree;
    EXPECT_EQ(ServiceProvider(tree.paths()).enumerate()->absence(), Absence::Absent);
}

}  // namespace
}  // namespace cimomd
