#include "system/software/ServiceUnit.h"

#include <gtest/gtest.h>

#include "FakeServiceManager.h"
#include "RecordedTree.h"

namespace cimomd {
namespace {

using Row = SystemBus::Row;
using Manner = FakeServiceManager::Manner;

Row unit(const std::string& name, const std::string& load, const std::string& active,
         const std::string& sub) {
    return {name, "About " + name, load, active, sub, "", "/unit", "", "", "/"};
}

TEST(ServiceUnit, joinsWhatIsLoadedWithWhatIsInstalled) {
    const auto services =
        serviceUnitsOf({unit("ssh.service", "loaded", "active", "running"),
                        unit("ssh.socket", "loaded", "active", "listening"),
                        unit("gone.service", "not-found", "inactive", "dead"),
                        unit("getty@tty1.service", "loaded", "active", "running")},
                       std::vector<Row>{{"/lib/systemd/system/ssh.service", "enabled"},
                                        {"/etc/systemd/system/cups.service", "disabled"},
                                        {"/etc/systemd/system/sshd.service", "alias"},
                                        {"/lib/systemd/system/getty@.service", "enabled"},
                                        {"/lib/systemd/system/ssh.socket", "disabled"},
                                        {"/lib/systemd/system/.service", "disabled"}});
    ASSERT_EQ(services.size(), 3U);
    EXPECT_EQ(services[0].name, "cups.service");
    EXPECT_EQ(services[0].description, std::nullopt);
    EXPECT_EQ(services[0].activeState, std::nullopt);
    EXPECT_EQ(services[0].fileState, "disabled");
    EXPECT_EQ(services[1].name, "getty@tty1.service");
    EXPECT_EQ(services[1].fileState, std::nullopt);
    EXPECT_EQ(services[2].name, "ssh.service");
    EXPECT_EQ(services[2].description, "About ssh.service");
    EXPECT_EQ(services[2].activeState, "active");
    EXPECT_EQ(services[2].subState, "running");
    EXPECT_EQ(services[2].fileState, "enabled");
}

TEST(ServiceUnit, keepsTheReasonWhenFilesAreNotListed) {
    const auto services =
        serviceUnitsOf({unit("a.service", "loaded", "active", "running")}, Absence::TimedOut);
    ASSERT_EQ(services.size(), 1U);
    EXPECT_EQ(services[0].fileState.reason(), Absence::TimedOut);
}

class ServiceManagerTest : public testing::Test {
  protected:
    RecordedTree tree;
    const std::filesystem::path socket = tree.paths().systemBus();
};

TEST_F(ServiceManagerTest, isAsked) {
    FakeServiceManager manager(socket, Manner::Answers);
    manager.units = {{"ssh.service", "OpenBSD Secure Shell server", "loaded", "active", "running"},
                     {"cron.service", "Cron", "loaded", "failed", "failed"}};
    manager.files = {{"/lib/systemd/system/ssh.service", "enabled"}};
    const auto services = readServiceUnits(socket);
    ASSERT_TRUE(services);
    ASSERT_EQ(services->size(), 2U);
    EXPECT_EQ((*services)[0].name, "cron.service");
    EXPECT_EQ((*services)[0].activeState, "failed");
    EXPECT_EQ((*services)[1].description, "OpenBSD Secure Shell server");
    EXPECT_EQ((*services)[1].fileState, "enabled");
}

TEST_F(ServiceManagerTest, mayHaveThousandsOfServices) {
    FakeServiceManager manager(socket, Manner::Answers);
    for (int i = 0; i < 5000; ++i)
        manager.units.push_back(
            {"s" + std::to_string(i) + ".service", std::string(100, 'x'), "loaded", "active", "r"});
    EXPECT_EQ(readServiceUnits(socket).value().size(), 5000U);
}

TEST_F(ServiceManagerTest, saysWhyThereIsNothing) {
    EXPECT_EQ(readServiceUnits(socket).reason(), Absence::Absent);
    struct Case {
        Manner manner;
        Absence reason;
    };
    for (const Case& expected :
         {Case{Manner::Refuses, Absence::NeedsRoot}, Case{Manner::IsMissing, Absence::Absent},
          Case{Manner::AnswersNonsense, Absence::Unreadable},
          Case{Manner::HangsUp, Absence::Unreadable},
          Case{Manner::SaysNothing, Absence::TimedOut}}) {
        std::filesystem::remove(socket);
        const FakeServiceManager manager(socket, expected.manner);
        const auto services = readServiceUnits(socket);
        EXPECT_FALSE(services);
        EXPECT_EQ(services.reason(), expected.reason) << static_cast<int>(expected.manner);
    }
    // The socket of a bus that has ended.
    EXPECT_EQ(readServiceUnits(socket).reason(), Absence::Absent);
    std::filesystem::remove(socket);
    tree.file("run/dbus/system_bus_socket", "no socket");
    EXPECT_FALSE(readServiceUnits(socket));
}

}  // namespace
}  // namespace cimomd
