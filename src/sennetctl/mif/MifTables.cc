#include "mif/MifTables.h"

#include <algorithm>
#include <map>

#include "mif/MifText.h"
#include "mifreader/MifReader.h"
#include "report/Text.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

using Mif::Attribute;
using Mif::Group;
using Mif::Tolerance;
using Mif::Value;

Mif::Tolerances everyTolerance() {
    return {Tolerance::RawLineEnds,    Tolerance::BareLineEnds, Tolerance::IntegersAsText,
            Tolerance::TextAsIntegers, Tolerance::WideIntegers, Tolerance::AnyDates,
            Tolerance::LongLiterals,   Tolerance::RepeatedNames};
}

MifTable emptyTable(const Group& group) {
    MifTable table{fromLatin1(group.name), fromLatin1(group.className), {}, {}};
    for (const Attribute& attribute : group.attributes) {
        std::string name = fromLatin1(attribute.name);
        const bool repeated =
            std::any_of(table.columns.begin(), table.columns.end(),
                        [&](const MifColumn& column) { return column.name == name; });
        if (repeated) {
            name += " (" + std::to_string(attribute.id) + ")";
        }
        const bool isKey =
            std::find(group.key.begin(), group.key.end(), attribute.id) != group.key.end();
        table.columns.push_back({std::move(name), attribute.type, isKey});
    }
    return table;
}

void addRow(MifTable& table, const Group& group, const Mif::Row& row) {
    std::vector<Value> values;
    for (std::size_t i = 0; i < group.attributes.size(); ++i) {
        const bool given = i < row.values.size() && row.values[i].kind != Value::Kind::Omitted;
        values.push_back(given ? row.values[i] : group.attributes[i].value.value_or(Value()));
    }
    table.rows.push_back(std::move(values));
}

}  // namespace

std::vector<MifTable> tablesOf(const Mif::Component& component) {
    std::vector<MifTable> tables;
    std::map<std::string, std::size_t> places;
    for (const Group& group : component.groups) {
        const auto [place, added] = places.emplace(group.className, tables.size());
        if (added) {
            tables.push_back(emptyTable(group));
        }
        if (!group.isTemplate()) {
            addRow(tables[place->second], group, {});
        }
    }
    for (const Mif::Table& table : component.tables) {
        MifTable& shown = tables[places.at(table.className)];
        for (const Mif::Row& row : table.rows) {
            addRow(shown, component.groups[table.group], row);
        }
    }
    return tables;
}

Mif::Component readMifFile(const std::string& path) {
    const MifText text = mifTextOf(readWholeFile(path));
    Mif::Tolerances tolerances = everyTolerance();
    try {
        return Mif::MifReader(tolerances).read(text.octets);
    } catch (const Mif::Error& error) {
        // One product's files have backslashes that stand for themselves.
        tolerances.add(Tolerance::PlainBackslashes);
        try {
            return Mif::MifReader(tolerances).read(text.octets);
        } catch (const Mif::Error&) {
            throw CannotRun(path + ":" + error.what());
        }
    }
}

std::string shownValue(const Value& value) {
    switch (value.kind) {
        case Value::Kind::Integer:
            return (value.negative ? "-" : "") + std::to_string(value.magnitude);
        case Value::Kind::Text:
            return fromLatin1(value.text);
        case Value::Kind::Unsupported:
            return "unsupported";
        case Value::Kind::FromPath:
            return "from " + fromLatin1(value.text);
        case Value::Kind::Omitted:
            break;
    }
    return {};
}

}  // namespace sennetctl
