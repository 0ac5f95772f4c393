// A strict, streaming pull tokenizer for XML 1.0 without document type declarations.
//
// Nothing is copied: names, attribute values and texts are views into the window over the source;
// references are replaced in place, for no replacement is longer than its reference.

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "xml/ByteSource.h"
#include "xml/MarkupRun.h"
#include "xml/XmlError.h"
#include "xml/XmlTextDecoder.h"
#include "xml/XmlWindow.h"

namespace Pegasus {

/// Checks well-formedness: one root, matching tags, unique attributes, only the five predefined
/// entities. Refuses DOCTYPE and encodings other than UTF-8. Comments and processing instructions
/// are skipped. Line ends become LF. All failures are XmlError; after one the tokenizer is of no
/// further use. The source's own exceptions pass.
class XmlTokenizer {
  public:
    enum class Token {
        StartElement,  ///< name() and attributes(); an empty-element tag is followed by EndElement
        EndElement,    ///< name()
        Text,          ///< text(): up to the next markup, references replaced
        CData,         ///< text(): the content of a CDATA section, as it stands
        End,           ///< the document is complete and the source has ended
    };

    struct Attribute {
        std::string_view name;
        std::string_view value;
    };

    struct Limits {
        /// Octets of one tag, text, comment or instruction.
        std::size_t tokenSize = std::size_t{64} * 1024 * 1024;
        /// Elements inside each other, the root counted.
        std::size_t depth = 64;
        /// Attributes of one element.
        std::size_t attributes = 64;
    };

    /// The source must outlive the tokenizer.
    explicit XmlTokenizer(ByteSource& source) : XmlTokenizer(source, Limits()) {}
    XmlTokenizer(ByteSource& source, Limits limits);

    /// Views given before become invalid. After End it is End again.
    Token next();

    /// As next(), but the current text stays readable as heldText() until the following call.
    Token nextHoldingText();

    /// Reads the next element when its markup is that of `run`, which was read in this place
    /// before. Its texts are then for takeText() to give, and the current token is its end. False,
    /// with nothing read, when the octets differ or have not all arrived.
    bool readLike(const MarkupRun& run);
    std::size_t textCount() const { return currentTexts.size(); }
    /// The next of the textCount() texts, references replaced: each can be had once, so that what
    /// is wrong with one is found after the earlier ones were looked at. Valid until the next octet
    /// is read.
    std::string_view takeText();
    /// Octets of the document before `text`, which takeText() gave.
    std::uint64_t offsetOf(std::string_view text) const {
        return window.offsetOf(static_cast<std::size_t>(text.data() - window.data()));
    }

    /// Octets of the document before the next token.
    std::uint64_t position() const { return window.offsetOf(pos); }
    /// The octets that were read since `from`, an earlier position(); empty when they are not at
    /// hand as they stood in the document.
    std::string_view readSince(std::uint64_t from) const;

    std::string_view name() const { return currentName; }
    std::string_view text() const { return view(textBegin, textEnd); }
    std::string_view heldText() const { return view(heldBegin, heldEnd); }
    const std::vector<Attribute>& attributes() const { return currentAttributes; }

    /// Elements open after the current token.
    std::size_t depth() const { return nameStarts.size(); }

    /// Octets of the document before the current token.
    std::uint64_t offset() const { return window.offsetOf(tokenStart); }

  private:
    Token advance();
    void begin();
    Token finish();
    Token readText();
    Token readStartTag();
    Token readEndTag();
    Token readCData();
    Token closeElement();
    Token readMarkup();
    void skipOuterSpace();
    void skipInstruction();
    void skipComment();
    void checkDeclaration(char* begin, const char* end);

    void scanTag();
    void scanTo(std::string_view terminator);
    // Called before anything else is found wrong, so that the outcome does not depend on how much
    // of a token that is too long arrives at once.
    void checkSize() const {
        if (pos - tokenStart > limits.tokenSize) {
            failTooLong();
        }
    }
    [[noreturn]] void failTooLong() const;
    char* parseName(char* p, const char* expected);
    void parseAttributes(char* p, const char* end);
    char* parseAttribute(char* p, const char* end);
    void checkNewAttribute(std::string_view name) const;

    char* decode(char* begin, const char* end, XmlTextKind kind);
    const char* findTextsLike(const MarkupRun& run, const char* p);

    bool more();
    bool available(std::size_t count) {
        return window.size() - pos >= count || makeAvailable(count);
    }
    bool makeAvailable(std::size_t count);
    bool startsWith(std::string_view expected);
    char* at(std::size_t index) { return window.data() + index; }
    std::string_view view(std::size_t from, std::size_t to) const {
        return {window.data() + from, to - from};
    }
    std::string_view innermostName() const;
    [[noreturn]] void fail(XmlError::Kind kind, std::uint64_t where, std::string message) const;
    [[noreturn]] void failAt(const char* place, std::string message) const;
    [[noreturn]] void failTruncated() const;

    XmlWindow window;
    Limits limits;
    std::size_t pos = 0;
    std::size_t tokenStart = 0;
    std::size_t textBegin = 0;
    std::size_t textEnd = 0;
    std::size_t heldBegin = 0;
    std::size_t heldEnd = 0;
    bool holding = false;
    bool started = false;
    bool rootSeen = false;
    bool emptyElement = false;
    std::uint64_t declarationOffset = 0;
    std::string_view currentName;
    std::vector<Attribute> currentAttributes;
    // Of readLike(), as they stand in the document, and which is next.
    std::vector<std::string_view> currentTexts;
    std::size_t nextText = 0;
    // Up to where the window's octets may differ from the document's.
    std::uint64_t changedUpTo = 0;
    // The names of the open elements, one after the other, and where each begins.
    std::string openNames;
    std::vector<std::size_t> nameStarts;
};

}  // namespace Pegasus
