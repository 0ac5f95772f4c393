#pragma once

// What a Management Information Format file holds.

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "mifreader/Error.h"

namespace Mif {

struct Value {
    enum class Kind {
        Omitted,
        Integer,
        Text,
        Unsupported,
        FromPath,  // asked of the program that a Path block names
    };

    Kind kind = Kind::Omitted;
    bool negative = false;
    std::uint64_t magnitude = 0;
    std::string text;  // octets of a literal with its escapes resolved, or the name of a path
    Position position;
};

struct Type {
    enum class Base {
        Integer,
        Integer64,
        Gauge,
        Counter,
        Counter64,
        String,
        DisplayString,
        OctetString,
        Date,
    };

    Base base = Base::Integer;
    std::uint64_t length = 0;  // in octets; 0 for types without one

    friend bool operator==(const Type&, const Type&) = default;
};

struct EnumEntry {
    std::int64_t number = 0;
    std::string text;
};

struct Enumeration {
    std::string name;  // empty inside an attribute
    std::vector<EnumEntry> entries;
};

struct Attribute {
    std::string name;
    std::uint64_t id = 0;
    Type type;
    std::string description;
    std::string access = "read-only";  // in lower case
    std::string storage = "specific";  // in lower case
    std::optional<Value> value;
    std::optional<Enumeration> enumeration;
    Position namePosition;
    Position idPosition;
};

struct Group {
    std::string name;
    std::string className;
    std::optional<std::uint64_t> id;
    std::vector<std::uint64_t> key;
    std::string description;
    std::string pragma;
    Position namePosition;
    Position classPosition;
    std::vector<Attribute> attributes;  // in ascending order of their Ids
    std::size_t requiredValues = 0;     // a row ends no earlier: the last of these has no default

    // A template describes the rows of tables and holds their default values.
    bool isTemplate() const { return !id && !key.empty(); }
};

// The values as they stand in the file: at most one per attribute, some of them omitted.
struct Row {
    std::vector<Value> values;

    // The value of the group's attribute at the place: the row's, or the default of the group.
    const Value& at(const Group& group, std::size_t place) const {
        const bool given = place < values.size() && values[place].kind != Value::Kind::Omitted;
        return given ? values[place] : *group.attributes[place].value;
    }
};

struct Table {
    std::string name;
    std::uint64_t id = 0;
    std::string className;
    Position namePosition;
    std::size_t group = 0;  // its place in Component::groups
    std::vector<Row> rows;
};

struct Path {
    std::string name;
    std::vector<std::pair<std::string, std::string>> programs;  // system and program, by system
};

struct Component {
    std::string name;
    std::string description;
    std::string pragma;
    std::vector<Path> paths;
    std::vector<Enumeration> enumerations;
    std::vector<Group> groups;
    std::vector<Table> tables;
    Position namePosition;
    // Where literals hold CR or LF as they are, each line end once; strictly there is none.
    std::vector<Position> rawLineEnds;
};

}  // namespace Mif
