#include "report/Finding.h"

#include <gtest/gtest.h>

#include "CapturedOutput.h"

namespace sennetctl {
namespace {

const std::vector<Finding> kAllKinds = {{"a.mif", 3, 7, Severity::Error, "broken"},
                                        {"a.mif", 4, 0, Severity::Warning, "odd\x1B"},
                                        {"b.mif", 0, 0, Severity::Note, "by the way"}};

TEST(FindingTest, TellsPlaceSeverityAndMessage) {
    CapturedOutput output;
    EXPECT_EQ(printFindings(kAllKinds, {"a.mif", "b.mif"}, output.plain()), 1);
    EXPECT_EQ(output.text(),
              "a.mif:3:7: error: broken\n"
              "a.mif:4: warning: odd \n"
              "b.mif: note: by the way\n"
              "2 files: 1 error, 1 warning\n");
}

TEST(FindingTest, NotesAreNoFindings) {
    CapturedOutput output;
    EXPECT_EQ(printFindings({kAllKinds[2]}, {"b.mif"}, output.plain()), 0);
    EXPECT_EQ(printFindings({}, {}, output.plain()), 0);
    EXPECT_EQ(printFindings({kAllKinds[1]}, {"b.mif"}, output.plain()), 1);
}

TEST(FindingTest, ColoursTheSeverity) {
    CapturedOutput output;
    printFindings({kAllKinds[0]}, {"a.mif"}, output.coloured());
    EXPECT_EQ(output.text(),
              "a.mif:3:7: \x1B[31merror\x1B[0m: broken\n1 file: 1 error, 0 warnings\n");
}

TEST(FindingTest, JsonHasTheSame) {
    CapturedOutput output;
    EXPECT_EQ(printFindings({kAllKinds[0], kAllKinds[2]}, {"a.mif", "b.mif"}, output.json()), 1);
    EXPECT_EQ(output.document().dump(),
              R"({"files":["a.mif","b.mif"],"findings":[{"file":"a.mif","line":3,"column":7,)"
              R"("severity":"error","message":"broken"},{"file":"b.mif","line":null,)"
              R"("column":null,"severity":"note","message":"by the way"}],"errors":1,)"
              R"("warnings":0})");
}

}  // namespace
}  // namespace sennetctl
