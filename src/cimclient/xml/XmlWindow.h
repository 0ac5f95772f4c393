// The part of a document that the tokenizer looks at: a buffer that slides over a ByteSource.

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string_view>

#include "xml/ByteSource.h"
#include "xml/XmlCharacters.h"
#include "xml/XmlError.h"

namespace Pegasus {

/// Everything between the front and size() is checked: whole UTF-8 characters that XML allows in
/// raw form. A fault further on is reported only when the reader gets there, so that the outcome
/// does not depend on the pieces in which the octets arrive.
class XmlWindow {
  public:
    /// The source must outlive the window.
    explicit XmlWindow(ByteSource& source);

    /// The octets; data()[size()] is NUL, and no other is. Valid until extend().
    char* data() { return buffer.get(); }
    const char* data() const { return buffer.get(); }
    std::size_t size() const { return filled; }

    /// Octets of the document before data()[index].
    std::uint64_t offsetOf(std::size_t index) const { return base + index; }

    /// Reads at least one octet more, making the window larger when need be; false when the
    /// document has ended. Either way octets before data()[keepFrom] may have gone: `removed` says
    /// by how many the others moved forward. Throws XmlError.
    bool extend(std::size_t keepFrom, std::size_t& removed);

  private:
    std::size_t makeRoom(std::size_t keepFrom);
    void grow();
    void accept(std::size_t received);
    [[noreturn]] void throwFault() const;

    ByteSource& source;
    std::size_t capacity;
    std::unique_ptr<char[]> buffer;
    std::size_t filled = 0;
    std::uint64_t base = 0;
    // The first octets of a character whose last ones have not arrived.
    std::array<char, 4> carry{};
    std::size_t carrySize = 0;
    OctetCheck::Verdict fault = OctetCheck::Verdict::Good;
    std::uint8_t faultOctet = 0;
    bool ended = false;
};

}  // namespace Pegasus
