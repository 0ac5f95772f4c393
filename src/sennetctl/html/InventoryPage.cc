#include "html/InventoryPage.h"

#include <fmt/format.h>

#include "html/HtmlText.h"
#include "html/PageAssets.h"
#include "html/ShownTable.h"
#include "html/TableMarkup.h"
#include "report/Text.h"

namespace sennetctl {

namespace {

std::string html(std::string_view text) {
    std::string escaped;
    appendHtml(escaped, text);
    return escaped;
}

/// Empty for a moment beyond the calendar.
std::string timeMarkup(std::time_t moment) {
    tm parts = {};
    char text[64];
    if (::gmtime_r(&moment, &parts) == nullptr ||
        std::strftime(text, sizeof text, "%Y-%m-%d %H:%M", &parts) == 0) {
        return {};
    }
    return fmt::format(" of <time datetime=\"{0}Z\">{0} UTC</time>", text);
}

constexpr const char* kPartEnd = "</section>\n";
constexpr const char* kPartLinksEnd = "</ul>\n</li>\n";

// Without a name of its own: each would be a landmark, and those of two machines alike.
std::string beginSection(const char* kind, const std::string& id, const std::string& name,
                         int level) {
    return fmt::format("<section class=\"{0}\">\n<h{1} id=\"{2}\">{3}</h{1}>\n", kind, level, id,
                       html(name));
}

std::string link(const std::string& target, const std::string& name, const std::string& count) {
    const std::string shownCount =
        count.empty() ? std::string() : fmt::format(" <span class=\"count\">{}</span>", count);
    return fmt::format("<a href=\"#{}\">{}{}</a>", target, html(name), shownCount);
}

}  // namespace

void InventoryPage::beginGroup(const std::string& name) {
    if (groupCount > 0) {
        links += kPartLinksEnd;
        sections += kPartEnd;
    }
    ++groupCount;
    beginPart(fmt::format("group-{}", groupCount), name, {}, 2);
}

void InventoryPage::add(const std::string& file, std::time_t modified, const MifContent& content) {
    ++fileCount;
    const std::string origin = fmt::format("<b>{}</b>{}, component {}", html(file),
                                           timeMarkup(modified), html(content.component));
    const int level = groupCount > 0 ? 3 : 2;
    if (content.tables.size() == 1) {
        addTable(content.tables.front(), origin, level);
        return;
    }
    beginPart(fmt::format("file-{}", fileCount), file, counted(content.tables.size(), "table"),
              level);
    if (content.tables.empty()) {
        sections += fmt::format("<p class=\"note\">No tables in {}.</p>\n", origin);
    }
    for (const MifTable& table : content.tables) {
        addTable(table, origin, level + 1);
    }
    links += kPartLinksEnd;
    sections += kPartEnd;
}

void InventoryPage::beginPart(const std::string& id, const std::string& name,
                              const std::string& count, int level) {
    links += "<li>" + link(id, name, count) + "\n<ul>\n";
    sections += beginSection("part", id, name, level);
}

void InventoryPage::addMissing(const Failure& failure) {
    missing += "<li>" + html(textOf(failure)) + "</li>\n";
}

void InventoryPage::addTable(const MifTable& table, const std::string& origin, int level) {
    ++tableCount;
    rowCount += table.rows.size();
    const std::string id = fmt::format("table-{}", tableCount);
    const ShownTable shown = shownTable(table);
    links += "<li>" + link(id, shown.name, std::to_string(table.rows.size())) + "</li>\n";
    sections += beginSection("table", id, shown.name, level);
    appendTable(sections, shown, id, origin);
    sections += "</section>\n";
}

std::string InventoryPage::text() const {
    std::string page = fmt::format(
        "<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n"
        "<meta http-equiv=\"Content-Security-Policy\" content=\"default-src 'none'; "
        "style-src 'sha256-{}'; script-src 'sha256-{}'; base-uri 'none'; form-action 'none'\">\n"
        "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
        "<meta name=\"color-scheme\" content=\"light dark\">\n<title>{}</title>\n",
        kPageStyleSha256, kPageScriptSha256, html(title));
    page.append("<style>").append(kPageStyle).append("</style>\n</head>\n<body>\n");
    page += fmt::format(
        "<a class=\"skip\" href=\"#tables\">Skip to the tables</a>\n<header>\n<h1>{}</h1>\n"
        "<p>{} from {} with {}</p>\n"
        "<div class=\"search\" role=\"search\" hidden>\n"
        "<label for=\"search\">Search all tables</label>\n"
        "<input type=\"search\" id=\"search\" autocomplete=\"off\" spellcheck=\"false\">\n"
        "<p role=\"status\" id=\"found\"></p>\n</div>\n</header>\n",
        html(title), counted(tableCount, "table"), counted(fileCount, "file"),
        counted(rowCount, "row"));
    page.append("<nav aria-label=\"Tables\">\n<ul>\n").append(links);
    page.append(groupCount > 0 ? kPartLinksEnd : "").append("</ul>\n</nav>\n");
    page.append("<main id=\"tables\">\n");
    if (!missing.empty()) {
        page.append(
                "<section aria-labelledby=\"missing\">\n<h2 id=\"missing\">Not shown</h2>\n<ul>\n")
            .append(missing)
            .append("</ul>\n</section>\n");
    }
    page.append(sections).append(groupCount > 0 ? kPartEnd : "").append("</main>\n");
    page.append(
        "<footer>\n<p>Made by sennetctl from MIF files. Columns without any value and "
        "row numbers are left out.</p>\n</footer>\n");
    page.append("<script>").append(kPageScript).append("</script>\n</body>\n</html>\n");
    return page;
}

}  // namespace sennetctl
