#include "xml/ElementReader.h"

#include <algorithm>

#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// What the tokenizer bounds for one piece, the reader bounds for their sum.
constexpr std::size_t kMaxCollected = std::size_t{64} * 1024 * 1024;

}  // namespace

using Token = XmlTokenizer::Token;

void ElementReader::readRoot() {
    tokenizer.next();
    entered();
}

void ElementReader::readDocumentEnd() {
    tokenizer.next();
}

bool ElementReader::nextChild() {
    for (;;) {
        switch (tokenizer.next()) {
            case Token::StartElement:
                entered();
                return true;
            case Token::EndElement:
            case Token::End:
                return false;
            case Token::Text:
            case Token::CData:
                requireBlank(tokenizer.text());
        }
    }
}

void ElementReader::requireBlank(std::string_view text) const {
    if (!isBlank(text)) {
        failAt(tokenizer.offset(), "text " + quotedForMessage(trimXmlSpace(text)) +
                                       " stands between elements; expected a tag");
    }
}

void ElementReader::requireChild(std::string_view expected) {
    if (!nextChild()) {
        failAt(tokenizer.offset(), "element " + quotedForMessage(name()) +
                                       " ends too early; expected " + std::string(expected));
    }
}

void ElementReader::requireChildNamed(std::string_view expected) {
    requireChild(expected);
    if (!is(expected)) {
        failUnexpected(expected);
    }
}

void ElementReader::readEnd() {
    if (nextChild()) {
        failUnexpected("an end tag");
    }
}

void ElementReader::skip() {
    const std::size_t outside = tokenizer.depth() - 1;
    while (tokenizer.next() != Token::EndElement || tokenizer.depth() != outside) {
    }
}

ElementText ElementReader::readText() {
    const Token first = tokenizer.next();
    if (first == Token::EndElement) {
        return {};
    }
    if (first == Token::Text) {
        const Token second = tokenizer.nextHoldingText();
        const std::string_view text = tokenizer.heldText();
        if (second == Token::EndElement) {
            return {text, trimXmlSpace(text)};
        }
        collected = text;
        return collectText(second);
    }
    collected.clear();
    return collectText(first);
}

ElementText ElementReader::takeText() {
    const std::string_view text = tokenizer.takeText();
    elementOffset = tokenizer.offsetOf(text) - textTagSize;
    return {text, trimXmlSpace(text)};
}

// The general case: a text in pieces, between which stand comments and CDATA sections.
ElementText ElementReader::collectText(Token token) {
    std::size_t literalBegin = std::string::npos;
    std::size_t literalEnd = 0;
    for (; token != Token::EndElement; token = tokenizer.next()) {
        if (token == Token::StartElement) {
            entered();
            failUnexpected("text");
        }
        const std::size_t pieceBegin = collected.size();
        if (tokenizer.text().size() > kMaxCollected - pieceBegin) {
            failTooLong();
        }
        collected += tokenizer.text();
        if (token == Token::CData) {
            literalBegin = std::min(literalBegin, pieceBegin);
            literalEnd = collected.size();
        }
    }
    const std::string_view raw = collected;
    if (literalBegin == std::string::npos) {
        return {raw, trimXmlSpace(raw)};
    }
    std::size_t begin = 0;
    while (begin < literalBegin && isXmlSpace(raw[begin])) {
        ++begin;
    }
    std::size_t end = raw.size();
    while (end > literalEnd && isXmlSpace(raw[end - 1])) {
        --end;
    }
    return {raw, raw.substr(begin, end - begin)};
}

std::optional<std::string_view> ElementReader::attribute(std::string_view attributeName) const {
    for (const XmlTokenizer::Attribute& candidate : tokenizer.attributes()) {
        if (candidate.name == attributeName) {
            return candidate.value;
        }
    }
    return std::nullopt;
}

std::string_view ElementReader::requiredAttribute(std::string_view attributeName) const {
    const std::optional<std::string_view> value = attribute(attributeName);
    if (!value) {
        fail("element " + quotedForMessage(name()) + " has no attribute " +
             std::string(attributeName));
    }
    return *value;
}

Boolean ElementReader::booleanAttribute(std::string_view attributeName, Boolean fallback) const {
    const std::optional<std::string_view> value = attribute(attributeName);
    if (!value) {
        return fallback;
    }
    const bool isTrue = equalsIgnoringCase(*value, "true");
    if (!isTrue && !equalsIgnoringCase(*value, "false")) {
        fail("attribute " + std::string(attributeName) + " of element " + quotedForMessage(name()) +
             " is " + quotedForMessage(*value) + "; expected true or false");
    }
    return isTrue;
}

void ElementReader::failUnexpected(std::string_view expected) const {
    fail("element " + quotedForMessage(name()) + " may not stand here; expected " +
         std::string(expected));
}

void ElementReader::failTooLong() const {
    throw XmlError{XmlError::Kind::Limit, elementOffset,
                   "the text of an element is too long; at byte " + std::to_string(elementOffset)};
}

void ElementReader::fail(const std::string& message) const {
    failAt(elementOffset, message);
}

void ElementReader::failAt(std::uint64_t offset, const std::string& message) {
    throw XmlError{XmlError::Kind::Content, offset,
                   message + "; at byte " + std::to_string(offset)};
}

}  // namespace Pegasus
