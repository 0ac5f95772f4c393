#include "client/UnixSocket.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <chrono>
#include <thread>

#include "support/FakeCimServer.h"
#include "support/Files.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

TEST(UnixSocketTest, ConnectsWithoutBlockingAndWithoutLeakingIntoPrograms) {
    const support::FakeCimServer server;
    const ConnectResult result =
        connectUnixSocket(server.socketPath(), FinalLink::Refuse, Deadline(1000));
    ASSERT_EQ(result.error, 0);
    EXPECT_NE(fcntl(result.socket.get(), F_GETFL) & O_NONBLOCK, 0);
    EXPECT_NE(fcntl(result.socket.get(), F_GETFD) & FD_CLOEXEC, 0);
    EXPECT_EQ(peerUserOf(result.socket), geteuid());
}

TEST(UnixSocketTest, SaysWhyNot) {
    const support::TempDirectory directory;
    support::writeFile(directory.path("f"), "");
    const Deadline deadline(1000);
    EXPECT_EQ(connectUnixSocket(directory.path("none"), FinalLink::Follow, deadline).error, ENOENT);
    EXPECT_EQ(connectUnixSocket(directory.path("f"), FinalLink::Follow, deadline).error, ENOTSOCK);
    EXPECT_EQ(connectUnixSocket(directory.path(), FinalLink::Follow, deadline).error, ENOTSOCK);
}

TEST(UnixSocketTest, FollowsALinkOnlyWhenTold) {
    const support::FakeCimServer server;
    const support::TempDirectory directory;
    ASSERT_EQ(symlink(server.socketPath().c_str(), directory.path("link").c_str()), 0);
    const Deadline deadline(1000);
    EXPECT_EQ(connectUnixSocket(directory.path("link"), FinalLink::Follow, deadline).error, 0);
    EXPECT_EQ(connectUnixSocket(directory.path("link"), FinalLink::Refuse, deadline).error,
              ENOTSOCK);
}

TEST(UnixSocketTest, IdleMeansOpenWithNothingToRead) {
    std::array<int, 2> ends{};
    ASSERT_EQ(socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    const FileDescriptor own(ends[0]);
    FileDescriptor peer(ends[1]);
    EXPECT_TRUE(isIdle(own));
    ASSERT_EQ(write(peer.get(), "x", 1), 1);
    EXPECT_FALSE(isIdle(own));
    char octet = 0;
    ASSERT_EQ(read(own.get(), &octet, 1), 1);
    EXPECT_TRUE(isIdle(own));
    peer.reset();
    EXPECT_FALSE(isIdle(own));
}

TEST(UnixSocketTest, ACloseWithinTheGraceIsSeen) {
    std::array<int, 2> ends{};
    ASSERT_EQ(socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    const FileDescriptor own(ends[0]);
    FileDescriptor peer(ends[1]);
    EXPECT_TRUE(isIdle(own, std::chrono::microseconds(100)));
    // The longest grace there is, so that a slow machine cannot make the close come too late.
    std::thread closer([&peer] { peer.reset(); });
    EXPECT_FALSE(isIdle(own, std::chrono::microseconds(999'999)));
    closer.join();
}

TEST(UnixSocketTest, NoDescriptorHasNoPeer) {
    EXPECT_EQ(peerUserOf(FileDescriptor()), std::nullopt);
}

}  // namespace
}  // namespace Pegasus
