// Counting handles with one thread and with several.

#include <Pegasus/Common/HandleCount.h>
#include <gtest/gtest.h>

#include <thread>
#include <vector>

namespace Pegasus {
namespace {

TEST(HandleCount, KnowsTheLastHandle) {
    HandleCount count(1);
    EXPECT_FALSE(count.isShared());
    count.increase();
    EXPECT_TRUE(count.isShared());
    EXPECT_FALSE(count.decrease());
    EXPECT_FALSE(count.isShared());
    EXPECT_TRUE(count.decrease());
}

TEST(HandleCount, LosesNoneOfSeveralThreads) {
    constexpr int kThreads = 4;
    constexpr int kHandles = 20000;
    HandleCount count(1);
    std::vector<std::thread> threads;
    for (int i = 0; i < kThreads; ++i) {
        threads.emplace_back([&count] {
            for (int n = 0; n < kHandles; ++n) {
                count.increase();
                count.increase();
                count.decrease();
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    for (int i = 0; i < kThreads * kHandles; ++i) {
        ASSERT_FALSE(count.decrease());
    }
    EXPECT_TRUE(count.decrease());
}

}  // namespace
}  // namespace Pegasus
