#include "report/Finding.h"

#include <gtest/gtest.h>

#include "CapturedOutput.h"

namespace sennetctl {
namespace {

const std::vector<Finding> kAllKinds = {{"a.mif", 3, 7, Severity::Error, "broken"},
                                        {"a.mif", 4, 0, Severity::Warning, "odd\x1B"},
                                        {"b.mif", 0, 0, Severity::Note, "by the way"}};

CheckResult resultOf(std::vector<Finding> findings, std::vector<std::string> files) {
    CheckResult result;
    result.findings = std::move(findings);
    result.files = std::move(files);
    return result;
}

TEST(FindingTest, TellsPlaceSeverityAndMessage) {
    CapturedOutput output;
    EXPECT_EQ(printResult(resultOf(kAllKinds, {"a.mif", "b.mif"}), output.plain()), 1);
    EXPECT_EQ(output.text(),
              "a.mif:3:7: error: broken\n"
              "a.mif:4: warning: odd \n"
              "b.mif: note: by the way\n"
              "2 files: 1 error, 1 warning\n");
}

TEST(FindingTest, NotesAreNoFindings) {
    CapturedOutput output;
    EXPECT_EQ(printResult(resultOf({kAllKinds[2]}, {"b.mif"}), output.plain()), 0);
    EXPECT_EQ(printResult({}, output.plain()), 0);
    EXPECT_EQ(printResult(resultOf({kAllKinds[1]}, {"b.mif"}), output.plain()), 1);
}

TEST(FindingTest, ColoursTheSeverity) {
    CapturedOutput output;
    printResult(resultOf({kAllKinds[0]}, {"a.mif"}), output.coloured());
    EXPECT_EQ(output.text(),
              "a.mif:3:7: \x1B[31merror\x1B[0m: broken\n1 file: 1 error, 0 warnings\n");
}

TEST(FindingTest, JsonHasTheSame) {
    CapturedOutput output;
    EXPECT_EQ(
        printResult(resultOf({kAllKinds[0], kAllKinds[2]}, {"a.mif", "b.mif"}), output.json()), 1);
    EXPECT_EQ(output.document().dump(),
              R"({"files":["a.mif","b.mif"],"findings":[{"file":"a.mif","line":3,"column":7,)"
              R"("severity":"error","message":"broken"},{"file":"b.mif","line":null,)"
              R"("column":null,"severity":"note","message":"by the way"}],"errors":1,)"
              R"("warnings":0})");
}

TEST(FindingTest, FilesThatFailedLeaveTheFindingsOfTheOthers) {
    CheckResult result = resultOf({kAllKinds[0]}, {"a.mif"});
    result.failures = {{"c.mif", 0, 0, "is not there"}, {"d\n.mif", 2, 5, "odd"}};
    CapturedOutput output;
    EXPECT_EQ(printResult(result, output.plain()), 2);
    EXPECT_EQ(output.text(), "a.mif:3:7: error: broken\n1 file: 1 error, 0 warnings\n");
    EXPECT_EQ(output.errors(),
              "sennetctl: c.mif: is not there\n"
              "sennetctl: d .mif:2:5: odd\n");
    CapturedOutput json;
    EXPECT_EQ(printResult(result, json.json()), 2);
    EXPECT_EQ(json.document()["errors"], 1);
    EXPECT_EQ(json.document()["error"].dump(), R"({"file":"c.mif","message":"is not there"})");
    EXPECT_EQ(json.document()["failures"].dump(),
              R"([{"file":"c.mif","message":"is not there"},)"
              R"({"file":"d\n.mif","line":2,"column":5,"message":"odd"}])");
    EXPECT_EQ(json.errors(), output.errors());
}

TEST(FindingTest, OfFailuresAloneThereIsNoSummary) {
    CheckResult result;
    result.failures = {{"c.mif", 0, 0, "is not there"}};
    CapturedOutput output;
    EXPECT_EQ(printResult(result, output.plain()), 2);
    EXPECT_EQ(output.text(), "");
    CapturedOutput json;
    EXPECT_EQ(printResult(result, json.json()), 2);
    EXPECT_EQ(json.document()["files"].dump(), "[]");
    EXPECT_EQ(json.document()["error"]["file"], "c.mif");
}

}  // namespace
}  // namespace sennetctl
