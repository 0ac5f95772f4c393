#include "protocol/Peer.h"

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>

namespace cimomd {
namespace {

constexpr uid_t kSomebody = 12345;

/// A pair of connected sockets, made by the user that the process is at that time.
class Pair {
  public:
    Pair() { made = ::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) == 0; }
    ~Pair() {
        ::close(ends[0]);
        ::close(ends[1]);
    }
    Pair(const Pair&) = delete;
    Pair& operator=(const Pair&) = delete;

    bool made = false;
    std::array<int, 2> ends{-1, -1};
};

TEST(Peer, trustsItsOwnUser) {
    const Pair pair;
    ASSERT_TRUE(pair.made);
    const Peer peer = Peer::of(pair.ends[0]);
    EXPECT_TRUE(peer.isTrusted);
    EXPECT_FALSE(peer.user);
    EXPECT_TRUE(tellsUser(pair.ends[0]));
}

/// As a child that becomes another user once root has made the sockets; the status it ends with.
int statusOfChild(bool makesThemAsSomebody) {
    const pid_t child = ::fork();
    if (child == 0) {
        if (makesThemAsSomebody && ::seteuid(kSomebody) != 0)
            ::_exit(1);
        const Pair pair;
        const uid_t server = makesThemAsSomebody ? 0 : kSomebody;
        if (!pair.made || ::seteuid(server) != 0)
            ::_exit(2);
        const Peer peer = Peer::of(pair.ends[0]);
        const bool isSomebody = !peer.isTrusted && peer.user == kSomebody;
        const bool isTrusted = peer.isTrusted && !peer.user;
        ::_exit((makesThemAsSomebody ? isSomebody : isTrusted) ? 0 : 3);
    }
    int status = -1;
    ::waitpid(child, &status, 0);
    return status;
}

TEST(Peer, trustsRootAndNobodyElse) {
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can be another user";
    EXPECT_EQ(statusOfChild(false), 0);
    EXPECT_EQ(statusOfChild(true), 0);
}

TEST(Peer, isUnknownOnTheNetwork) {
    const int socket = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    ASSERT_GE(socket, 0);
    EXPECT_FALSE(tellsUser(socket));
    const Peer peer = Peer::of(socket);
    EXPECT_FALSE(peer.isTrusted);
    EXPECT_FALSE(peer.user);
    ::close(socket);
}

}  // namespace
}  // namespace cimomd
