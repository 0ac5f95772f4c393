#pragma once

// Splits a file into words, integers, literals and separators.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "mifreader/Error.h"
#include "mifreader/Tolerance.h"

namespace Mif {

struct Token {
    enum class Kind { Word, Integer, Literal, Separator, End };

    Kind kind = Kind::End;
    Position position;
    std::string text;  // a word in lower case, a literal without escapes, or the separator
    bool negative = false;
    std::uint64_t magnitude = 0;

    bool is(std::string_view separator) const {
        return kind == Kind::Separator && text == separator;
    }
    // The token as a message shows it.
    std::string shown() const;
};

class Lexer {
  public:
    // The text must outlive the object.
    Lexer(std::string_view text, Tolerances tolerances);

    // The next token; neighbouring literals are one. After the last token always Kind::End.
    // Throws Error for what cannot be a token.
    Token next();

    // The line ends in the literals read so far that a tolerance let pass.
    const std::vector<Position>& rawLineEnds() const { return lineEnds; }

  private:
    bool atEnd() const { return offset == text.size(); }
    char peek(std::size_t ahead = 0) const {
        return offset + ahead < text.size() ? text[offset + ahead] : '\0';
    }
    char take();
    void skipBlanksAndComments();
    void skipBlockComment();
    Token word();
    Token integer();
    Token literals();
    void literal(std::string& decoded);
    void lineEnd(std::string& decoded, Tolerance tolerance);
    void escape(std::string& decoded);
    char octal();
    char hexadecimal();

    std::string_view text;
    Tolerances tolerances;
    std::size_t offset = 0;
    Position position;
    std::vector<Position> lineEnds;
};

}  // namespace Mif
