#include "script/TitleCheck.h"

#include <gtest/gtest.h>

namespace sennetctl {
namespace {

class TitleCheckTest : public testing::Test {
  protected:
    /// What is told of a script beside those that were checked before.
    std::string check(const std::string& file, const std::string& title) {
        ScriptModel model;
        model.file = file;
        model.title = {title, 2, 7};
        std::vector<Finding> findings;
        titles.check(model, texts, findings);
        std::string told;
        for (const Finding& finding : findings) {
            EXPECT_EQ(finding.file, file);
            EXPECT_EQ(finding.line, 2U);
            EXPECT_EQ(finding.column, 7U);
            told += std::string(nameOf(finding.severity)) + ": " + finding.message + "\n";
        }
        return told;
    }

    Velm::Properties texts;
    TitleCheck titles;
};

TEST_F(TitleCheckTest, TitlesThatDiffer) {
    EXPECT_EQ(check("a", "Fans"), "");
    EXPECT_EQ(check("b", "Fans of racks"), "");
    EXPECT_EQ(check("a", "Fans"), "") << "the same script";
}

TEST_F(TitleCheckTest, TwoTablesOfOneClass) {
    EXPECT_EQ(check("a", "Fans"), "");
    EXPECT_EQ(check("b", "Fans"),
              "warning: a has the title Fans, too: both tables get the same MIF class\n");
}

TEST_F(TitleCheckTest, AFaultIsToldOnceOfATitleWithoutAnother) {
    EXPECT_EQ(check("a", "Back\\slash of it"),
              "error: the title Back\\slash_of_it has a backslash, which begins an escape: the MIF "
              "file cannot be read but by CA\n");
}

// The class has the script's own title, whatever is shown.
TEST_F(TitleCheckTest, FaultsOfATitleThatIsNotShown) {
    texts.set("title.Back\\slash", "Good");
    EXPECT_EQ(check("a", "Back\\slash"),
              "error: the title Back\\slash has a backslash, which begins an escape: the MIF file "
              "cannot be read but by CA\n");
}

TEST_F(TitleCheckTest, FaultsOfATitleThatIsShown) {
    texts.set("title.Fans", "Identification");
    EXPECT_EQ(check("a", "Fans"),
              "error: the title Identification is one of Configuration Manager's own: for SMS the "
              "file would alter the machine's own record\n");
    texts.set("title.Identification", "Badge");
    EXPECT_EQ(check("b", "Identification"), "");
}

}  // namespace
}  // namespace sennetctl
