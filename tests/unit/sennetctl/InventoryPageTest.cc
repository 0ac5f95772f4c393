#include "html/InventoryPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "MifTexts.h"
#include "html/TableMarkup.h"
#include "report/WholeFile.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

using ::testing::HasSubstr;
using ::testing::Not;

// 2026-11-21 10:05:59 UTC.
constexpr std::time_t kMorning = 1795255559;

class InventoryPageTest : public testing::Test {
  protected:
    void add(const std::string& name, const std::string& mif) {
        page.add(name, kMorning, readMifFile(directory.write("file", mif)));
    }
    std::string between(const std::string& begin, const std::string& end) const {
        const std::string text = page.text();
        const std::size_t from = text.find(begin);
        const std::size_t to = text.find(end, from);
        EXPECT_NE(to, std::string::npos) << text;
        return text.substr(from, to - from);
    }

    support::TempDirectory directory;
    InventoryPage page{"Machine <1>"};
};

TEST_F(InventoryPageTest, APage) {
    add("fans.mif",
        kMifStart + tableMif(2, "Fan", "{ 2, \"b\", 900 }\n{ 1, \"a\", 1200 }\n") + kMifEnd);
    add("system.mif", kMifStart +
                          groupMif(1, "System", "Own|System|001",
                                   attributeMif(1, "Name", "String(9)", "\"web<1>\"") +
                                       attributeMif(2, "Serial", "String(9)", "\"\"")) +
                          kMifEnd);
    EXPECT_EQ(between("<body>", "<script>"), R"(<body>
<a class="skip" href="#tables">Skip to the tables</a>
<header>
<h1>Machine &lt;1&gt;</h1>
<p>2 tables from 2 files with 3 rows</p>
<div class="search" role="search" hidden>
<label for="search">Search all tables</label>
<input type="search" id="search" autocomplete="off" spellcheck="false">
<p role="status" id="found"></p>
</div>
</header>
<nav aria-label="Tables">
<ul>
<li><a href="#table-1">Fan <span class="count">2</span></a></li>
<li><a href="#table-2">System <span class="count">1</span></a></li>
</ul>
</nav>
<main id="tables">
<section class="table">
<h2 id="table-1">Fan</h2>
<div class="scroll">
<table aria-labelledby="table-1">
<caption><span>2 rows from <b>fans.mif</b> of <time datetime="2026-11-21 10:05Z">2026-11-21 10:05 UTC</time>, component Machine, class <code>Own|Fan|001</code></span></caption>
<thead>
<tr><th scope="col">Device</th><th scope="col" class="number">Speed</th></tr>
</thead>
<tbody>
<tr><td>a</td><td class="number">1200</td></tr>
<tr><td>b</td><td class="number">900</td></tr>
</tbody>
</table>
</div>
</section>
<section class="table">
<h2 id="table-2">System</h2>
<div class="scroll">
<table class="single" aria-labelledby="table-2">
<caption><span>1 row from <b>system.mif</b> of <time datetime="2026-11-21 10:05Z">2026-11-21 10:05 UTC</time>, component Machine, class <code>Own|System|001</code></span></caption>
<tbody>
<tr><th scope="row">Name</th><td>web&lt;1&gt;</td></tr>
</tbody>
</table>
</div>
<p class="note">Without a value: Serial.</p>
</section>
</main>
<footer>
<p>Made by sennetctl from MIF files. Columns without any value and row numbers are left out.</p>
</footer>
)");
    EXPECT_EQ(page.files(), 2U);
    EXPECT_EQ(page.tables(), 2U);
    EXPECT_EQ(page.rows(), 3U);
}

TEST_F(InventoryPageTest, TheHeadAllowsOnlyThePagesOwnScriptAndStyle) {
    const std::string head = between("<!DOCTYPE html>", "<style>");
    EXPECT_THAT(head, HasSubstr("<html lang=\"en\">"));
    EXPECT_THAT(head, HasSubstr("<meta charset=\"utf-8\">"));
    EXPECT_THAT(head, HasSubstr("<title>Machine &lt;1&gt;</title>"));
    EXPECT_THAT(head, HasSubstr("http-equiv=\"Content-Security-Policy\" content=\"default-src "
                                "'none'; style-src 'sha256-"));
    EXPECT_THAT(head, HasSubstr("; script-src 'sha256-"));
    EXPECT_THAT(head, Not(HasSubstr("unsafe")));
    EXPECT_THAT(page.text(), Not(HasSubstr("http://")));
    EXPECT_THAT(page.text(), Not(HasSubstr("https://")));
}

TEST_F(InventoryPageTest, AFileWithSeveralTablesHasAHeadingOfItsOwn) {
    add("kwvinv.mif",
        kMifStart + tableMif(2, "Fan", "{ 1, \"a\", 1 }\n") + tableMif(3, "Disk", "") + kMifEnd);
    EXPECT_THAT(page.text(), HasSubstr("<li><a href=\"#file-1\">kwvinv.mif <span class=\"count\">2 "
                                       "tables</span></a>\n<ul>\n<li><a href=\"#table-1\">Fan "));
    EXPECT_THAT(page.text(), HasSubstr("<section class=\"part\">\n"
                                       "<h2 id=\"file-1\">kwvinv.mif</h2>\n"));
    EXPECT_THAT(page.text(), HasSubstr("<h3 id=\"table-1\">Fan</h3>\n"));
    EXPECT_THAT(page.text(), HasSubstr("<h3 id=\"table-2\">Disk</h3>\n<p class=\"note\">No rows "
                                       "from <b>kwvinv.mif</b>"));
}

TEST_F(InventoryPageTest, AFileWithoutTablesSaysSo) {
    add("none.mif", kMifStart + kMifEnd);
    EXPECT_THAT(page.text(), HasSubstr("<p class=\"note\">No tables in <b>none.mif</b> of "));
    EXPECT_THAT(page.text(), HasSubstr("<p>0 tables from 1 file with 0 rows</p>"));
}

TEST_F(InventoryPageTest, WhatHasNoNameGetsAWord) {
    add("odd.mif", kMifStart +
                       "Start Group Name = \"\" Class = \"Own|Odd|001\" Id = 2\n"
                       "Start Attribute Name = \" \" Id = 1 Type = Integer Value = 2\n"
                       "End Attribute\nEnd Group\n" +
                       kMifEnd);
    EXPECT_THAT(page.text(), HasSubstr("<a href=\"#table-1\">(without a name) <span"));
    EXPECT_THAT(page.text(), HasSubstr("<h2 id=\"table-1\">(without a name)</h2>"));
    EXPECT_THAT(page.text(), HasSubstr("<th scope=\"row\">(without a name)</th>"));
}

TEST_F(InventoryPageTest, DescriptionsAndNamesOfValues) {
    add("fans.mif", kMifStart +
                        "Start Group Name = \"Fan\" Class = \"Own|Fan|001\" Id = 2\n"
                        "Description = \"All that blows & \xFC\"\n"
                        "Start Attribute Name = \"State\" Id = 1 Type = Integer Value = 2\n"
                        "Description = \"Whether it turns\"\n"
                        "Start Enum 2 = \"Turning <fast>\" End Enum End Attribute\nEnd Group\n" +
                        kMifEnd);
    EXPECT_THAT(page.text(), HasSubstr("<p>All that blows &amp; \xC3\xBC</p>\n<div"));
    EXPECT_THAT(page.text(),
                HasSubstr("<tr><th scope=\"row\">State</th><td>Turning &lt;fast&gt;</td></tr>"));
    EXPECT_THAT(page.text(), HasSubstr("<details>\n<summary>What the columns mean</summary>\n<dl>\n"
                                       "<dt>State</dt>\n<dd>Whether it turns</dd>\n</dl>\n"));
}

TEST_F(InventoryPageTest, NoTextOfAFileBecomesMarkup) {
    const std::string evil = "\\\"'><script>evil()</script><img src=x onerror=evil()>";
    const std::string name = "\"" + evil + "\"";
    const auto hostile = [&](int id) {
        return "Start Group Name = " + name + " Class = " + name + " Id = " + std::to_string(id) +
               " Key = 1 Description = " + name + " Start Attribute Name = " + name +
               " Id = 1 Type = String(99) Description = " + name + " Value = " + name +
               " End Attribute Start Attribute Name = \"</table>\" Id = 2 Type = String(9) "
               "Value = \"\" End Attribute End Group\n";
    };
    const std::string text =
        "Start Component Name = " + name + "\n" + hostile(1) + hostile(2) + kMifEnd;
    add("</nav><script>evil()", text);
    const std::string body = between("<body>", "<script>\"use strict\"");
    EXPECT_THAT(body, Not(HasSubstr("<script")));
    EXPECT_THAT(body, Not(HasSubstr("<img")));
    EXPECT_THAT(body, Not(HasSubstr("'>")));
    EXPECT_THAT(body, Not(HasSubstr("</nav><script")));
    EXPECT_THAT(body, HasSubstr("<th scope=\"col\">&quot;&#39;&gt;&lt;script&gt;evil()"));
    EXPECT_THAT(body, HasSubstr("Without a value: &lt;/table&gt;."));
}

TEST_F(InventoryPageTest, APageThatNoBrowserTakesIsRefused) {
    const ShownTable rows{"T", "c", {}, {{"A", {}, false}}, {{"a"}, {"b"}}, {}};
    const ShownTable oneRow{"T", "c", {}, {{"A", {}, false}}, {{"a"}}, {}};
    const ShownTable nothing{"T", "c", {}, {}, {}, {}};
    std::string html(kLargestPageOctets, ' ');
    for (const ShownTable& table : {rows, oneRow, nothing}) {
        EXPECT_THROW(appendTable(html, table, "t", "f"), CannotRun);
        html.resize(kLargestPageOctets);
    }
    html.clear();
    EXPECT_NO_THROW(appendTable(html, rows, "t", "f"));
}

}  // namespace
}  // namespace sennetctl
