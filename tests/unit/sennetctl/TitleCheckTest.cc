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

TEST_F(TitleCheckTest, TwoTablesOfOneName) {
    EXPECT_EQ(check("a", "A B"), "");
    EXPECT_EQ(check("b", "A_B"),
              "warning: a has the title A_B, too: for QVE both are one SQL table and view\n");
    texts.set("title.First", "Same");
    texts.set("title.Second", "Same");
    EXPECT_EQ(check("c", "First"), "");
    EXPECT_EQ(check("d", "Second"),
              "warning: c has the title Same, too: for QVE both are one SQL table and view\n");
}

TEST_F(TitleCheckTest, TwoTablesWhoseNamesDifferInCase) {
    EXPECT_EQ(check("a", "Up"), "");
    EXPECT_EQ(check("b", "uP"),
              "warning: a has the title Up: for QVE both are one SQL table in databases that "
              "ignore case\n");
    EXPECT_EQ(check("c", "Down"), "");
    EXPECT_EQ(check("d", "Up"),
              "warning: a has the title Up, too: both tables get the same MIF class\n");
}

// Its name is the shown one, and the query has the script's own as a text.
TEST_F(TitleCheckTest, TitlesInTheScriptsOfQve) {
    texts.set("title.x$(id);y", "Good");
    EXPECT_EQ(check("a", "x$(id);y"),
              "error: the title x$(id);y has a '$' or a backquote: the shell replaces it in QVE's "
              "query script, or runs it\n");
    EXPECT_EQ(check("b", "Wi-Fi"),
              "warning: the title Wi-Fi has characters besides letters, digits and blanks: "
              "databases or shells refuse it in QVE's scripts, where it has no quotes\n");
    texts.set("title.Wi-Fi", "Wireless");
    EXPECT_EQ(check("c", "Wi-Fi"),
              "warning: b has the title Wi-Fi, too: both tables get the same "
              "MIF class\n");
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
