// A client whose server is a child process that it started itself.

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <iterator>
#include <memory>
#include <string>

#include "ClientFixture.h"
#include "client/CIMClientRep.h"
#include "support/ScopedEnvironment.h"

namespace Pegasus {
namespace {

using testing_client::kNamespace;
using testing_client::Stopwatch;
using testing_client::text;

std::size_t openDescriptorCount() {
    return static_cast<std::size_t>(
        std::distance(std::filesystem::directory_iterator("/proc/self/fd"),
                      std::filesystem::directory_iterator()));
}

bool hasChildren() {
    return waitpid(-1, nullptr, WNOHANG) >= 0 || errno != ECHILD;
}

class EmbeddedServerTest : public testing::Test {
  protected:
    EmbeddedServerTest() {
        client = std::make_unique<CIMClientRep>(ClientSettings());
        client->setTimeout(5000);
    }

    std::string nameOfClass(const char* name) {
        return text(
            client->getClass(kNamespace, CIMName(name), true, true, false, CIMPropertyList())
                .getClassName()
                .getString());
    }

    CIMInstance process() {
        const Array<CIMInstance> found = client->enumerateInstances(
            kNamespace, CIMName("Fake_Process"), true, false, false, false, CIMPropertyList());
        EXPECT_EQ(found.size(), 1U);
        return found[0];
    }

    static std::string propertyOf(const CIMInstance& instance, const char* name) {
        const CIMConstInstance constant(instance);
        return text(
            constant.getProperty(constant.findProperty(CIMName(name))).getValue().toString());
    }

    support::ScopedEnvironment noSocket{"CIM_LOCAL_SOCKET"};
    support::ScopedEnvironment childAllowed{"CIM_EMBEDDED"};
    support::ScopedEnvironment command{"CIM_COMMAND", FAKE_CIMOMD};
    std::unique_ptr<CIMClientRep> client;
};

TEST_F(EmbeddedServerTest, AnswersLikeAnyOther) {
    client->connectLocal();
    EXPECT_EQ(nameOfClass("Fake_Thing"), "Fake_Thing");
    EXPECT_EQ(nameOfClass("Fake_Thing"), "Fake_Thing");
}

TEST_F(EmbeddedServerTest, InheritsNothingButItsConnection) {
    support::ScopedEnvironment secret("SECRET", "x");
    const int leak = dup(0);
    std::signal(SIGPIPE, SIG_IGN);
    sigset_t blocked;
    sigemptyset(&blocked);
    sigaddset(&blocked, SIGTERM);
    sigprocmask(SIG_BLOCK, &blocked, nullptr);
    client->connectLocal();
    sigprocmask(SIG_UNBLOCK, &blocked, nullptr);
    std::signal(SIGPIPE, SIG_DFL);
    close(leak);

    const CIMInstance child = process();
    EXPECT_EQ(propertyOf(child, "Arguments"), "--fd 3 ");
    EXPECT_EQ(propertyOf(child, "Environment"), "PATH=/usr/sbin:/usr/bin:/sbin:/bin ");
    EXPECT_EQ(propertyOf(child, "Descriptors"), "0 /dev/null 1 /dev/null 2 /dev/null 3 socket ");
    EXPECT_EQ(propertyOf(child, "BlockedOrIgnoredSignals"), "0");
}

TEST_F(EmbeddedServerTest, EndsWithTheConnectionAndLeavesNothing) {
    client->connectLocal();
    nameOfClass("Fake_Thing");
    client->disconnect();
    EXPECT_FALSE(hasChildren());
    const std::size_t before = openDescriptorCount();
    for (int i = 0; i < 5; ++i) {
        client->connectLocal();
        nameOfClass("Fake_Thing");
        client->disconnect();
    }
    EXPECT_EQ(openDescriptorCount(), before);
    EXPECT_FALSE(hasChildren());
}

TEST_F(EmbeddedServerTest, EndsWithTheClient) {
    client->connectLocal();
    const Stopwatch watch;
    client.reset();
    EXPECT_LT(watch.milliseconds(), 900);
    EXPECT_FALSE(hasChildren());
}

TEST_F(EmbeddedServerTest, EndsEvenWhenItDoesNotWantTo) {
    client->connectLocal();
    nameOfClass("Fake_Stubborn");
    client->disconnect();
    EXPECT_FALSE(hasChildren());
}

TEST_F(EmbeddedServerTest, AnotherIsStartedWhenItHasDied) {
    client->connectLocal();
    EXPECT_THROW(nameOfClass("Fake_End"), CIMClientMalformedHTTPException);
    EXPECT_EQ(nameOfClass("Fake_Thing"), "Fake_Thing");
    const std::string first = propertyOf(process(), "Pid");
    ASSERT_EQ(kill(std::stoi(first), SIGKILL), 0);
    // Its end of the connection is closed before its status can be seen.
    siginfo_t ended{};
    ASSERT_EQ(waitid(P_PID, static_cast<id_t>(std::stoi(first)), &ended, WEXITED | WNOWAIT), 0);
    EXPECT_NE(propertyOf(process(), "Pid"), first);
    client->disconnect();
    EXPECT_FALSE(hasChildren());
}

TEST_F(EmbeddedServerTest, AProgramThatIsNoServerIsAnError) {
    const support::ScopedEnvironment other("CIM_COMMAND", "/bin/true");
    client->connectLocal();
    EXPECT_THROW(nameOfClass("Fake_Thing"), CIMClientMalformedHTTPException);
    client->disconnect();
    EXPECT_FALSE(hasChildren());
}

TEST_F(EmbeddedServerTest, AProgramThatCannotBeRunIsNoConnection) {
    const support::ScopedEnvironment other("CIM_COMMAND", "/nowhere/cimomd");
    EXPECT_THROW(client->connectLocal(), CannotConnectException);
    EXPECT_THROW(nameOfClass("Fake_Thing"), NotConnectedException);
    EXPECT_FALSE(hasChildren());
}

}  // namespace
}  // namespace Pegasus
