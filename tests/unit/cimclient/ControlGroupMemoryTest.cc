#include "client/ControlGroupMemory.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <limits>
#include <string>
#include <string_view>

#include "client/MemoryBudget.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

constexpr Uint64 kNoLimit = std::numeric_limits<Uint64>::max();

class ControlGroupMemory : public ::testing::Test {
  protected:
    void write(const std::string& file, std::string_view text) {
        std::filesystem::create_directories(std::filesystem::path(root.path(file)).parent_path());
        root.write(file, text);
    }

    void haveGroups(std::string_view lines) { write("proc/self/cgroup", lines); }

    Uint64 limit() const { return controlGroupMemoryLimit(root.path()); }

    support::TempDirectory root;
};

TEST_F(ControlGroupMemory, HasNoLimitWithoutTheKernelsFiles) {
    EXPECT_EQ(limit(), kNoLimit);
}

TEST_F(ControlGroupMemory, HasNoLimitWhereTheFilesSayNone) {
    haveGroups("0::/a\n");
    write("sys/fs/cgroup/a/memory.max", "max\n");
    EXPECT_EQ(limit(), kNoLimit);
}

// As in a container with its own view of the groups.
TEST_F(ControlGroupMemory, FindsTheLimitOfTheTop) {
    haveGroups("0::/\n");
    write("sys/fs/cgroup/memory.max", "268435456\n");
    EXPECT_EQ(limit(), 268435456U);
}

TEST_F(ControlGroupMemory, FindsTheLimitOfTheTopFromAGroupBelow) {
    haveGroups("0::/a/b\n");
    write("sys/fs/cgroup/memory.max", "268435456\n");
    write("sys/fs/cgroup/a/b/memory.max", "max\n");
    EXPECT_EQ(limit(), 268435456U);
}

TEST_F(ControlGroupMemory, TakesTheLeastOfAGroupAndThoseAroundIt) {
    haveGroups("0::/a/b:c/d\n");
    write("sys/fs/cgroup/a/memory.max", "3000\n");
    write("sys/fs/cgroup/a/b:c/memory.max", "1000\n");
    write("sys/fs/cgroup/a/b:c/d/memory.max", "2000\n");
    write("sys/fs/cgroup/other/memory.max", "10\n");
    EXPECT_EQ(limit(), 1000U);
}

TEST_F(ControlGroupMemory, KnowsGroupsOfVersion1) {
    haveGroups("5:cpu,cpuacct:/a\n4:memory:/a/b\n1:name=systemd:/x\n");
    write("sys/fs/cgroup/memory/memory.limit_in_bytes", "9223372036854771712\n");
    write("sys/fs/cgroup/memory/a/memory.limit_in_bytes", "1000\n");
    write("sys/fs/cgroup/memory/a/b/memory.limit_in_bytes", "2000\n");
    write("sys/fs/cgroup/memory/x/memory.limit_in_bytes", "10\n");
    EXPECT_EQ(limit(), 1000U);
}

// The path is the host's, and the container sees its own group as the top.
TEST_F(ControlGroupMemory, FindsTheTopOfVersion1FromAPathThatIsNotThere) {
    haveGroups("4:hugetlb,memory:/docker/0123\n0::/\n");
    write("sys/fs/cgroup/memory/memory.limit_in_bytes", "4096\n");
    EXPECT_EQ(limit(), 4096U);
}

TEST_F(ControlGroupMemory, PassesOverLinesOfAnotherForm) {
    haveGroups("\n:\n::\n0:\n0::\n0::x\n4:memory\n4:memory:\n/\n");
    write("sys/fs/cgroup/memory.max", "1000\n");
    EXPECT_EQ(limit(), kNoLimit);
}

TEST_F(ControlGroupMemory, BoundsTheAnswersToAQuarter) {
    haveGroups("0::/\n");
    write("sys/fs/cgroup/memory.max", "4000000\n");
    EXPECT_EQ(memoryForAnswers(root.path()), 1000000U);
}

}  // namespace
}  // namespace Pegasus
