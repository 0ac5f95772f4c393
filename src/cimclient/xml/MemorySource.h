// A message that is in memory already: a request body, an embedded object, a test's text.

#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <string_view>

#include "xml/ByteSource.h"

namespace Pegasus {

/// Gives the octets of a text, at most `pieceSize` of them at once. The text must outlive the
/// source.
class MemorySource : public ByteSource {
  public:
    explicit MemorySource(std::string_view text, std::size_t pieceSize = ~std::size_t{0})
        : text(text), pieceSize(pieceSize) {}

    std::size_t read(char* buffer, std::size_t capacity) override {
        const std::size_t count = std::min({text.size(), capacity, pieceSize});
        if (count != 0) {
            std::memcpy(buffer, text.data(), count);
        }
        text.remove_prefix(count);
        return count;
    }

  private:
    std::string_view text;
    std::size_t pieceSize;
};

}  // namespace Pegasus
