// The project's own client library against the real cimomd, on each kind of Unix socket.

#include <Pegasus/Client/CIMClient.h>
#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstring>

#include "support/ScopedEnvironment.h"
#include "unit/cimomd/InstanceText.h"
#include "unit/cimomd/RecordedTree.h"
#include "unit/cimomd/RunningCimomd.h"

namespace cimomd {
namespace {

class ClientLibraryTest : public testing::Test {
  protected:
    ClientLibraryTest() {
        tree.file("machine/proc/sys/kernel/hostname", "node7\n")
            .file("machine/etc/os-release", "ID=debian\nNAME=Debian\nVERSION_ID=12\n")
            .file("machine/proc/sys/kernel/arch", "x86_64\n");
    }

    /// What all kinds of sockets have to give.
    void expectAnswers() {
        Pegasus::CIMClient client;
        client.connectLocal();
        const auto cimClass = client.getClass(nameSpace, "Velmira_OperatingSystem");
        EXPECT_EQ(utf8Of(cimClass.getSuperClassName().getString()), "CIM_OperatingSystem");
        for (int i = 0; i < 2; ++i) {
            const auto systems =
                client.enumerateInstances(nameSpace, "CIM_OperatingSystem", true, false);
            ASSERT_EQ(systems.size(), 1U);
            EXPECT_EQ(textOf(systems[0], "CSName"), "node7");
            EXPECT_EQ(textOf(systems[0], "OSType"), "96");
            EXPECT_EQ(textOf(systems[0], "LastBootUpTime"), "null");
        }
        try {
            client.getClass(nameSpace, "CIM_Nothing");
            ADD_FAILURE() << "there is no such class";
        } catch (const Pegasus::CIMException& error) {
            EXPECT_EQ(error.getCode(), Pegasus::CIM_ERR_NOT_FOUND);
        }
    }

    RecordedTree tree;
    const std::string machine = (tree.root / "machine").string();
    const std::string socketPath = (tree.root / "s").string();
    const Pegasus::CIMNamespaceName nameSpace{"root/cimv2"};
    support::ScopedEnvironment place{"CIM_LOCAL_SOCKET", socketPath};
};

TEST_F(ClientLibraryTest, onASocketOfItsOwn) {
    RunningCimomd server({"--socket", socketPath, "--root", machine});
    ASSERT_TRUE(server.serves(socketPath));
    expectAnswers();
    server.signal(SIGTERM);
    EXPECT_EQ(server.wait(), 0);
    Pegasus::CIMClient late;
    EXPECT_THROW(late.connectLocal(), Pegasus::CannotConnectException);
}

TEST_F(ClientLibraryTest, onASocketForAGroup) {
    RunningCimomd server({"--socket", socketPath, "--socket-mode", "0660", "--root", machine});
    ASSERT_TRUE(server.serves(socketPath));
    expectAnswers();
    struct stat status {};
    ASSERT_EQ(::stat(socketPath.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777U, 0660U);
}

TEST_F(ClientLibraryTest, onASocketThatWasHandedOver) {
    const int listener = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, socketPath.c_str(), sizeof address.sun_path - 1);
    ASSERT_EQ(::bind(listener, reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
    ASSERT_EQ(::listen(listener, 8), 0);
    RunningCimomd server({"--root", machine}, listener, RunningCimomd::Handover::Activation);
    ::close(listener);
    expectAnswers();
    server.signal(SIGTERM);
    EXPECT_EQ(server.wait(), 0);
    // It belongs to whoever handed it over.
    EXPECT_TRUE(std::filesystem::exists(socketPath));
}

}  // namespace
}  // namespace cimomd
