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

TEST_F(HtmlCommandTest, FilesOfOneNameAreToldApartByTheirPlaces) {
    std::filesystem::create_directory(directory.path("a"));
    std::filesystem::create_directory(directory.path("b"));
    const std::string one = fans("a/fan.mif");
    const std::string two = fans("b/fan.mif");
    writeHtmlPage(options({one, two}), output.plain());
    const std::string text = readWholeFile(page());
    EXPECT_THAT(text, HasSubstr("<b>" + one + "</b>"));
    EXPECT_THAT(text, HasSubstr("<b>" + two + "</b>"));
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

TEST_F(HtmlCommandTest, NothingIsWrittenWhenAFileCannotBeRead) {
    const std::string good = fans("good.mif");
    const std::string broken = directory.write("broken.mif", "Start Component\nName = 7\n");
    EXPECT_EQ(refusal(options({good, broken})), broken + ":2:8: expected a literal, found 7");
    EXPECT_EQ(refusal(options({good, directory.path("none")})),
              directory.path("none") + ": there is no such file");
    EXPECT_FALSE(std::filesystem::exists(directory.path("web")));
}

TEST_F(HtmlCommandTest, ADirectoryThatCannotBeMade) {
    const std::string one = fans("one.mif");
    HtmlOptions wrong = options({one});
    wrong.directory = one;
    EXPECT_EQ(refusal(wrong), one + ": cannot be made");
    std::filesystem::create_directories(page());
    HtmlOptions blocked = options({one});
    blocked.replace = true;
    EXPECT_EQ(refusal(blocked), page() + ": cannot be written");
}

}  // namespace
}  // namespace sennetctl
