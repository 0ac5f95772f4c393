#include "mif/MifCommands.h"

#include <cstdint>
#include <ostream>

#include "mif/MifDifference.h"
#include "mif/MifTables.h"
#include "report/Json.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/TextTable.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

Json jsonOf(const Mif::Value& value) {
    if (value.kind == Mif::Value::Kind::Integer) {
        constexpr std::uint64_t kLowest = std::uint64_t(1) << 63;
        if (!value.negative) {
            return value.magnitude;
        }
        return value.magnitude <= kLowest ? Json(static_cast<std::int64_t>(0 - value.magnitude))
                                          : Json(shownValue(value));
    }
    return value.kind == Mif::Value::Kind::Text ? Json(fromLatin1(value.text)) : Json(nullptr);
}

Json jsonOf(const MifTable& table) {
    Json one = Json::object();
    one["name"] = table.name;
    one["class"] = table.className;
    one["attributes"] = Json::array();
    for (const MifColumn& column : table.columns) {
        Json attribute = Json::object();
        attribute["name"] = column.name;
        attribute["type"] = shownType(column.type);
        attribute["key"] = column.isKey;
        one["attributes"].push_back(std::move(attribute));
    }
    one["rows"] = Json::array();
    for (const std::vector<Mif::Value>& values : table.rows) {
        // No two columns are alike, and to look for the name among the earlier members takes long.
        Json row = Json::object();
        auto& members = row.get_ref<Json::object_t&>();
        members.reserve(values.size());
        for (std::size_t i = 0; i < values.size(); ++i) {
            members.emplace_back(table.columns[i].name, jsonOf(values[i]));
        }
        one["rows"].push_back(std::move(row));
    }
    return one;
}

void printTable(const MifTable& table, const Output& output) {
    output.out << '\n'
               << printable(table.name) << " (" << printable(table.className) << ", "
               << counted(table.rows.size(), "row") << ")\n";
    std::vector<std::string> titles;
    titles.reserve(table.columns.size());
    for (const MifColumn& column : table.columns) {
        titles.push_back(column.name);
    }
    TextTable shown(titles, TextTable::Cells::Fitting);
    for (const std::vector<Mif::Value>& values : table.rows) {
        std::vector<std::string> cells;
        cells.reserve(values.size());
        for (std::size_t i = 0; i < values.size(); ++i) {
            cells.push_back(shownValue(values[i], table.columns[i]));
        }
        shown.addRow(std::move(cells));
    }
    shown.print(output);
}

const char* signOf(MifChange::Kind kind) {
    switch (kind) {
        case MifChange::Kind::Added:
            return "+";
        case MifChange::Kind::Removed:
            return "-";
        case MifChange::Kind::Changed:
            break;
    }
    return "~";
}

const char* nameOf(MifChange::Kind kind) {
    switch (kind) {
        case MifChange::Kind::Added:
            return "added";
        case MifChange::Kind::Removed:
            return "removed";
        case MifChange::Kind::Changed:
            break;
    }
    return "changed";
}

std::string descriptionOf(const MifChange& change) {
    const bool changed = change.kind == MifChange::Kind::Changed;
    std::string what = change.row;
    if (change.row.empty() && !change.attribute.empty()) {
        what = "attribute " + change.attribute;
    } else if (change.row.empty()) {
        what = changed ? "name" : "table";
    } else if (changed) {
        what += ": " + change.attribute;
    }
    return changed ? what + ": '" + change.before + "' is now '" + change.after + "'" : what;
}

void printChanges(const std::vector<MifChange>& changes, const Output& output) {
    const std::string* table = nullptr;
    for (const MifChange& change : changes) {
        if (table == nullptr || *table != change.table) {
            output.out << (change.table.empty() ? "Component" : printable(change.table)) << '\n';
            table = &change.table;
        }
        output.out << "  " << signOf(change.kind) << ' ' << printable(descriptionOf(change))
                   << '\n';
    }
    output.out << counted(changes.size(), "difference") << '\n';
}

Json jsonOf(const MifChange& change) {
    const auto textOrNull = [](const std::string& text) {
        return text.empty() ? Json(nullptr) : Json(text);
    };
    Json one = Json::object();
    one["table"] = textOrNull(change.table);
    one["change"] = nameOf(change.kind);
    one["row"] = textOrNull(change.row);
    one["attribute"] = textOrNull(change.attribute);
    if (change.kind == MifChange::Kind::Changed) {
        one["old"] = change.before;
        one["new"] = change.after;
    }
    return one;
}

void checkMifFile(const std::string& file, MifLint& lint, CheckResult& result) {
    try {
        const std::vector<Finding> found = lint.check(file, readWholeFile(file));
        result.files.push_back(file);
        result.findings.insert(result.findings.end(), found.begin(), found.end());
    } catch (const CannotRun& cause) {
        result.failures.push_back(cause.failure());
    }
}

}  // namespace

int checkMifFiles(const std::vector<std::string>& files, const LintOptions& options,
                  const Output& output) {
    MifLint lint(options);
    CheckResult result;
    {
        const Progress progress(output);
        for (const std::string& file : files) {
            progress.show("checking " + file);
            checkMifFile(file, lint, result);
        }
    }
    return printResult(result, output);
}

int showMifFile(const std::string& file, const Output& output) {
    const MifContent content = readMifFile(file);
    if (output.json) {
        Json document = Json::object();
        document["component"] = content.component;
        document["tables"] = Json::array();
        for (const MifTable& table : content.tables) {
            document["tables"].push_back(jsonOf(table));
        }
        printJson(document, output);
        return kFine;
    }
    output.out << "Component " << printable(content.component) << '\n';
    for (const MifTable& table : content.tables) {
        printTable(table, output);
    }
    return kFine;
}

int compareMifFiles(const std::string& oldFile, const std::string& newFile, const Output& output) {
    const std::vector<MifChange> changes =
        differencesOf(readMifFile(oldFile), readMifFile(newFile));
    if (output.json) {
        Json document = Json::object();
        document["changes"] = Json::array();
        for (const MifChange& change : changes) {
            document["changes"].push_back(jsonOf(change));
        }
        printJson(document, output);
    } else {
        printChanges(changes, output);
    }
    return changes.empty() ? kFine : kFindings;
}

}  // namespace sennetctl
