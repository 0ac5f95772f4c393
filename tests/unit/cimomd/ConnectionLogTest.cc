#include "service/ConnectionLog.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace cimomd {
namespace {

using std::chrono::milliseconds;

class ConnectionLogTest : public testing::Test {
  protected:
    void connect(int times, int atMs) {
        for (int i = 0; i < times; ++i)
            log.add("somebody", start + milliseconds(atMs));
    }
    void tell(int atMs) { log.tellLeftOut(start + milliseconds(atMs)); }
    static std::vector<std::string> somebody(std::size_t times) {
        return std::vector<std::string>(times, "somebody");
    }

    const ConnectionLog::Clock::time_point start{milliseconds(5000)};
    std::vector<std::string> lines;
    ConnectionLog log{[this](std::string_view line) { lines.emplace_back(line); }};
};

TEST_F(ConnectionLogTest, writesTenLinesInASecond) {
    connect(4, 0);
    connect(6, 999);
    tell(5000);
    EXPECT_EQ(lines, somebody(10));
}

TEST_F(ConnectionLogTest, tellsHowManyMoreThereWereWhenTheSecondIsOver) {
    connect(10, 0);
    connect(70'000, 500);
    tell(999);
    EXPECT_EQ(lines, somebody(10));
    tell(1000);
    std::vector<std::string> expected = somebody(10);
    expected.emplace_back("connections within a second that are not listed: 70000");
    EXPECT_EQ(lines, expected);
    tell(3000);
    EXPECT_EQ(lines, expected);
}

TEST_F(ConnectionLogTest, tellsItBeforeTheNextLine) {
    connect(11, 0);
    connect(1, 1500);
    std::vector<std::string> expected = somebody(10);
    expected.emplace_back("connections within a second that are not listed: 1");
    expected.emplace_back("somebody");
    EXPECT_EQ(lines, expected);
}

TEST_F(ConnectionLogTest, givesEachSecondItsTenLines) {
    connect(10, 0);
    connect(10, 1000);
    connect(10, 2000);
    EXPECT_EQ(lines, somebody(30));
}

}  // namespace
}  // namespace cimomd
