#include "xml/XmlTokenizer.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <utility>

#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

using OctetTable = std::array<bool, 256>;

// The octets at which a scan stops. NUL is among them because it ends the window.
constexpr OctetTable makeTable(std::string_view stops) {
    OctetTable table{};
    table[0] = true;
    for (const char c : stops) {
        table[static_cast<unsigned char>(c)] = true;
    }
    return table;
}

constexpr OctetTable kTextStops = makeTable("<>&\r");
constexpr OctetTable kTagStops = makeTable("<>\"'");
constexpr OctetTable kQuotedStops = makeTable("<\"'");
constexpr OctetTable kReplacedInAttributes = makeTable("&\t\n\r");
// What a text of known markup may not hold, references apart, is left to the general way.
constexpr OctetTable kLeafTextStops = makeTable("<>\r");

constexpr OctetTable makeNameTable() {
    OctetTable table{};
    for (std::size_t octet = 0; octet < table.size(); ++octet) {
        table[octet] = isNameCharacter(static_cast<char>(octet));
    }
    return table;
}

constexpr OctetTable kNameCharacters = makeNameTable();

std::size_t skipTo(const OctetTable& stops, const char* data, std::size_t from) {
    while (!stops[static_cast<unsigned char>(data[from])]) {
        ++from;
    }
    return from;
}

char* skipSpace(char* p, const char* end) {
    while (p != end && isXmlSpace(*p)) {
        ++p;
    }
    return p;
}

}  // namespace

XmlTokenizer::XmlTokenizer(ByteSource& source, Limits limits) : window(source), limits(limits) {}

XmlTokenizer::Token XmlTokenizer::next() {
    holding = false;
    return advance();
}

XmlTokenizer::Token XmlTokenizer::nextHoldingText() {
    holding = true;
    heldBegin = textBegin;
    heldEnd = textEnd;
    return advance();
}

XmlTokenizer::Token XmlTokenizer::advance() {
    if (!started) {
        begin();
    }
    if (emptyElement) {
        emptyElement = false;
        return closeElement();
    }
    for (;;) {
        tokenStart = pos;
        if (!available(1)) {
            return finish();
        }
        if (*at(pos) == '<') {
            if (isNameStart(*at(pos + 1))) {
                return readStartTag();
            }
            if (startsWith("<?")) {
                skipInstruction();
            } else if (startsWith("<!--")) {
                skipComment();
            } else {
                return readMarkup();
            }
        } else if (depth() == 0) {
            skipOuterSpace();
        } else {
            return readText();
        }
    }
}

void XmlTokenizer::begin() {
    started = true;
    if (startsWith("\xEF\xBB\xBF")) {
        pos += 3;
    }
    declarationOffset = window.offsetOf(pos);
}

XmlTokenizer::Token XmlTokenizer::finish() {
    if (depth() != 0 || !rootSeen) {
        failTruncated();
    }
    return Token::End;
}

bool XmlTokenizer::readLike(const MarkupRun& run) {
    // PROPERTY.ARRAY, VALUE.ARRAY, VALUE.
    constexpr std::size_t kDeepest = 3;
    currentTexts.clear();
    nextText = 0;
    const std::string_view unread = view(pos, window.size());
    if (emptyElement || depth() + kDeepest > limits.depth || !unread.starts_with(run.before)) {
        return false;
    }
    const char* end = unread.data() + run.before.size();
    if (run.hasText) {
        end = findTextsLike(run, end);
        if (end == nullptr) {
            return false;
        }
    }
    pos = static_cast<std::size_t>(end - window.data());
    return true;
}

// Notes the texts as they stand. Returns where the element ends, or nullptr.
const char* XmlTokenizer::findTextsLike(const MarkupRun& run, const char* p) {
    const char* const windowEnd = window.data() + window.size();
    for (;;) {
        const char* const end = p + skipTo(kLeafTextStops, p, 0);
        const auto size = static_cast<std::size_t>(end - p);
        const std::string_view rest(end, static_cast<std::size_t>(windowEnd - end));
        if (size > limits.tokenSize) {
            return nullptr;
        }
        currentTexts.emplace_back(p, size);
        if (rest.starts_with(run.after)) {
            return end + run.after.size();
        }
        if (run.between.empty() || !rest.starts_with(run.between)) {
            return nullptr;
        }
        p = end + run.between.size();
    }
}

std::string_view XmlTokenizer::takeText() {
    const std::string_view text = currentTexts[nextText++];
    if (text.find('&') == std::string_view::npos) {
        return text;
    }
    char* const begin = at(static_cast<std::size_t>(text.data() - window.data()));
    const char* const end = decode(begin, begin + text.size(), XmlTextKind::Content);
    return text.substr(0, static_cast<std::size_t>(end - begin));
}

std::string_view XmlTokenizer::readSince(std::uint64_t from) const {
    if (from < window.offsetOf(0) || from < changedUpTo) {
        return {};
    }
    return view(static_cast<std::size_t>(from - window.offsetOf(0)), pos);
}

XmlTokenizer::Token XmlTokenizer::readMarkup() {
    if (startsWith("</")) {
        return readEndTag();
    }
    if (startsWith("<![CDATA[")) {
        return readCData();
    }
    if (startsWith("<!")) {
        const bool isDoctype = startsWith("<!DOCTYPE");
        fail(XmlError::Kind::Syntax, offset(),
             isDoctype ? "a document type declaration is refused"
                       : "\"<!\" begins neither a comment nor a CDATA section");
    }
    return readStartTag();
}

void XmlTokenizer::skipOuterSpace() {
    if (!isXmlSpace(*at(pos))) {
        failAt(at(pos), std::string("text stands ") +
                            (rootSeen ? "after the root element; expected the end"
                                      : "before the root element; expected a tag"));
    }
    while (isXmlSpace(*at(pos))) {
        ++pos;
    }
}

XmlTokenizer::Token XmlTokenizer::readText() {
    bool isPlain = true;
    for (;;) {
        pos = skipTo(kTextStops, window.data(), pos);
        const char stop = *at(pos);
        if (stop == '\0') {
            if (!more()) {
                failTruncated();
            }
            continue;
        }
        checkSize();
        if (stop == '<') {
            break;
        }
        if (stop == '>') {
            if (view(tokenStart, pos).ends_with("]]")) {
                failAt(at(pos), "\"]]>\" stands in a text; expected \"]]&gt;\"");
            }
        } else {
            isPlain = false;
        }
        ++pos;
    }
    textBegin = tokenStart;
    textEnd = pos;
    if (!isPlain) {
        const char* decodedEnd = decode(at(textBegin), at(textEnd), XmlTextKind::Content);
        textEnd = static_cast<std::size_t>(decodedEnd - window.data());
    }
    return Token::Text;
}

XmlTokenizer::Token XmlTokenizer::readStartTag() {
    if (depth() == 0 && rootSeen) {
        fail(XmlError::Kind::Syntax, offset(), "a second root element begins; expected the end");
    }
    ++pos;
    scanTag();
    char* const nameBegin = at(tokenStart + 1);
    const char* end = at(pos - 1);
    if (end[-1] == '/') {
        emptyElement = true;
        --end;
    }
    char* const nameEnd = parseName(nameBegin, "an element's name");
    currentName = {nameBegin, static_cast<std::size_t>(nameEnd - nameBegin)};
    if (depth() == limits.depth) {
        fail(XmlError::Kind::Limit, offset(),
             "element " + quotedForMessage(currentName) + " is nested deeper than " +
                 std::to_string(limits.depth) + " elements");
    }
    currentAttributes.clear();
    parseAttributes(nameEnd, end);
    rootSeen = true;
    nameStarts.push_back(openNames.size());
    openNames += currentName;
    return Token::StartElement;
}

XmlTokenizer::Token XmlTokenizer::readEndTag() {
    pos += 2;
    scanTo(">");
    char* const begin = at(tokenStart + 2);
    char* const nameEnd = parseName(begin, "an element's name");
    currentName = {begin, static_cast<std::size_t>(nameEnd - begin)};
    const char* rest = skipSpace(nameEnd, at(pos - 1));
    if (rest != at(pos - 1)) {
        failAt(rest, "end tag of " + quotedForMessage(currentName) + " goes on; expected \">\"");
    }
    if (depth() == 0 || currentName != innermostName()) {
        fail(XmlError::Kind::Syntax, offset(),
             "end tag of " + quotedForMessage(currentName) + " closes nothing; expected " +
                 (depth() == 0 ? "the end" : "that of " + quotedForMessage(innermostName())));
    }
    return closeElement();
}

XmlTokenizer::Token XmlTokenizer::readCData() {
    if (depth() == 0) {
        fail(XmlError::Kind::Syntax, offset(), "a CDATA section stands outside the root element");
    }
    constexpr std::string_view kOpening = "<![CDATA[";
    constexpr std::string_view kClosing = "]]>";
    pos += kOpening.size();
    scanTo(kClosing);
    textBegin = tokenStart + kOpening.size();
    textEnd = pos - kClosing.size();
    char* const begin = at(textBegin);
    if (std::memchr(begin, '\r', textEnd - textBegin) != nullptr) {
        const char* decodedEnd = decode(begin, at(textEnd), XmlTextKind::CData);
        textEnd = static_cast<std::size_t>(decodedEnd - window.data());
    }
    return Token::CData;
}

XmlTokenizer::Token XmlTokenizer::closeElement() {
    openNames.resize(nameStarts.back());
    nameStarts.pop_back();
    return Token::EndElement;
}

void XmlTokenizer::skipInstruction() {
    const bool mayDeclare = offset() == declarationOffset;
    pos += 2;
    scanTo("?>");
    char* const target = at(tokenStart + 2);
    char* const targetEnd = parseName(target, "a processing instruction's name");
    const char* const end = at(pos - 2);
    if (targetEnd != end && !isXmlSpace(*targetEnd)) {
        failAt(targetEnd, "a processing instruction's name goes on; expected white space");
    }
    const std::string_view name(target, static_cast<std::size_t>(targetEnd - target));
    if (name == "xml" && mayDeclare) {
        checkDeclaration(targetEnd, end);
    } else if (equalsIgnoringCase(name, "xml")) {
        failAt(target, "an XML declaration stands elsewhere than at the beginning");
    }
}

void XmlTokenizer::skipComment() {
    pos += 4;
    scanTo("--");
    if (!available(1)) {
        failTruncated();
    }
    if (*at(pos) != '>') {
        failAt(at(pos), "\"--\" stands in a comment; expected \"-->\"");
    }
    ++pos;
}

// A declaration reads like a tag's attributes, but which of them and in which order is fixed.
void XmlTokenizer::checkDeclaration(char* begin, const char* end) {
    currentAttributes.clear();
    parseAttributes(begin, end);
    auto next = currentAttributes.cbegin();
    const auto take = [&](std::string_view name) {
        const bool found = next != currentAttributes.cend() && next->name == name;
        return found ? (next++)->value : std::string_view();
    };
    if (!take("version").starts_with("1.")) {
        failAt(begin, "the XML declaration names no version 1.x");
    }
    const std::string_view encoding = take("encoding");
    if (!encoding.empty() && !equalsIgnoringCase(encoding, "utf-8") &&
        !equalsIgnoringCase(encoding, "us-ascii")) {
        failAt(begin, "the encoding is " + quotedForMessage(encoding) + "; expected UTF-8");
    }
    const std::string_view standalone = take("standalone");
    if (next != currentAttributes.cend() ||
        (!standalone.empty() && standalone != "yes" && standalone != "no")) {
        failAt(begin, "the XML declaration is malformed");
    }
}

// Leaves the position behind the ">" that ends the tag.
void XmlTokenizer::scanTag() {
    char quote = '\0';
    for (;;) {
        if (quote == '\0') {
            pos = skipTo(kTagStops, window.data(), pos);
        } else {
            pos = skipTo(kQuotedStops, window.data(), pos);
        }
        const char stop = *at(pos);
        if (stop == '\0') {
            if (!more()) {
                failTruncated();
            }
            continue;
        }
        checkSize();
        if (stop == '<') {
            failAt(at(pos), "\"<\" stands inside a tag; expected \">\" or \"&lt;\"");
        }
        ++pos;
        if (quote != '\0') {
            quote = stop == quote ? '\0' : quote;
        } else if (stop == '>') {
            checkSize();
            return;
        } else {
            quote = stop;
        }
    }
}

// Leaves the position behind the terminator.
void XmlTokenizer::scanTo(std::string_view terminator) {
    for (;;) {
        const std::string_view rest = view(pos, window.size());
        const std::size_t found = rest.find(terminator);
        if (found != std::string_view::npos) {
            pos += found + terminator.size();
            break;
        }
        pos += rest.size() - std::min(rest.size(), terminator.size() - 1);
        if (!more()) {
            failTruncated();
        }
    }
    checkSize();
}

void XmlTokenizer::failTooLong() const {
    fail(XmlError::Kind::Limit, offset(),
         "a tag or text is longer than " + std::to_string(limits.tokenSize) + " octets");
}

char* XmlTokenizer::parseName(char* p, const char* expected) {
    if (!isNameStart(*p)) {
        failAt(p, std::string("expected ") + expected);
    }
    while (kNameCharacters[static_cast<unsigned char>(*p)]) {
        ++p;
    }
    return p;
}

void XmlTokenizer::parseAttributes(char* p, const char* end) {
    for (;;) {
        char* const begin = skipSpace(p, end);
        if (begin == end) {
            return;
        }
        if (begin == p) {
            failAt(p, "expected white space, \"/>\" or \">\"");
        }
        p = parseAttribute(begin, end);
    }
}

char* XmlTokenizer::parseAttribute(char* p, const char* end) {
    Attribute attribute;
    char* const nameEnd = parseName(p, "an attribute's name");
    attribute.name = {p, static_cast<std::size_t>(nameEnd - p)};
    checkNewAttribute(attribute.name);
    p = skipSpace(nameEnd, end);
    if (p == end || *p != '=') {
        failAt(p,
               "attribute " + quotedForMessage(attribute.name) + " has no value; expected \"=\"");
    }
    p = skipSpace(p + 1, end);
    if (p == end || (*p != '"' && *p != '\'')) {
        failAt(p, "attribute " + quotedForMessage(attribute.name) +
                      " has no quoted value; expected a quotation mark");
    }
    const char quote = *p++;
    char* const valueBegin = p;
    bool isPlain = true;
    while (p != end && *p != quote) {
        isPlain &= !kReplacedInAttributes[static_cast<unsigned char>(*p)];
        ++p;
    }
    if (p == end) {
        failAt(p, "attribute " + quotedForMessage(attribute.name) + " does not end");
    }
    const char* valueEnd = isPlain ? p : decode(valueBegin, p, XmlTextKind::Attribute);
    attribute.value = {valueBegin, static_cast<std::size_t>(valueEnd - valueBegin)};
    currentAttributes.push_back(attribute);
    return p + 1;
}

void XmlTokenizer::checkNewAttribute(std::string_view name) const {
    for (const Attribute& earlier : currentAttributes) {
        if (earlier.name == name) {
            failAt(name.data(), "attribute " + quotedForMessage(name) + " is given twice");
        }
    }
    if (currentAttributes.size() == limits.attributes) {
        fail(XmlError::Kind::Limit, offset(),
             "element " + quotedForMessage(currentName) + " has more than " +
                 std::to_string(limits.attributes) + " attributes");
    }
}

char* XmlTokenizer::decode(char* begin, const char* end, XmlTextKind kind) {
    changedUpTo = window.offsetOf(static_cast<std::size_t>(end - window.data()));
    try {
        return decodeXmlText(begin, end, kind);
    } catch (const XmlTextFault& fault) {
        failAt(fault.place, fault.message);
    }
}

bool XmlTokenizer::more() {
    checkSize();
    std::size_t removed = 0;
    const bool extended = window.extend(holding ? heldBegin : tokenStart, removed);
    pos -= removed;
    tokenStart -= removed;
    textBegin -= removed;
    textEnd -= removed;
    heldBegin -= removed;
    heldEnd -= removed;
    return extended;
}

bool XmlTokenizer::makeAvailable(std::size_t count) {
    while (window.size() - pos < count) {
        if (!more()) {
            return false;
        }
    }
    return true;
}

bool XmlTokenizer::startsWith(std::string_view expected) {
    for (std::size_t i = 0; i < expected.size(); ++i) {
        if (!available(i + 1) || *at(pos + i) != expected[i]) {
            return false;
        }
    }
    return true;
}

std::string_view XmlTokenizer::innermostName() const {
    return std::string_view(openNames).substr(nameStarts.back());
}

void XmlTokenizer::fail(XmlError::Kind kind, std::uint64_t where, std::string message) const {
    throw XmlError{kind, where, std::move(message) + "; at byte " + std::to_string(where)};
}

void XmlTokenizer::failAt(const char* place, std::string message) const {
    const auto index = static_cast<std::size_t>(place - window.data());
    fail(XmlError::Kind::Syntax, window.offsetOf(index), std::move(message));
}

void XmlTokenizer::failTruncated() const {
    std::string message = "the document ends too early; expected ";
    if (depth() != 0) {
        message += "the end of element " + quotedForMessage(innermostName());
    } else {
        message += rootSeen ? "the end of a comment or instruction" : "a root element";
    }
    fail(XmlError::Kind::Truncated, window.offsetOf(window.size()), std::move(message));
}

}  // namespace Pegasus
