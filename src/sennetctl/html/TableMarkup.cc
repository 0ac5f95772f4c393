#include "html/TableMarkup.h"

#include <algorithm>

#include "html/HtmlText.h"
#include "report/Text.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

class Markup {
  public:
    Markup(std::string& html, const ShownTable& table) : html(html), table(table) {}

    void append(const std::string& headingId, const std::string& origin) {
        if (!table.description.empty()) {
            appendElement("p", table.description);
        }
        if (table.rows.empty() || table.columns.empty()) {
            html += "<p class=\"note\">";
            appendCaption(origin);
            html += ".</p>\n";
        } else {
            html.append("<div class=\"scroll\">\n<table")
                .append(table.rows.size() == 1 ? " class=\"single\"" : "")
                .append(" aria-labelledby=\"")
                .append(headingId)
                .append("\">\n<caption><span>");
            appendCaption(origin);
            html += "</span></caption>\n";
            appendRows();
            html += "</table>\n</div>\n";
        }
        appendEmptyColumns();
        appendDescriptions();
        checkSize();
    }

  private:
    void checkSize() const {
        if (html.size() > kLargestPageOctets) {
            throw CannotRun("the page would be larger than " +
                            std::to_string(kLargestPageOctets >> 20) + " MiB");
        }
    }

    void appendElement(const char* name, const std::string& text) {
        html.append("<").append(name).append(">");
        appendHtml(html, text);
        html.append("</").append(name).append(">\n");
    }

    void appendCaption(const std::string& origin) {
        html += table.rows.empty() ? "No rows" : counted(table.rows.size(), "row");
        html.append(" from ").append(origin).append(", class <code>");
        appendHtml(html, table.className);
        html += "</code>";
    }

    void appendRows() {
        if (table.rows.size() == 1) {
            html += "<tbody>\n";
            for (std::size_t i = 0; i < table.columns.size(); ++i) {
                html += "<tr>";
                appendHeader("row", table.columns[i].name, false);
                appendCell(table.rows.front()[i], false);
                html += "</tr>\n";
            }
        } else {
            html += "<thead>\n<tr>";
            for (const ShownColumn& column : table.columns) {
                appendHeader("col", column.name, column.isNumber);
            }
            html += "</tr>\n</thead>\n<tbody>\n";
            for (const std::vector<std::string>& row : table.rows) {
                appendRow(row);
            }
        }
        html += "</tbody>\n";
    }

    void appendRow(const std::vector<std::string>& row) {
        html += "<tr>";
        for (std::size_t i = 0; i < row.size(); ++i) {
            appendCell(row[i], table.columns[i].isNumber);
        }
        html += "</tr>\n";
        checkSize();
    }

    void appendHeader(const char* scope, const std::string& name, bool isNumber) {
        html.append("<th scope=\"").append(scope).append("\"");
        html += isNumber ? " class=\"number\">" : ">";
        appendHtml(html, name);
        html += "</th>";
    }

    void appendCell(const std::string& value, bool isNumber) {
        html += isNumber ? "<td class=\"number\">" : "<td>";
        appendHtmlValue(html, value);
        html += "</td>";
    }

    void appendEmptyColumns() {
        if (table.emptyColumns.empty()) {
            return;
        }
        html += "<p class=\"note\">Without a value: ";
        const char* separator = "";
        for (const std::string& name : table.emptyColumns) {
            html += separator;
            appendHtml(html, name);
            separator = ", ";
        }
        html += ".</p>\n";
    }

    void appendDescriptions() {
        const bool any =
            std::any_of(table.columns.begin(), table.columns.end(),
                        [](const ShownColumn& column) { return !column.description.empty(); });
        if (!any) {
            return;
        }
        html += "<details>\n<summary>What the columns mean</summary>\n<dl>\n";
        for (const ShownColumn& column : table.columns) {
            if (!column.description.empty()) {
                appendElement("dt", column.name);
                appendElement("dd", column.description);
            }
        }
        html += "</dl>\n</details>\n";
    }

    std::string& html;
    const ShownTable& table;
};

}  // namespace

void appendTable(std::string& html, const ShownTable& table, const std::string& headingId,
                 const std::string& origin) {
    Markup(html, table).append(headingId, origin);
}

}  // namespace sennetctl
