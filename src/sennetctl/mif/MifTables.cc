#include "mif/MifTables.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <set>
#include <utility>

#include "mif/MifText.h"
#include "mifreader/MifReader.h"
#include "report/Room.h"
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

/// Of each octet in JSON, HTML or on a terminal, whichever has the longest form.
constexpr std::array<std::uint8_t, 256> lengthsOfForms() {
    constexpr std::string_view kEscaped = "\"'&<>\\\x7F";
    constexpr std::uint8_t kLongestEscape = 6;
    std::array<std::uint8_t, 256> lengths = {};
    for (std::size_t code = 0; code < lengths.size(); ++code) {
        const bool escaped =
            code < ' ' || kEscaped.find(static_cast<char>(code)) != std::string_view::npos;
        lengths[code] = escaped ? kLongestEscape : code < 0x80 ? 1 : 2;
    }
    return lengths;
}

std::size_t longestForm(std::string_view text) {
    static constexpr std::array<std::uint8_t, 256> kLengths = lengthsOfForms();
    std::size_t octets = 0;
    for (const char c : text) {
        octets += kLengths[static_cast<unsigned char>(c)];
    }
    return octets;
}

/// The name of a number; nullptr for what has none.
const std::string* valueName(const Value& value, const MifColumn& column) {
    constexpr std::uint64_t kLargest = std::uint64_t(1) << 31;
    if (value.kind != Value::Kind::Integer || value.magnitude > kLargest) {
        return nullptr;
    }
    const auto magnitude = static_cast<std::int64_t>(value.magnitude);
    const auto name = column.valueNames.find(value.negative ? -magnitude : magnitude);
    return name == column.valueNames.end() ? nullptr : &name->second;
}

/// Rows take the values that they leave out from their group, and numbers refer to their names, so
/// that a short file may have tables without end.
class TableFiller {
  public:
    explicit TableFiller(std::size_t largestOctets)
        : room(largestOctets,
               "its tables are larger than " + std::to_string(largestOctets >> 20) + " MiB") {}

    std::vector<MifTable> tablesOf(const Mif::Component& component) {
        for (const Group& group : component.groups) {
            const auto [place, added] = places.emplace(group.className, tables.size());
            if (added) {
                addTable(group);
            }
            if (!group.isTemplate()) {
                addRow(place->second, group, {});
            }
        }
        for (const Mif::Table& table : component.tables) {
            const std::size_t place = places.at(table.className);
            for (const Mif::Row& row : table.rows) {
                addRow(place, component.groups[table.group], row);
            }
        }
        return std::move(tables);
    }

  private:
    void addTable(const Group& group) {
        tables.push_back(emptyTable(group));
        std::vector<std::size_t>& octets = octetsOfNames.emplace_back();
        for (const MifColumn& column : tables.back().columns) {
            octets.push_back(longestForm(column.name));
        }
    }

    void addRow(std::size_t place, const Group& group, const Mif::Row& row) {
        MifTable& table = tables[place];
        std::vector<Value> values;
        room.take(sizeof(std::vector<Value>));
        for (std::size_t i = 0; i < group.attributes.size(); ++i) {
            const bool given = i < row.values.size() && row.values[i].kind != Value::Kind::Omitted;
            const std::optional<Value>& usual = group.attributes[i].value;
            const Value* value = given ? &row.values[i] : usual ? &*usual : &nothing;
            const std::string* name = valueName(*value, table.columns[i]);
            room.take(sizeof(Value) + octetsOfNames[place][i] +
                      longestForm(name != nullptr ? *name : value->text));
            values.push_back(*value);
        }
        values.shrink_to_fit();
        table.rows.push_back(std::move(values));
    }

    std::vector<MifTable> tables;
    std::vector<std::vector<std::size_t>> octetsOfNames;  // of the columns of each table
    std::map<std::string, std::size_t> places;
    Room room;
    const Value nothing;
};

Mif::Component componentOf(const std::string& path, std::string_view octets) {
    const MifText text = mifTextOf(octets);
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
    return mifContentOf(path, readWholeFile(path));
}

MifContent mifContentOf(const std::string& path, std::string_view octets,
                        std::size_t largestOctets) {
    const Mif::Component component = componentOf(path, octets);
    try {
        return {fromLatin1(component.name), TableFiller(largestOctets).tablesOf(component)};
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
    const std::string* name = valueName(value, column);
    return name != nullptr ? *name : shownValue(value);
}

}  // namespace sennetctl
