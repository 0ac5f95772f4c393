#pragma once

// Parses one MOF text (DSP0004) into its declarations: qualifier declarations, classes with
// properties and references, and the pragmas include, namespace and locale (the last is ignored).

#include <string_view>
#include <vector>

#include "mof/MofDeclarations.h"
#include "mof/MofLexer.h"

namespace cimomd {

/// Recursive descent over one text, one function per production; looks one token ahead.
class MofParser {
  public:
    /// `text` must stay alive while the parser does; `file` names it in errors.
    MofParser(std::string_view text, std::string_view file);

    /// All declarations in the order of the text. Raises MofError at the first mistake.
    std::vector<MofDeclaration> parse();

  private:
    void parsePragma(std::vector<MofDeclaration>& out);
    MofQualifierDeclaration parseQualifierDeclaration();
    QualifierScopes parseScopes();
    QualifierScopes parseScope();
    std::vector<MofFlavor> parseFlavorClause();
    MofClass parseClass();
    std::vector<MofQualifier> parseQualifierList();
    MofQualifier parseQualifier();
    MofFlavor parseFlavor();
    MofProperty parseProperty();
    MofType parseType();
    void parseArrayBounds(MofType& type);
    MofLiteral parseLiteral();
    MofElement parseElement();
    void parseString(MofElement& element);
    MofName parseName(std::string_view expected);

    bool atPunctuation(std::string_view mark) const;
    bool atWord(std::string_view word) const;
    bool accept(std::string_view mark);
    void expect(std::string_view mark);
    MofToken take();
    [[noreturn]] void fail(std::string_view expected) const;

    MofLexer lexer;
    std::string_view file;
    MofToken token;
};

}  // namespace cimomd
