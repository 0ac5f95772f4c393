#include "mif/MifDifference.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>
#include <unordered_map>

namespace sennetctl {

namespace {

using Texts = std::vector<std::string>;

std::string definitionOf(const MifColumn& column) {
    return shownType(column.type) + (column.isKey ? ", key" : "");
}

/// One of the tables with what is compared: its columns without row numbers, its values as texts.
struct ComparedTable {
    explicit ComparedTable(const MifTable& table) {
        std::vector<std::size_t> places;
        for (std::size_t i = 0; i < table.columns.size(); ++i) {
            if (!isRowNumber(table.columns[i])) {
                places.push_back(i);
                placesByName.emplace(table.columns[i].name, names.size());
                names.push_back(table.columns[i].name);
                keys.push_back(table.columns[i].isKey);
                definitions.push_back(definitionOf(table.columns[i]));
            }
        }
        for (const std::vector<Mif::Value>& values : table.rows) {
            Texts row;
            for (const std::size_t place : places) {
                row.push_back(shownValue(values[place], table.columns[place]));
            }
            rows.push_back(std::move(row));
        }
    }

    std::optional<std::size_t> placeOf(const std::string& name) const {
        const auto found = placesByName.find(name);
        return found == placesByName.end() ? std::nullopt
                                           : std::optional<std::size_t>(found->second);
    }

    Texts names;
    std::unordered_map<std::string, std::size_t> placesByName;
    std::vector<bool> keys;
    Texts definitions;
    std::vector<Texts> rows;
};

class TableComparison {
  public:
    TableComparison(const MifTable& before, const MifTable& after, std::vector<MifChange>& changes)
        : name(after.name), before(before), after(after), changes(changes) {}

    void run() {
        compareColumns();
        identity = chooseIdentity();
        if (identity.empty()) {
            compareWholeRows();
        } else {
            compareById();
        }
    }

  private:
    void add(MifChange::Kind kind, const std::string& row, const std::string& attribute = {},
             const std::string& oldValue = {}, const std::string& newValue = {}) {
        changes.push_back({name, kind, row, attribute, oldValue, newValue});
    }

    void compareColumns() {
        for (const std::string& column : before.names) {
            if (!after.placeOf(column)) {
                add(MifChange::Kind::Removed, {}, column);
            }
        }
        for (const std::string& column : after.names) {
            if (before.placeOf(column)) {
                compareDefinitions(column);
                common.push_back(column);
            } else {
                add(MifChange::Kind::Added, {}, column);
            }
        }
    }

    /// Of a column that both have.
    void compareDefinitions(const std::string& column) {
        const std::string& oldDefinition = before.definitions[*before.placeOf(column)];
        const std::string& newDefinition = after.definitions[*after.placeOf(column)];
        if (oldDefinition != newDefinition) {
            add(MifChange::Kind::Changed, {}, column, oldDefinition, newDefinition);
        }
    }

    /// The key, or the first column, if that tells the rows of both files apart.
    Texts chooseIdentity() const {
        Texts chosen;
        for (std::size_t i = 0; i < after.names.size(); ++i) {
            if (after.keys[i]) {
                chosen.push_back(after.names[i]);
            }
        }
        if (chosen.empty() && !common.empty()) {
            chosen.push_back(common.front());
        }
        return tellsApart(before, chosen) && tellsApart(after, chosen) ? chosen : Texts();
    }

    static Texts valuesOf(const ComparedTable& table, const Texts& row, const Texts& columns) {
        Texts values;
        for (const std::string& column : columns) {
            const std::optional<std::size_t> place = table.placeOf(column);
            values.push_back(place ? row[*place] : std::string());
        }
        return values;
    }

    static bool tellsApart(const ComparedTable& table, const Texts& columns) {
        std::set<Texts> seen;
        return std::all_of(table.rows.begin(), table.rows.end(), [&](const Texts& row) {
            const Texts values = valuesOf(table, row, columns);
            const bool empty = std::all_of(values.begin(), values.end(),
                                           [](const std::string& value) { return value.empty(); });
            return !empty && seen.insert(values).second;
        });
    }

    static std::string joined(const Texts& values) {
        std::string text;
        for (const std::string& value : values) {
            text += (text.empty() ? "" : ", ") + value;
        }
        return text.empty() ? "a row without values" : text;
    }

    void compareById() {
        std::map<Texts, const Texts*> newRows;
        for (const Texts& row : after.rows) {
            newRows[valuesOf(after, row, identity)] = &row;
        }
        std::set<Texts> known;
        for (const Texts& row : before.rows) {
            const Texts id = valuesOf(before, row, identity);
            known.insert(id);
            const auto found = newRows.find(id);
            if (found == newRows.end()) {
                add(MifChange::Kind::Removed, joined(id));
            } else {
                compareRow(joined(id), row, *found->second);
            }
        }
        for (const Texts& row : after.rows) {
            const Texts id = valuesOf(after, row, identity);
            if (known.count(id) == 0) {
                add(MifChange::Kind::Added, joined(id));
            }
        }
    }

    void compareRow(const std::string& id, const Texts& oldRow, const Texts& newRow) {
        const Texts oldValues = valuesOf(before, oldRow, common);
        const Texts newValues = valuesOf(after, newRow, common);
        for (std::size_t i = 0; i < common.size(); ++i) {
            if (oldValues[i] != newValues[i]) {
                add(MifChange::Kind::Changed, id, common[i], oldValues[i], newValues[i]);
            }
        }
    }

    /// Rows that have their like in the other file are no change, however often they occur there.
    void compareWholeRows() {
        std::multiset<Texts> left;
        for (const Texts& row : after.rows) {
            left.insert(valuesOf(after, row, common));
        }
        for (const Texts& row : before.rows) {
            const Texts values = valuesOf(before, row, common);
            const auto like = left.find(values);
            if (like == left.end()) {
                add(MifChange::Kind::Removed, joined(values));
            } else {
                left.erase(like);
            }
        }
        for (const Texts& values : left) {
            add(MifChange::Kind::Added, joined(values));
        }
    }

    std::string name;
    ComparedTable before;
    ComparedTable after;
    std::vector<MifChange>& changes;
    Texts common;
    Texts identity;
};

void compareNames(const std::string& table, const std::string& before, const std::string& after,
                  std::vector<MifChange>& changes) {
    if (before != after) {
        changes.push_back({table, MifChange::Kind::Changed, {}, {}, before, after});
    }
}

using TablesByClass = std::unordered_map<std::string, const MifTable*>;

TablesByClass byClass(const std::vector<MifTable>& tables) {
    TablesByClass found;
    for (const MifTable& table : tables) {
        found.emplace(table.className, &table);
    }
    return found;
}

}  // namespace

std::vector<MifChange> differencesOf(const MifContent& before, const MifContent& after) {
    const TablesByClass oldClasses = byClass(before.tables);
    const TablesByClass newClasses = byClass(after.tables);
    std::vector<MifChange> changes;
    compareNames({}, before.component, after.component, changes);
    for (const MifTable& table : before.tables) {
        const auto like = newClasses.find(table.className);
        if (like != newClasses.end()) {
            compareNames(like->second->name, table.name, like->second->name, changes);
            TableComparison(table, *like->second, changes).run();
        } else {
            changes.push_back({table.name, MifChange::Kind::Removed, {}, {}, {}, {}});
        }
    }
    for (const MifTable& table : after.tables) {
        if (oldClasses.count(table.className) == 0) {
            changes.push_back({table.name, MifChange::Kind::Added, {}, {}, {}, {}});
        }
    }
    return changes;
}

}  // namespace sennetctl
