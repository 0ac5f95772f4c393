#include "mif/MifTables.h"

#include <cstddef>
#include <map>
#include <set>
#include <utility>

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

/// Far more than the file itself may have.
constexpr std::size_t kLargestTablesOctets = std::size_t(256) << 20;

Mif::Tolerances everyTolerance() {
    return {Tolerance::RawLineEnds,    Tolerance::BareLineEnds, Tolerance::IntegersAsText,
            Tolerance::TextAsIntegers, Tolerance::WideIntegers, Tolerance::AnyDates,
            Tolerance::LongLiterals,   Tolerance::RepeatedNames};
}

std::map<std::int64_t, std::string> valueNamesOf(const Attribute& attribute) {
    std::map<std::int64_t, std::string> names;
    if (attribute.enumeration) {
        for (const Mif::EnumEntry& entry : attribute.enumeration->entries) {
            names.emplace(entry.number, fromLatin1(entry.text));
        }
    }
    return names;
}

MifTable emptyTable(const Group& group) {
    MifTable table{
        fromLatin1(group.name), fromLatin1(group.className), {}, {}, fromLatin1(group.description)};
    const std::set<std::uint64_t> keys(group.key.begin(), group.key.end());
    std::set<std::string> names;
    for (const Attribute& attribute : group.attributes) {
        std::string name = fromLatin1(attribute.name);
        while (!names.insert(name).second) {
            name += " (" + std::to_string(attribute.id) + ")";
        }
        table.columns.push_back({std::move(name), attribute.type, keys.count(attribute.id) > 0,
                                 fromLatin1(attribute.description), valueNamesOf(attribute)});
    }
    return table;
}

/// Rows take the values that they leave out from their group, so that a short file may have tables
/// without end.
class TableFiller {
  public:
    std::vector<MifTable> tablesOf(const Mif::Component& component) {
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
        return std::move(tables);
    }

  private:
    void addRow(MifTable& table, const Group& group, const Mif::Row& row) {
        std::vector<Value> values;
        for (std::size_t i = 0; i < group.attributes.size(); ++i) {
            const bool given = i < row.values.size() && row.values[i].kind != Value::Kind::Omitted;
            values.push_back(given ? row.values[i] : group.attributes[i].value.value_or(Value()));
            octets += sizeof(Value) + values.back().text.size();
            if (octets > kLargestTablesOctets) {
                throw CannotRun("its tables are larger than " +
                                std::to_string(kLargestTablesOctets >> 20) + " MiB");
            }
        }
        table.rows.push_back(std::move(values));
    }

    std::vector<MifTable> tables;
    std::map<std::string, std::size_t> places;
    std::size_t octets = 0;
};

Mif::Component readComponent(const std::string& path) {
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
            throw CannotRun(
                Failure{path, error.position().line, error.position().column, error.message()});
        }
    }
}

}  // namespace

MifContent readMifFile(const std::string& path) {
    const Mif::Component component = readComponent(path);
    try {
        return {fromLatin1(component.name), TableFiller().tablesOf(component)};
    } catch (const CannotRun& failure) {
        throw CannotRun(path, failure.failure().reason);
    }
}

std::string shownType(const Mif::Type& type) {
    static constexpr const char* kNames[] = {"Integer",       "Integer64",   "Gauge",
                                             "Counter",       "Counter64",   "String",
                                             "DisplayString", "OctetString", "Date"};
    const std::string name = kNames[static_cast<std::size_t>(type.base)];
    return type.length > 0 ? name + "(" + std::to_string(type.length) + ")" : name;
}

bool isRowNumber(const MifColumn& column) {
    return column.isKey && (column.name == "Index" || column.name == "Row_Index");
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

std::string shownValue(const Value& value, const MifColumn& column) {
    constexpr std::uint64_t kLargest = std::uint64_t(1) << 31;
    if (value.kind == Value::Kind::Integer && value.magnitude <= kLargest) {
        const auto magnitude = static_cast<std::int64_t>(value.magnitude);
        const auto name = column.valueNames.find(value.negative ? -magnitude : magnitude);
        if (name != column.valueNames.end()) {
            return name->second;
        }
    }
    return shownValue(value);
}

}  // namespace sennetctl
