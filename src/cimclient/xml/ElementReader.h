// Walks an XML document element by element, as recursive descent over a grammar needs it, with the
// checks of attributes, children and text that every element shares.

#pragma once

#include <Pegasus/Common/Config.h>

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "xml/ByteSource.h"
#include "xml/XmlError.h"
#include "xml/XmlTokenizer.h"

namespace Pegasus {

/// The character data of an element. Both views are valid until the reader moves on.
struct ElementText {
    std::string_view raw;
    /// Without leading and trailing white space; that of CDATA sections is kept.
    std::string_view trimmed;
};

/// A function that reads an element finds the reader inside it, behind its start tag, and leaves it
/// behind its end tag: that is where nextChild() that returned false, readEnd(), readText() and
/// skip() leave it. Attributes are there until the first of these calls; copy what is needed later.
///
/// All failures are XmlError; those of kind Content say which element was at fault.
class ElementReader {
  public:
    /// The source must outlive the reader.
    explicit ElementReader(ByteSource& source) : tokenizer(source) {}

    /// Enters the root element.
    void readRoot();
    /// Checks, after the root element was read, that nothing follows; reads the source to its end.
    void readDocumentEnd();

    /// Enters the next child of the current element, or leaves the element when it has no more.
    bool nextChild();
    /// As nextChild(), for elements in which one must follow; `expected` names it in the message.
    void requireChild(std::string_view expected);
    /// As requireChild(), and checks its name.
    void requireChildNamed(std::string_view expected);
    /// Leaves the current element, which must have no further children.
    void readEnd();
    /// Leaves the current element, whatever is in it.
    void skip();
    /// Leaves the current element, which holds text only, and gives its text.
    ElementText readText();

    /// Reads the next child as a whole when its markup is that of `run`, an earlier child in this
    /// place of the grammar; its texts are then for takeText() to give. Otherwise false, and
    /// nothing happens.
    bool readLike(const MarkupRun& run) {
        textTagSize = run.textTagSize;
        return tokenizer.readLike(run);
    }
    std::size_t textCount() const { return tokenizer.textCount(); }
    /// The next of the textCount() texts inside the child that was read last. Faults reported from
    /// now on are those of the element that has it.
    ElementText takeText();

    /// Octets of the document read so far.
    std::uint64_t position() const { return tokenizer.position(); }
    /// As XmlTokenizer::readSince().
    std::string_view readSince(std::uint64_t from) const { return tokenizer.readSince(from); }

    /// The element just entered.
    std::string_view name() const { return tokenizer.name(); }
    bool is(std::string_view expected) const { return tokenizer.name() == expected; }

    std::optional<std::string_view> attribute(std::string_view attributeName) const;
    /// Fails when the attribute is missing.
    std::string_view requiredAttribute(std::string_view attributeName) const;
    /// "true" or "false" in any case; fails for any other text.
    Boolean booleanAttribute(std::string_view attributeName, Boolean fallback) const;

    /// Octets of the document before the current start tag, or before the latest one.
    std::uint64_t offset() const { return elementOffset; }

    /// Fails because the element just entered may not stand where it does.
    [[noreturn]] void failUnexpected(std::string_view expected) const;
    /// Fails with `message` and the place of the latest start tag.
    [[noreturn]] void fail(const std::string& message) const;
    [[noreturn]] static void failAt(std::uint64_t offset, const std::string& message);

  private:
    void entered() { elementOffset = tokenizer.offset(); }
    void requireBlank(std::string_view text) const;
    [[noreturn]] void failTooLong() const;
    ElementText collectText(XmlTokenizer::Token token);

    XmlTokenizer tokenizer;
    std::uint64_t elementOffset = 0;
    std::size_t textTagSize = 0;
    std::string collected;
};

}  // namespace Pegasus
