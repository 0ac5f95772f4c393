// Runs that do not come to their end: what was printed shows at once, and files of earlier runs
// stay whole.

#include <gtest/gtest.h>

#include <chrono>
#include <string>
#include <thread>
#include <vector>

#include "integration/sennet/BackgroundProgram.h"
#include "integration/sennet/CimXml.h"
#include "integration/sennet/MifFileFixture.h"
#include "support/Files.h"

namespace {

using namespace std::chrono_literals;
using support::Reply;
using Names = std::vector<std::string>;

class KilledRunTest : public MifFileFixture {
  protected:
    KilledRunTest() {
        for (const char* name : {"a", "b", "c"}) {
            setup.addScript(std::string(name) + ".script.inv",
                            "[CIM]\nG[0]=CIM_" + std::string(name) + "\nA[0]=Name\n");
            server.onGetClass("CIM_" + std::string(name),
                              Reply::ok(namedClass("CIM_" + std::string(name))));
            server.onEnumerateInstances(
                "CIM_" + std::string(name),
                Reply::ok(namedInstances("CIM_" + std::string(name), {"new"})));
        }
    }

    void leaveFilesOfAnEarlierRun() {
        for (const char* name : {"a.mif", "b.mif", "c.mif", "kwvinv.mif"}) {
            leaveMifFile(name, "earlier, whole");
        }
    }

    /// What an importer would see: hidden names are none of its business.
    Names visibleNames() const {
        Names names;
        for (const std::string& name : setup.mifNames()) {
            if (name.front() != '.') {
                names.push_back(name);
            }
        }
        return names;
    }

    std::string file(const char* name) const { return support::readFile(setup.mifFile(name)); }
};

TEST_F(KilledRunTest, ShowsEachLineThroughAPipeAtOnce) {
    server.onGetClass("CIM_c", Reply::silence());
    BackgroundProgram program = start("/SMS");
    const std::string expected = setup.start() + "Processing a...\nProcessing b...\n";
    EXPECT_EQ(program.readUntil(expected, 20s), expected);
}

TEST_F(KilledRunTest, LeavesFilesWholeWhenKilledWhileTheServerIsSilent) {
    leaveFilesOfAnEarlierRun();
    server.onEnumerateInstances("CIM_c", Reply::silence());
    {
        BackgroundProgram program = start("/SMS");
        const std::string expected = setup.start() + "Processing a...\nProcessing b...\n";
        ASSERT_EQ(program.readUntil(expected, 20s), expected);
        program.kill();
    }
    EXPECT_EQ(visibleNames(), (Names{"a.mif", "b.mif", "c.mif", "kwvinv.mif"}));
    // The converter of a script is closed when the next script is written.
    EXPECT_EQ(file("a.mif"), namedMif("a", "new"));
    EXPECT_EQ(file("b.mif"), "earlier, whole");
    EXPECT_EQ(file("c.mif"), "earlier, whole");
}

TEST_F(KilledRunTest, KeepsTheCombinedFileOfAnEarlierRun) {
    leaveFilesOfAnEarlierRun();
    server.onGetClass("CIM_c", Reply::silence());
    {
        BackgroundProgram program = start("/CA");
        const std::string expected = setup.start() + "Processing a...\nProcessing b...\n";
        ASSERT_EQ(program.readUntil(expected, 20s), expected);
        program.kill();
    }
    EXPECT_EQ(file("kwvinv.mif"), "earlier, whole");
}

TEST_F(KilledRunTest, ShowsNoHalfFileWhenThereWasNone) {
    server.onGetClass("CIM_b", Reply::silence());
    {
        BackgroundProgram program = start("/SMS");
        const std::string expected = setup.start() + "Processing a...\n";
        ASSERT_EQ(program.readUntil(expected, 20s), expected);
        program.kill();
    }
    EXPECT_EQ(visibleNames(), Names{});
}

TEST_F(KilledRunTest, LeavesFilesWholeWhenKilledAtAnyMoment) {
    const Names all = {"a.mif", "b.mif", "c.mif", "kwvinv.mif"};
    for (int moment = 0; moment < 60; ++moment) {
        leaveFilesOfAnEarlierRun();
        {
            BackgroundProgram program = start("/SMS");
            std::this_thread::sleep_for(moment * 700us);
            program.kill();
        }
        expectReadableFiles();
        ASSERT_EQ(visibleNames(), all) << moment;
        for (const char* name : {"a", "b", "c"}) {
            const std::string bytes = support::readFile(setup.mifFile(name + std::string(".mif")));
            ASSERT_TRUE(bytes == "earlier, whole" || bytes == namedMif(name, "new"))
                << "killed after " << moment * 700 << " microseconds, " << name << ".mif holds\n"
                << bytes;
        }
    }
}

}  // namespace
