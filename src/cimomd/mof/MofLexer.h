#pragma once

// Splits a MOF text (DSP0004) into tokens. Comments and white space are dropped here.

#include <string>
#include <string_view>

#include "mof/MofErrorLog.h"
#include "mof/MofToken.h"

namespace cimomd {

/// Reads one MOF text from front to back.
class MofLexer {
  public:
    /// `text` is UTF-8, a byte-order mark is skipped; it is read in place and must stay alive.
    /// `file` only names the text in errors. `log` must stay alive too.
    MofLexer(std::string_view text, std::string_view file, MofErrorLog& log);

    /// The next token; MofTokenKind::End at the end of the text, again and again. What is no token
    /// is put into the log and left out, or taken for the token it was meant to be.
    MofToken next();

  private:
    bool atEnd() const { return offset >= text.size(); }
    char current() const { return atEnd() ? '\0' : text[offset]; }
    char peek(std::size_t distance) const;
    void advance();
    void skipLine();
    void skipBlanksAndComments();
    void skipBlockComment();
    MofToken identifier();
    MofToken number();
    bool startsPragma();
    MofToken alias();
    MofToken punctuation();
    MofToken quoted(char quote, MofTokenKind kind);
    void stepBackToMarks(std::size_t firstOffset);
    void readEscape(std::string& out);
    void readHexEscape(std::string& out, MofPosition start);
    bool startsNumber() const;
    MofToken tokenFrom(MofTokenKind kind, std::size_t start, MofPosition startPosition) const;
    void report(MofPosition where, std::string_view found, std::string_view expected);

    std::string_view text;
    std::string_view file;
    MofErrorLog& log;
    std::size_t offset = 0;
    MofPosition position;
};

}  // namespace cimomd
