#pragma once

// The grammar, one function for each kind of block and statement.

#include <initializer_list>
#include <map>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "mifreader/Document.h"
#include "mifreader/GroupBuilder.h"
#include "mifreader/Lexer.h"
#include "mifreader/Statements.h"
#include "mifreader/Tolerance.h"
#include "mifreader/ValueChecker.h"

namespace Mif {

class Parser {
  public:
    // The text must outlive the object.
    Parser(std::string_view text, Tolerances tolerances);

    // The component of the whole file. Throws Error. To be called once.
    Component file();

  private:
    Token advance();
    bool skip(std::string_view separator);
    Token expectWord(std::string_view expected);
    void expectSeparator(std::string_view separator);
    std::string expectLiteral();
    Number expectNumber(const char* what);
    // "name =" of a statement; what follows is its value.
    Token statement(Statements& statements);
    // The word after "Start", when that stands here.
    bool startsBlock(Position& start);
    void endBlock(std::string_view block);

    void blockInComponent(Position start);
    void path(Position start);
    void pathStatement(Path& path, Statements& statements);
    Enumeration enumeration(Position start, bool named);
    EnumEntry enumEntry();

    void group(Position start);
    void groupStatement(GroupBuilder& builder, Statements& statements);
    std::vector<Number> numberList();
    void checkSameClass(const Group& group, Position start) const;

    Attribute attribute(Position start);
    void attributeStatement(Attribute& attribute, Statements& statements);
    Type type();
    std::string oneOf(std::initializer_list<std::string_view> words);
    Value value();

    void table(Position start);
    void tableStatement(Table& table, Statements& statements);
    Row row(const Group& group);
    // Sets end to the closing brace.
    std::vector<Value> rowValues(Position& end);
    void useId(Number id);

    Lexer lexer;
    Tolerances tolerances;
    ValueChecker checker;
    Token current;
    Component result;
    std::set<std::string> pathNames;
    std::set<std::uint64_t> usedIds;
    std::map<std::string, std::size_t> groupsByClass;
    std::size_t valuesRead = 0;
};

}  // namespace Mif
