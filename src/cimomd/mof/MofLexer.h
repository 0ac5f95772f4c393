#pragma once

// Splits a MOF text (DSP0004) into tokens. Comments and white space are dropped here.

#include <optional>
#include <string>
#include <string_view>

#include "mof/MofErrorLog.h"
#include "mof/MofToken.h"

namespace cimomd {

/// Reads one MOF text from front to back.
class MofLexer {
  public:
    /// `text` is UTF-8, a byte-order mark and an end mark (0x1A) are skipped; it is read in place
    /// and must stay alive. `file` only names the text in errors. `log` must stay alive too.
    MofLexer(std::string_view text, std::string_view file, MofErrorLog& log);

    /// The next token; MofTokenKind::End at the end of the text, again and again. What is no token
    /// is put into the log and left out, or taken for the token it was meant to be.
    MofToken next();

    /// Whether a text without its closing quote was met since the last call of forgetBrokenText():
    /// what does not fit behind it is no mistake of its own. Further such texts are not told
    /// meanwhile.
    bool isBehindBrokenText() const { return hasBrokenText; }
    void forgetBrokenText() { hasBrokenText = false; }

  private:
    bool atEnd() const { return offset >= text.size(); }
    char current() const { return atEnd() ? '\0' : text[offset]; }
    char peek(std::size_t distance) const;
    void advance();
    void advanceBy(std::size_t bytes);
    std::size_t blankLength() const;
    std::size_t nameCharacterLength() const;
    void skipLine();
    void skipBlanksAndComments();
    void skipBlockComment();
    MofToken identifier();
    MofToken number();
    bool startsPragma();
    MofToken alias();
    MofToken punctuation();
    MofToken quoted(char quote, MofTokenKind kind);
    void reportBrokenText(MofPosition where, std::string_view found, char quote);
    bool continuesOnNextLine(char quote) const;
    void skipToMark(char mark);
    void stepBackToMarks(std::size_t firstOffset);
    void readEscape(std::string& out);
    void readHexEscape(std::string& out, MofPosition start);
    char32_t joinedWithNextEscape(char32_t high);
    std::optional<char32_t> readHexDigits();
    bool startsNumber() const;
    MofToken tokenFrom(MofTokenKind kind, std::size_t start, MofPosition startPosition) const;
    void report(MofPosition where, std::string_view found, std::string_view expected);

    std::string_view text;
    std::string_view file;
    MofErrorLog& log;
    std::size_t offset = 0;
    MofPosition position;
    bool hasBrokenText = false;
};

}  // namespace cimomd
