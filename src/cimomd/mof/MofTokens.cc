#include "mof/MofTokens.h"

#include <fmt/format.h>

#include <utility>

#include "text/Utf8.h"

namespace cimomd {

MofTokens::MofTokens(std::string_view text, std::string_view fileName, MofErrorLog& log)
    : lexer(text, fileName, log), file(fileName), token(lexer.next()) {}

bool MofTokens::atMark(std::string_view mark) const {
    return at(MofTokenKind::Punctuation) && token.text == mark;
}

bool MofTokens::atWord(std::string_view word) const {
    return at(MofTokenKind::Identifier) && equalsIgnoringCase(token.text, word);
}

MofToken MofTokens::take() {
    previousLine = token.position.line;
    return std::exchange(token, lexer.next());
}

bool MofTokens::accept(std::string_view mark) {
    if (!atMark(mark))
        return false;
    take();
    return true;
}

void MofTokens::expect(std::string_view mark) {
    if (!accept(mark))
        fail(fmt::format("'{}'", mark));
}

void MofTokens::fail(std::string_view expected) const {
    throw MofError(file, token.position, shown(), expected);
}

std::string MofTokens::shown() const {
    return atEnd() ? "the end of the file" : quotedText(token.text);
}

}  // namespace cimomd
