#pragma once

// The tokens of one MOF text as its parser looks at them: the current one, and what was passed.

#include <string_view>

#include "mof/MofLexer.h"

namespace cimomd {

class MofTokens {
  public:
    /// As for MofLexer.
    MofTokens(std::string_view text, std::string_view file, MofErrorLog& log);

    const MofToken& current() const { return token; }
    bool atEnd() const { return token.kind == MofTokenKind::End; }
    bool at(MofTokenKind kind) const { return token.kind == kind; }
    bool atMark(std::string_view mark) const;
    /// Words ignore case.
    bool atWord(std::string_view word) const;
    /// Whether the current token stands on a later line than the one before it.
    bool atNewLine() const { return token.position.line != previousLine; }

    /// Passes the current token and returns it.
    MofToken take();
    /// Passes `mark` when it is the current token.
    bool accept(std::string_view mark);
    /// The same, but raises MofError when it is not.
    void expect(std::string_view mark);

    /// As for MofLexer.
    bool isBehindBrokenText() const { return lexer.isBehindBrokenText(); }
    void forgetBrokenText() { lexer.forgetBrokenText(); }

    /// Raises the MofError that the current token is not what was expected.
    [[noreturn]] void fail(std::string_view expected) const;
    /// What the current token is called in messages.
    std::string shown() const;

  private:
    MofLexer lexer;
    std::string_view file;
    MofToken token;
    unsigned previousLine = 0;
};

}  // namespace cimomd
