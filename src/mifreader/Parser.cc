#include "mifreader/Parser.h"

#include <algorithm>
#include <utility>

namespace Mif {

namespace {

// A value takes one octet in a file and a hundred here.
constexpr std::size_t kMostValues = std::size_t(1) << 22;

// What groups of one class promise to have in common.
bool sameShape(const Attribute& one, const Attribute& other) {
    return one.id == other.id && one.type == other.type && one.access == other.access &&
           one.storage == other.storage;
}

}  // namespace

Parser::Parser(std::string_view text, Tolerances theTolerances)
    : lexer(text, theTolerances), tolerances(theTolerances), checker(theTolerances) {
    current = lexer.next();
}

Component Parser::file() {
    const Position start = expectWord("start").position;
    expectWord("component");
    Statements statements("Component", start);
    Position blockStart;
    while (current.kind != Token::Kind::Word || current.text != "end") {
        if (startsBlock(blockStart)) {
            blockInComponent(blockStart);
            continue;
        }
        const Token word = statement(statements);
        if (word.text == "name") {
            result.namePosition = current.position;
            result.name = expectLiteral();
        } else if (word.text == "description") {
            result.description = expectLiteral();
        } else if (word.text == "pragma") {
            result.pragma = expectLiteral();
        } else {
            statements.refuse(word.text, word.position);
        }
    }
    endBlock("component");
    statements.require("name");
    if (current.kind != Token::Kind::End) {
        throw Error(current.position, "nothing may follow the component");
    }
    result.rawLineEnds = lexer.rawLineEnds();
    return std::move(result);
}

Token Parser::advance() {
    Token token = std::move(current);
    current = lexer.next();
    return token;
}

bool Parser::skip(std::string_view separator) {
    if (!current.is(separator)) {
        return false;
    }
    advance();
    return true;
}

Token Parser::expectWord(std::string_view expected) {
    if (current.kind != Token::Kind::Word || current.text != expected) {
        throw Error(current.position,
                    "expected '" + std::string(expected) + "', found " + current.shown());
    }
    return advance();
}

void Parser::expectSeparator(std::string_view separator) {
    if (!skip(separator)) {
        throw Error(current.position,
                    "expected '" + std::string(separator) + "', found " + current.shown());
    }
}

std::string Parser::expectLiteral() {
    if (current.kind != Token::Kind::Literal) {
        throw Error(current.position, "expected a literal, found " + current.shown());
    }
    return advance().text;
}

Number Parser::expectNumber(const char* what) {
    if (current.kind != Token::Kind::Integer || current.negative || current.magnitude == 0) {
        throw Error(current.position,
                    std::string("expected ") + what + " of 1 or greater, found " + current.shown());
    }
    const Token token = advance();
    return {token.magnitude, token.position};
}

Token Parser::statement(Statements& statements) {
    if (current.kind != Token::Kind::Word) {
        throw Error(current.position, "expected a statement, found " + current.shown());
    }
    Token word = advance();
    expectSeparator("=");
    statements.note(word.text, word.position);
    return word;
}

bool Parser::startsBlock(Position& start) {
    if (current.kind != Token::Kind::Word || current.text != "start") {
        return false;
    }
    start = advance().position;
    return true;
}

void Parser::endBlock(std::string_view block) {
    expectWord("end");
    expectWord(block);
}

void Parser::blockInComponent(Position start) {
    const Token word = advance();
    if (word.kind == Token::Kind::Word && word.text == "path") {
        path(start);
    } else if (word.kind == Token::Kind::Word && word.text == "enum") {
        result.enumerations.push_back(enumeration(start, true));
    } else if (word.kind == Token::Kind::Word && word.text == "group") {
        group(start);
    } else if (word.kind == Token::Kind::Word && word.text == "table") {
        table(start);
    } else {
        throw Error(word.position, word.shown() + " is no block of a Component");
    }
}

void Parser::path(Position start) {
    Path path;
    Statements statements("Path", start);
    while (current.kind != Token::Kind::Word || current.text != "end") {
        pathStatement(path, statements);
    }
    endBlock("path");
    statements.require("name");
    if (!pathNames.insert(path.name).second) {
        throw Error(start, "second Path of this name");
    }
    result.paths.push_back(std::move(path));
}

void Parser::pathStatement(Path& path, Statements& statements) {
    static constexpr std::string_view kSystems[] = {"dos",   "macos", "os2",   "unix",
                                                    "win16", "win32", "win9x", "winnt"};
    const Token word = statement(statements);
    if (word.text == "name") {
        path.name = expectLiteral();
        return;
    }
    if (std::find(std::begin(kSystems), std::end(kSystems), word.text) == std::end(kSystems)) {
        statements.refuse(word.text, word.position);
    }
    const bool direct = current.kind == Token::Kind::Word && current.text == "direct-interface";
    path.programs.emplace_back(word.text, direct ? advance().text : expectLiteral());
}

Enumeration Parser::enumeration(Position start, bool named) {
    Enumeration enumeration;
    Statements statements(named ? "named Enum" : "Enum of an attribute", start);
    while (current.kind != Token::Kind::Word || current.text != "end") {
        if (current.kind == Token::Kind::Integer) {
            const std::string number = current.shown();
            const Position position = current.position;
            enumeration.entries.push_back(enumEntry());
            statements.note(number, position);
            continue;
        }
        const Token word = statement(statements);
        if (named && word.text == "name") {
            enumeration.name = expectLiteral();
        } else if (word.text == "type") {
            oneOf({"integer", "int"});
        } else {
            statements.refuse(word.text, word.position);
        }
    }
    endBlock("enum");
    if (named) {
        statements.require("name");
    }
    return enumeration;
}

EnumEntry Parser::enumEntry() {
    Value number;
    number.kind = Value::Kind::Integer;
    number.negative = current.negative;
    number.magnitude = current.magnitude;
    number.position = current.position;
    ValueChecker({}).check(number, {Type::Base::Integer, 0});
    advance();
    expectSeparator("=");
    const auto magnitude = static_cast<std::int64_t>(number.magnitude);
    return {number.negative ? -magnitude : magnitude, expectLiteral()};
}

void Parser::group(Position start) {
    GroupBuilder builder(start, tolerances);
    Statements statements("Group", start);
    Position blockStart;
    while (current.kind != Token::Kind::Word || current.text != "end") {
        if (startsBlock(blockStart)) {
            expectWord("attribute");
            builder.add(attribute(blockStart));
        } else {
            groupStatement(builder, statements);
        }
    }
    endBlock("group");
    statements.require("name");
    statements.require("class");
    if (!statements.has("id") && !statements.has("key")) {
        throw Error(start, "Group with neither 'id' nor 'key'");
    }
    Group group = builder.finish();
    checkSameClass(group, start);
    groupsByClass[group.className] = result.groups.size();
    result.groups.push_back(std::move(group));
}

void Parser::groupStatement(GroupBuilder& builder, Statements& statements) {
    const Token word = statement(statements);
    if (word.text == "name") {
        builder.group.namePosition = current.position;
        builder.group.name = expectLiteral();
    } else if (word.text == "class") {
        builder.group.classPosition = current.position;
        builder.group.className = expectLiteral();
    } else if (word.text == "id") {
        const Number id = expectNumber("an Id");
        useId(id);
        builder.group.id = id.value;
    } else if (word.text == "description") {
        builder.group.description = expectLiteral();
    } else if (word.text == "pragma") {
        builder.group.pragma = expectLiteral();
    } else if (word.text == "key") {
        builder.setKey(numberList());
    } else {
        statements.refuse(word.text, word.position);
    }
}

std::vector<Number> Parser::numberList() {
    std::vector<Number> numbers = {expectNumber("an Id")};
    while (skip(",")) {
        numbers.push_back(expectNumber("an Id"));
    }
    return numbers;
}

void Parser::checkSameClass(const Group& group, Position start) const {
    const auto earlier = groupsByClass.find(group.className);
    if (earlier == groupsByClass.end()) {
        return;
    }
    const std::vector<Attribute>& others = result.groups[earlier->second].attributes;
    if (!std::equal(others.begin(), others.end(), group.attributes.begin(), group.attributes.end(),
                    sameShape)) {
        throw Error(start, "Group unlike the earlier one of its class");
    }
}

Attribute Parser::attribute(Position start) {
    Attribute attribute;
    Statements statements("Attribute", start);
    Position blockStart;
    while (current.kind != Token::Kind::Word || current.text != "end") {
        if (startsBlock(blockStart)) {
            expectWord("enum");
            if (attribute.enumeration) {
                throw Error(blockStart, "second Enum in this Attribute");
            }
            attribute.enumeration = enumeration(blockStart, false);
        } else {
            attributeStatement(attribute, statements);
        }
    }
    endBlock("attribute");
    statements.require("name");
    statements.require("id");
    statements.require("type");
    if (attribute.value) {
        checker.check(*attribute.value, attribute.type);
    }
    return attribute;
}

void Parser::attributeStatement(Attribute& attribute, Statements& statements) {
    const Token word = statement(statements);
    if (word.text == "name") {
        attribute.namePosition = current.position;
        attribute.name = expectLiteral();
    } else if (word.text == "id") {
        const Number id = expectNumber("an Id");
        attribute.id = id.value;
        attribute.idPosition = id.position;
    } else if (word.text == "type") {
        attribute.type = type();
    } else if (word.text == "description") {
        attribute.description = expectLiteral();
    } else if (word.text == "access") {
        attribute.access = oneOf({"read-only", "read-write", "write-only"});
    } else if (word.text == "storage") {
        attribute.storage = oneOf({"common", "specific"});
    } else if (word.text == "value") {
        attribute.value = value();
    } else {
        statements.refuse(word.text, word.position);
    }
}

Type Parser::type() {
    static const std::map<std::string, Type::Base> kTypes = {
        {"integer", Type::Base::Integer},     {"int", Type::Base::Integer},
        {"integer64", Type::Base::Integer64}, {"int64", Type::Base::Integer64},
        {"gauge", Type::Base::Gauge},         {"counter", Type::Base::Counter},
        {"counter64", Type::Base::Counter64}, {"date", Type::Base::Date},
    };
    static const std::map<std::string, Type::Base> kSizedTypes = {
        {"string", Type::Base::String},
        {"displaystring", Type::Base::DisplayString},
        {"octetstring", Type::Base::OctetString},
    };
    if (current.kind == Token::Kind::Word) {
        if (const auto plain = kTypes.find(current.text); plain != kTypes.end()) {
            advance();
            return {plain->second, 0};
        }
        if (const auto sized = kSizedTypes.find(current.text); sized != kSizedTypes.end()) {
            advance();
            expectSeparator("(");
            const Number length = expectNumber("a length");
            expectSeparator(")");
            return {sized->second, length.value};
        }
    }
    throw Error(current.position, current.shown() + " is no type");
}

std::string Parser::oneOf(std::initializer_list<std::string_view> words) {
    if (current.kind != Token::Kind::Word ||
        std::find(words.begin(), words.end(), current.text) == words.end()) {
        throw Error(current.position, current.shown() + " is not allowed here");
    }
    return advance().text;
}

Value Parser::value() {
    Value value;
    value.position = current.position;
    if (skip("*")) {
        const Position namePosition = current.position;
        value.kind = Value::Kind::FromPath;
        value.text = expectLiteral();
        if (pathNames.count(value.text) == 0) {
            throw Error(namePosition, "no Path of this name before");
        }
        return value;
    }
    Token token = advance();
    if (token.kind == Token::Kind::Integer) {
        value.kind = Value::Kind::Integer;
        value.negative = token.negative;
        value.magnitude = token.magnitude;
    } else if (token.kind == Token::Kind::Literal) {
        value.kind = Value::Kind::Text;
        value.text = std::move(token.text);
    } else if (token.kind == Token::Kind::Word && token.text == "unsupported") {
        value.kind = Value::Kind::Unsupported;
    } else {
        throw Error(token.position, "expected a value, found " + token.shown());
    }
    return value;
}

void Parser::table(Position start) {
    Table table;
    Statements statements("Table", start);
    while (current.kind != Token::Kind::Word || current.text != "end") {
        if (!current.is("{")) {
            tableStatement(table, statements);
            continue;
        }
        if (!statements.has("class")) {
            throw Error(current.position, "row before the table's class");
        }
        table.rows.push_back(row(result.groups[table.group]));
    }
    endBlock("table");
    statements.require("name");
    statements.require("id");
    statements.require("class");
    result.tables.push_back(std::move(table));
}

void Parser::tableStatement(Table& table, Statements& statements) {
    const Token word = statement(statements);
    if (word.text == "name") {
        table.namePosition = current.position;
        table.name = expectLiteral();
    } else if (word.text == "id") {
        const Number id = expectNumber("an Id");
        useId(id);
        table.id = id.value;
    } else if (word.text == "class") {
        const Position position = current.position;
        table.className = expectLiteral();
        const auto known = groupsByClass.find(table.className);
        if (known == groupsByClass.end()) {
            throw Error(position, "no group of this class before");
        }
        table.group = known->second;
        if (!result.groups[table.group].isTemplate()) {
            throw Error(position, "the group of this class is no template");
        }
    } else {
        statements.refuse(word.text, word.position);
    }
}

Row Parser::row(const Group& group) {
    Position end;
    Row row{rowValues(end)};
    const std::size_t width = group.attributes.size();
    if (row.values.size() > width) {
        throw Error(
            row.values[width].position,
            "row of more values than the " + std::to_string(width) + " attributes of its group");
    }
    for (std::size_t i = 0; i < row.values.size(); ++i) {
        checker.check(row.values[i], group.attributes[i].type);
        if (row.values[i].kind == Value::Kind::Omitted && !group.attributes[i].value) {
            throw Error(row.values[i].position, "no value, and no default, for the attribute " +
                                                    std::to_string(group.attributes[i].id));
        }
    }
    if (row.values.size() < group.requiredValues) {
        throw Error(end, "no value, and no default, for the attribute " +
                             std::to_string(group.attributes[group.requiredValues - 1].id));
    }
    return row;
}

std::vector<Value> Parser::rowValues(Position& end) {
    expectSeparator("{");
    std::vector<Value> values;
    do {
        if (++valuesRead > kMostValues) {
            throw Error(current.position,
                        "more than " + std::to_string(kMostValues) + " values in rows");
        }
        if (current.is(",") || current.is("}")) {
            Value omitted;
            omitted.position = current.position;
            values.push_back(omitted);
        } else {
            values.push_back(value());
        }
    } while (skip(","));
    end = current.position;
    expectSeparator("}");
    return values;
}

void Parser::useId(Number id) {
    if (!usedIds.insert(id.value).second) {
        throw Error(id.position, "second group or table of this Id");
    }
}

}  // namespace Mif
