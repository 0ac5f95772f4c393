#include "mif/MifDifference.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>
#include <utility>

#include "mif/RowText.h"
#include "report/Room.h"

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
    std::map<std::string, std::size_t> placesByName;
    std::vector<bool> keys;
    Texts definitions;
    std::vector<Texts> rows;
};

/// The values of some columns, as one of the tables has them.
class Selection {
  public:
    Selection(const ComparedTable& table, const Texts& columns) {
        for (std::size_t i = 0; i < columns.size(); ++i) {
            if (const std::optional<std::size_t> place = table.placeOf(columns[i])) {
                places.emplace_back(i, *place);
            }
        }
    }

    RowText of(const Texts& row) const {
        RowText text;
        for (const auto& [column, place] : places) {
            if (!row[place].empty()) {
                text.add(column, row[place]);
            }
        }
        return text;
    }

  private:
    std::vector<std::pair<std::size_t, std::size_t>> places;  // of a column, and in a row
};

/// The changes so far, as many as there is room for.
class Changes {
  public:
    explicit Changes(std::size_t largestOctets)
        : room(largestOctets,
               "the differences are larger than " + std::to_string(largestOctets >> 20) + " MiB") {}

    void add(MifChange change) {
        room.take(sizeof change + change.table.size() + change.row.size() +
                  change.attribute.size() + change.before.size() + change.after.size());
        changes.push_back(std::move(change));
    }
    void addIfChanged(const std::string& table, const std::string& before,
                      const std::string& after) {
        if (before != after) {
            add({table, MifChange::Kind::Changed, {}, {}, before, after});
        }
    }
    std::vector<MifChange> take() { return std::move(changes); }

  private:
    Room room;
    std::vector<MifChange> changes;
};

class TableComparison {
  public:
    TableComparison(const MifTable& before, const MifTable& after, Changes& changes)
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
        changes.add({name, kind, row, attribute, oldValue, newValue});
    }

    void compareColumns() {
        for (const std::string& column : before.names) {
            if (!after.placeOf(column)) {
                add(MifChange::Kind::Removed, {}, column);
            }
        }
        for (const std::string& column : after.names) {
            if (const std::optional<std::size_t> oldPlace = before.placeOf(column)) {
                compareDefinitions(column);
                common.push_back(column);
                commonPlaces.emplace_back(*oldPlace, *after.placeOf(column));
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

    static bool tellsApart(const ComparedTable& table, const Texts& columns) {
        const Selection selection(table, columns);
        std::set<RowText> seen;
        return std::all_of(table.rows.begin(), table.rows.end(), [&](const Texts& row) {
            RowText values = selection.of(row);
            return !values.empty() && seen.insert(std::move(values)).second;
        });
    }

    static std::string shown(const RowText& values, const Texts& columns) {
        return values.empty() ? "a row without values" : values.joined(columns.size());
    }

    void compareById() {
        const Selection oldIds(before, identity);
        const Selection newIds(after, identity);
        std::map<RowText, const Texts*> newRows;
        for (const Texts& row : after.rows) {
            newRows.emplace(newIds.of(row), &row);
        }
        std::set<RowText> known;
        for (const Texts& row : before.rows) {
            const RowText id = oldIds.of(row);
            const auto found = newRows.find(id);
            if (found == newRows.end()) {
                add(MifChange::Kind::Removed, shown(id, identity));
            } else {
                compareRow(id, row, *found->second);
                known.insert(id);
            }
        }
        for (const Texts& row : after.rows) {
            const RowText id = newIds.of(row);
            if (known.count(id) == 0) {
                add(MifChange::Kind::Added, shown(id, identity));
            }
        }
    }

    void compareRow(const RowText& id, const Texts& oldRow, const Texts& newRow) {
        for (const auto& [oldPlace, newPlace] : commonPlaces) {
            if (oldRow[oldPlace] != newRow[newPlace]) {
                add(MifChange::Kind::Changed, shown(id, identity), before.names[oldPlace],
                    oldRow[oldPlace], newRow[newPlace]);
            }
        }
    }

    /// Rows that have their like in the other file are no change, however often they occur there.
    void compareWholeRows() {
        const Selection newValues(after, common);
        const Selection oldValues(before, common);
        std::multiset<RowText> left;
        for (const Texts& row : after.rows) {
            left.insert(newValues.of(row));
        }
        for (const Texts& row : before.rows) {
            const RowText values = oldValues.of(row);
            const auto like = left.find(values);
            if (like == left.end()) {
                add(MifChange::Kind::Removed, shown(values, common));
            } else {
                left.erase(like);
            }
        }
        for (const RowText& values : left) {
            add(MifChange::Kind::Added, shown(values, common));
        }
    }

    std::string name;
    ComparedTable before;
    ComparedTable after;
    Changes& changes;
    Texts common;
    std::vector<std::pair<std::size_t, std::size_t>> commonPlaces;  // before and after
    Texts identity;
};

using TablesByClass = std::map<std::string, const MifTable*>;

TablesByClass byClass(const std::vector<MifTable>& tables) {
    TablesByClass found;
    for (const MifTable& table : tables) {
        found.emplace(table.className, &table);
    }
    return found;
}

}  // namespace

std::vector<MifChange> differencesOf(const MifContent& before, const MifContent& after,
                                     std::size_t largestOctets) {
    const TablesByClass oldClasses = byClass(before.tables);
    const TablesByClass newClasses = byClass(after.tables);
    Changes changes(largestOctets);
    changes.addIfChanged({}, before.component, after.component);
    for (const MifTable& table : before.tables) {
        const auto like = newClasses.find(table.className);
        if (like != newClasses.end()) {
            changes.addIfChanged(like->second->name, table.name, like->second->name);
            TableComparison(table, *like->second, changes).run();
        } else {
            changes.add({table.name, MifChange::Kind::Removed, {}, {}, {}, {}});
        }
    }
    for (const MifTable& table : after.tables) {
        if (oldClasses.count(table.className) == 0) {
            changes.add({table.name, MifChange::Kind::Added, {}, {}, {}, {}});
        }
    }
    return changes.take();
}

}  // namespace sennetctl
