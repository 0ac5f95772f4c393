#include "protocol/ConnectionWatch.h"

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <thread>

namespace cimomd {
namespace {

class ConnectionWatchTest : public testing::Test {
  protected:
    void SetUp() override {
        ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
        watched = watch.add(ends[0]);
    }
    void TearDown() override {
        ::close(ends[0]);
        ::close(ends[1]);
    }

    bool isShutDownAfterItsTime() {
        std::this_thread::sleep_for(std::chrono::milliseconds(1100));
        watch.shutDownOverdue();
        char byte = 0;
        return ::recv(ends[1], &byte, 1, MSG_DONTWAIT) == 0;
    }

    std::array<int, 2> ends{};
    ConnectionWatch watch;
    WatchedConnection* watched = nullptr;
};

TEST_F(ConnectionWatchTest, shutsDownAClientThatIsTooSlow) {
    watched->expectProgress(std::chrono::seconds(1));
    watch.shutDownOverdue();
    char byte = 0;
    EXPECT_EQ(::recv(ends[1], &byte, 1, MSG_DONTWAIT), -1);
    EXPECT_TRUE(isShutDownAfterItsTime());
}

TEST_F(ConnectionWatchTest, leavesTheServerItsTime) {
    watched->expectProgress(std::chrono::seconds(1));
    watched->waitForServer();
    EXPECT_FALSE(isShutDownAfterItsTime());
}

TEST_F(ConnectionWatchTest, hasNoDeadlineForNoPatience) {
    watched->expectProgress(std::chrono::seconds(0));
    EXPECT_FALSE(isShutDownAfterItsTime());
}

TEST_F(ConnectionWatchTest, forgetsWhatIsRemoved) {
    watched->expectProgress(std::chrono::seconds(1));
    watch.remove(watched);
    EXPECT_FALSE(isShutDownAfterItsTime());
}

}  // namespace
}  // namespace cimomd
