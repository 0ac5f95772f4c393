#include "html/HtmlCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

#include "CapturedOutput.h"
#include "MifTexts.h"
#include "report/WholeFile.h"
#include "support/Files.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::HasSubstr;
using ::testing::Not;

class HtmlCommandTest : public testing::Test {
  protected:
    std::string fans(const std::string& name, const std::string& device = "a") const {
        return directory.write(
            name, kMifStart + tableMif(2, "Fan", "{ 1, \"" + device + "\", 3 }\n") + kMifEnd);
    }
    HtmlOptions options(const std::vector<std::string>& files) const {
        HtmlOptions options;
        options.files = files;
        options.directory = directory.path("web/page");
        return options;
    }
    std::string page() const { return directory.path("web/page/inventory.html"); }
    std::string refusal(const HtmlOptions& options) {
        try {
            writeHtmlPage(options, output.plain());
        } catch (const CannotRun& failure) {
            return failure.what();
        }
        return "none";
    }

    support::TempDirectory directory;
    CapturedOutput output;
};

TEST_F(HtmlCommandTest, WritesThePageAndTellsWhat) {
    const std::string one = fans("one.mif");
    EXPECT_EQ(writeHtmlPage(options({one}), output.plain()), 0);
    EXPECT_EQ(output.text(), "Written: " + page() + ", 1 table from 1 file with 1 row\n");
    const std::string text = readWholeFile(page());
    EXPECT_THAT(text, HasSubstr("<title>Inventory</title>"));
    EXPECT_THAT(text, HasSubstr("1 row from <b>one.mif</b> of <time datetime=\"20"));
}

TEST_F(HtmlCommandTest, TellsInJson) {
    const std::string one = fans("one.mif");
    EXPECT_EQ(writeHtmlPage(options({one}), output.json()), 0);
    EXPECT_EQ(output.document().dump(),
              "{\"page\":\"" + page() + "\",\"files\":[\"" + one + "\"],\"tables\":1,\"rows\":1}");
}

// Several machines' files are collected into a directory for each.
TEST_F(HtmlCommandTest, FilesOfSeveralDirectoriesStandBelowTheNamesOfThese) {
    for (const char* machine : {"a", "b", "c"}) {
        std::filesystem::create_directory(directory.path(machine));
    }
    const std::vector<std::string> files = {fans("a/fan.mif"), fans("b/fan.mif"),
                                            directory.path("c/missing.mif"), fans("a/more.mif")};
    EXPECT_EQ(writeHtmlPage(options(files), output.plain()), 2);
    const std::string text = readWholeFile(page());
    EXPECT_THAT(text,
                HasSubstr("<li><a href=\"#group-1\">" + directory.path("a") +
                          "</a>\n<ul>\n<li><a href=\"#table-1\">Fan "
                          "<span class=\"count\">1</span></a></li>\n"
                          "<li><a href=\"#table-2\">Fan "
                          "<span class=\"count\">1</span></a></li>\n</ul>\n</li>\n"
                          "<li><a href=\"#group-2\">" +
                          directory.path("b") +
                          "</a>\n<ul>\n<li><a href=\"#table-3\">Fan "
                          "<span class=\"count\">1</span></a></li>\n</ul>\n</li>\n</ul>\n</nav>"));
    EXPECT_THAT(text, HasSubstr("<section class=\"part\">\n"
                                "<h2 id=\"group-2\">" +
                                directory.path("b") + "</h2>\n<section class=\"table\""));
    EXPECT_THAT(text, HasSubstr("<h3 id=\"table-3\">Fan</h3>"));
    EXPECT_THAT(text, HasSubstr("</section>\n</section>\n</main>"));
    EXPECT_THAT(text, Not(HasSubstr("group-3")));
    EXPECT_THAT(text, HasSubstr("<li>" + directory.path("c/missing.mif") + ": "));
}

TEST_F(HtmlCommandTest, AnEarlierPageIsReplacedOnlyOnDemand) {
    HtmlOptions second = options({fans("two.mif", "second")});
    writeHtmlPage(options({fans("one.mif", "first")}), output.plain());
    EXPECT_EQ(refusal(second), page() + ": exists already");
    EXPECT_THAT(readWholeFile(page()), HasSubstr("<td>first</td>"));
    second.replace = true;
    EXPECT_EQ(refusal(second), "none");
    EXPECT_THAT(readWholeFile(page()), HasSubstr("<td>second</td>"));
}

TEST_F(HtmlCommandTest, ThePageLacksWhatCannotBeReadAndSaysSo) {
    const std::string good = fans("good.mif");
    const std::string broken = directory.write("<broken>.mif", "Start Component\nName = 7\n");
    const std::string none = directory.path("none");
    EXPECT_EQ(writeHtmlPage(options({broken, good, none}), output.plain()), 2);
    EXPECT_EQ(output.errors(), "sennetctl: " + broken +
                                   ":2:8: expected a literal, found 7\n"
                                   "sennetctl: " +
                                   none + ": there is no such file\n");
    EXPECT_EQ(output.text(), "Written: " + page() + ", 1 table from 1 file with 1 row\n");
    const std::string text = readWholeFile(page());
    EXPECT_THAT(text, HasSubstr("1 row from <b>good.mif</b>"));
    EXPECT_THAT(text, HasSubstr("<h2 id=\"missing\">Not shown</h2>\n<ul>\n"
                                "<li>&lt;broken&gt;.mif:2:8: expected a literal, found 7</li>\n"
                                "<li>none: there is no such file</li>\n</ul>"));
}

TEST_F(HtmlCommandTest, JsonTellsWhatIsNotOnThePage) {
    const std::string good = fans("good.mif");
    const std::string broken = directory.write("broken.mif", "Start Component\nName = 7\n");
    EXPECT_EQ(writeHtmlPage(options({good, broken}), output.json()), 2);
    EXPECT_EQ(output.document()["files"].dump(), "[\"" + good + "\"]");
    EXPECT_EQ(output.document()["error"].dump(),
              "{\"file\":\"" + broken +
                  R"(","line":2,"column":8,"message":"expected a literal, found 7"})");
    EXPECT_EQ(output.document()["failures"].size(), 1U);
}

TEST_F(HtmlCommandTest, NoPageIsMadeOfFilesThatCannotBeRead) {
    EXPECT_EQ(writeHtmlPage(options({directory.path("none")}), output.plain()), 2);
    EXPECT_EQ(output.text(), "");
    EXPECT_FALSE(std::filesystem::exists(directory.path("web")));
    CapturedOutput json;
    EXPECT_EQ(writeHtmlPage(options({directory.path("none")}), json.json()), 2);
    EXPECT_EQ(json.document()["page"], nullptr);
    EXPECT_EQ(json.document()["error"]["message"], "there is no such file");
}

TEST_F(HtmlCommandTest, APageOfAllFilesMissesNothing) {
    writeHtmlPage(options({fans("one.mif")}), output.plain());
    EXPECT_EQ(readWholeFile(page()).find("Not shown"), std::string::npos);
}

TEST_F(HtmlCommandTest, ADirectoryThatCannotBeMade) {
    const std::string one = fans("one.mif");
    HtmlOptions wrong = options({one});
    wrong.directory = one;
    EXPECT_EQ(refusal(wrong), one + ": Not a directory");
    std::filesystem::create_directories(page());
    HtmlOptions blocked = options({one});
    blocked.replace = true;
    EXPECT_EQ(refusal(blocked), page() + ": Is a directory");
}

}  // namespace
}  // namespace sennetctl
