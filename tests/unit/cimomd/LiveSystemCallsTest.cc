#include "system/LiveSystemCalls.h"

#include <gtest/gtest.h>
#include <sys/wait.h>

#include "RecordedTree.h"
#include "SilentFileSystem.h"

namespace cimomd {
namespace {

using std::chrono::milliseconds;

class LiveSystemCallsTest : public testing::TestWithParam<TextSource> {};

TEST_P(LiveSystemCallsTest, letsSourcesOfAKindSilenceNoneOfAnother) {
    RecordedTree tree;
    tree.file("a", "told");
    const LiveSystemCalls calls({milliseconds(100), milliseconds(60000), 1});
    {
        const SilentFileSystem silent;
        if (!silent.obstacle().empty())
            GTEST_SKIP() << "no FUSE file system can be mounted here: " << silent.obstacle();
        const auto texts = calls.textsInTime(GetParam(), {silent.mountPoint() + "/file"});
        EXPECT_EQ(texts.at(0).reason(), Absence::TimedOut);
        for (const TextSource source : {TextSource::Processes, TextSource::NetworkDrivers,
                                        TextSource::Sensors, TextSource::Batteries}) {
            const auto text = calls.textsInTime(source, {tree.root / "a"}).at(0);
            EXPECT_EQ(text.value_or("kept"), source != GetParam() ? "told" : "kept");
        }
    }
    // Now the child goes that could not be killed.
    EXPECT_GT(::waitpid(-1, nullptr, 0), 0);
}

INSTANTIATE_TEST_SUITE_P(eachSource, LiveSystemCallsTest,
                         testing::Values(TextSource::Processes, TextSource::NetworkDrivers,
                                         TextSource::Sensors, TextSource::Batteries));

}  // namespace
}  // namespace cimomd
